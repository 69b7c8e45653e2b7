#include "ReportTextDecoder.h"

#include "LineEndings.h"
#include "ReportTextCodec.h"

#include <QStringDecoder>
#include <QUtf8StringView>

namespace kareport
{

namespace
{

std::optional<TextPlace> firstInvalid(QByteArrayView bytes)
{
    if (QUtf8StringView(bytes.data(), bytes.size()).isValidUtf8()) {
        return std::nullopt;
    }
    TextPlace place;
    for (qsizetype begin = 0; begin < bytes.size(); ++place.line) {
        const qsizetype feed = bytes.indexOf('\n', begin);
        const QByteArrayView line = bytes.sliced(begin, (feed < 0 ? bytes.size() : feed) - begin);
        if (!QUtf8StringView(line.data(), line.size()).isValidUtf8()) {
            for (qsizetype at = 0; at < line.size(); ++place.column) {
                const auto lead = static_cast<unsigned char>(line[at]);
                const qsizetype length = lead < 0x80 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
                if (at + length > line.size() || !QUtf8StringView(line.data() + at, length).isValidUtf8()) {
                    break;
                }
                at += length;
            }
            return place;
        }
        begin = feed + 1;
    }
    return place;
}

} // namespace

std::optional<TextPlace> decodeReportText(QByteArrayView bytes, QString &text)
{
    const QByteArrayView mark(reportFileMark, sizeof reportFileMark);
    const bool hasMark = bytes.startsWith(mark);
    if (const auto place = firstInvalid(bytes)) {
        return place;
    }
    // A second mark is a character of the text.
    QStringDecoder decode(QStringDecoder::Utf8, QStringDecoder::Flag::ConvertInitialBom);
    text = decode(hasMark ? bytes.sliced(mark.size()) : bytes);
    // Editors write the mark as well, but no line end of theirs has a CR too many.
    const bool hasDoubledEnds = text.contains(u"\r\r\n") || !text.contains(u'\n');
    if (hasMark && hasDoubledEnds) {
        // Written with a CR more than the text has before each LF. In place, since the text only gets shorter.
        QChar *out = text.data();
        const QChar *const end = text.constData() + text.size();
        for (const QChar *at = text.constData(); at != end; ++at) {
            if (!(*at == u'\r' && at + 1 != end && at[1] == u'\n')) {
                *out++ = *at;
            }
        }
        text.truncate(out - text.constData());
    } else {
        text = withCrLf(text);
    }
    return std::nullopt;
}

} // namespace kareport
