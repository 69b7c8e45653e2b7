#include "ByteLineReader.h"
#include "ReportTextCodec.h"
#include "ReportTextDecoder.h"

#include <QBuffer>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace
{

void expect(bool holds)
{
    if (!holds) {
        std::abort();
    }
}

/// What the pieces of a file make together is the file with LF for CR LF, whatever its lines are.
void checkPieces(const QByteArray &bytes)
{
    QBuffer file;
    file.setData(bytes);
    file.open(QIODevice::ReadOnly);
    kareport::ByteLineReader reader(file);
    QString all;
    while (reader.next()) {
        const QLatin1StringView piece = reader.piece();
        expect(!piece.isEmpty() && piece.size() <= kareport::ByteLineReader::longestPiece);
        expect(piece.indexOf(u'\n') < 0 || piece.indexOf(u'\n') == piece.size() - 1);
        all += piece;
    }
    QByteArray whole = bytes;
    expect(all == QString::fromLatin1(whole.replace("\r\n", "\n")));
}

/// What is read from a report file and written again is the file.
void checkDecoder(const QByteArray &bytes)
{
    QString text;
    if (const auto place = kareport::decodeReportText(bytes, text)) {
        expect(place->line >= 1 && place->column >= 1);
        return;
    }
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    expect(kareport::writeReportText(file, QStringView(text), kareport::LineEnds::ReportFile));
    QString again;
    expect(!kareport::decodeReportText(file.data(), again).has_value() && again == text);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char *>(data), static_cast<qsizetype>(size));
    checkPieces(bytes);
    checkDecoder(bytes);
    return 0;
}
