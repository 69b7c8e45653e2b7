#include "LoadedText.h"

#include "MemoryLasts.h"
#include "PageHeader.h"
#include "ReportPages.h"
#include "ReportTextCodec.h"
#include "RichTextReader.h"

#include <QStringDecoder>
#include <QUtf8StringView>

#include <algorithm>
#include <string_view>

namespace kareport
{

namespace
{

/// What is read at a time: near to the processor, and read well before a user who stops the work notices.
constexpr qsizetype pieceSize = qsizetype(256) * 1024;

/// The next bytes, up to a line end where one follows: no character and no line end is cut in two.
QByteArrayView nextPiece(QByteArrayView bytes)
{
    const qsizetype feed = bytes.size() <= pieceSize ? -1 : bytes.indexOf('\n', pieceSize);
    return feed < 0 ? bytes : bytes.first(feed + 1);
}

bool isAscii(QByteArrayView bytes)
{
    unsigned all = 0;
    for (const char byte : bytes) {
        all |= static_cast<unsigned char>(byte);
    }
    return all < 0x80;
}

/// Whether a file has the line ends that a saved report has: a CR more than the text before each LF. Editors write a
/// byte-order mark as well, but no line end of theirs has a CR too many.
bool hasDoubledEnds(QByteArrayView bytes)
{
    qsizetype feed = bytes.indexOf('\n');
    if (feed < 0) {
        return true;
    }
    for (; feed >= 0; feed = bytes.indexOf('\n', feed + 1)) {
        if (feed >= 2 && bytes[feed - 1] == '\r' && bytes[feed - 2] == '\r') {
            return true;
        }
    }
    return false;
}

/// Copies a piece of a file. @param dropped  how many CRs a line end has too many: 1 in a saved report, where a line feed
/// alone comes back as one, else 0, and every line end becomes CR LF
/// @param room      is made long enough where it is not
/// @param lineEnds  grows by those of the piece
/// @return the copy, in the room
template <typename Character>
std::basic_string_view<Character> copyLines(std::basic_string_view<Character> piece, std::ptrdiff_t dropped,
                                            std::basic_string<Character> &room, qint64 &lineEnds)
{
    constexpr Character cr('\r');
    room.resize(std::max(room.size(), 2 * piece.size())); // it may be nothing but line feeds
    Character *out = room.data();
    while (!piece.empty()) {
        const std::size_t feed = piece.find(Character('\n'));
        if (feed == std::basic_string_view<Character>::npos) {
            out = std::copy(piece.begin(), piece.end(), out);
            break;
        }
        std::size_t end = feed;
        while (end > 0 && piece[end - 1] == cr) {
            --end;
        }
        out = std::copy_n(piece.data(), end, out);
        const std::ptrdiff_t least = dropped > 0 ? 0 : 1;
        out = std::fill_n(out, std::max(static_cast<std::ptrdiff_t>(feed - end) - dropped, least), cr);
        *out++ = Character('\n');
        ++lineEnds;
        piece.remove_prefix(feed + 1);
    }
    return {room.data(), static_cast<std::size_t>(out - room.data())};
}

/// Reads bytes piece by piece. @param take  is given a piece; its answer other than `Whole` ends the work
template <typename Take>
TextLoading forEachPiece(QByteArrayView bytes, const std::function<bool(qint64)> &proceed, Take take)
{
    return whileMemoryLasts(TextLoading::NoMemory, [&] {
        for (qsizetype at = 0; at < bytes.size();) {
            const QByteArrayView piece = nextPiece(bytes.sliced(at));
            if (const TextLoading answer = take(piece); answer != TextLoading::Whole) {
                return answer;
            }
            at += piece.size();
            if (proceed && !proceed(at)) {
                return TextLoading::Stopped;
            }
        }
        return TextLoading::Whole;
    });
}

QString decoded(QByteArrayView utf8)
{
    // A byte-order mark here is a character of the text.
    QStringDecoder decode(QStringDecoder::Utf8, QStringDecoder::Flag::ConvertInitialBom);
    return decode(utf8);
}

TextLoading answerOf(bool isAppended)
{
    return isAppended ? TextLoading::Whole : TextLoading::NoMemory;
}

/// Finds what is known of a text once all of it is there.
TextLoading finished(TextLoading answer, LoadedText &loaded)
{
    const bool isKnown = answer != TextLoading::Whole || doneWhileMemoryLasts([&loaded] { loaded.findPages(); });
    return isKnown ? answer : TextLoading::NoMemory;
}

} // namespace

void LoadedText::findPages()
{
    text.visit([this](auto characters) {
        if (isRichText(characters)) {
            return; // its lines are not those that it shows
        }
        pageStarts = pageHeadersIn(characters);
        linesPerPage = linesBetweenPageHeaders(characters, pageStarts);
    });
}

TextLoading loadReportText(QByteArrayView bytes, LoadedText &loaded, const std::function<bool(qint64)> &proceed)
{
    const QByteArrayView mark(reportFileMark, sizeof reportFileMark);
    const bool hasMark = bytes.startsWith(mark);
    if (hasMark) {
        bytes = bytes.sliced(mark.size());
    }
    if (isRichText(bytes)) {
        return TextLoading::OtherText;
    }
    const std::ptrdiff_t dropped = hasMark && hasDoubledEnds(bytes) ? 1 : 0;
    if (!loaded.text.reserve(bytes.size())) {
        return TextLoading::NoMemory;
    }
    std::string narrow;
    std::u16string wide;
    const TextLoading answer = forEachPiece(bytes, proceed, [&](QByteArrayView piece) {
        if (isAscii(piece)) {
            const std::string_view lines(piece.data(), static_cast<std::size_t>(piece.size()));
            const std::string_view copy = copyLines(lines, dropped, narrow, loaded.lineEnds);
            return answerOf(loaded.text.append(QLatin1StringView(copy.data(), static_cast<qsizetype>(copy.size()))));
        }
        if (!QUtf8StringView(piece.data(), piece.size()).isValidUtf8()) {
            return TextLoading::OtherText;
        }
        const QString text = decoded(piece);
        const std::u16string_view lines(QStringView(text).utf16(), static_cast<std::size_t>(text.size()));
        return answerOf(loaded.text.append(QStringView(copyLines(lines, dropped, wide, loaded.lineEnds))));
    });
    return finished(answer, loaded);
}

TextLoading loadPlainText(QByteArrayView bytes, LoadedText &loaded, const std::function<bool(qint64)> &proceed)
{
    if (!loaded.text.reserve(bytes.size())) {
        return TextLoading::NoMemory;
    }
    const TextLoading answer = forEachPiece(bytes, proceed, [&loaded](QByteArrayView piece) {
        loaded.lineEnds += piece.count('\n');
        return answerOf(isAscii(piece) ? loaded.text.append(QLatin1StringView(piece.data(), piece.size()))
                                       : loaded.text.append(QStringView(decoded(piece))));
    });
    return finished(answer, loaded);
}

} // namespace kareport
