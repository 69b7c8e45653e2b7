#include "ByteLineReader.h"

#include "PrintQt.h"

#include <QBuffer>
#include <QStringList>

#include <gtest/gtest.h>

#include <random>

namespace
{

using kareport::ByteLineReader;

QStringList piecesOf(QIODevice &device)
{
    QStringList pieces;
    ByteLineReader reader(device);
    while (reader.next()) {
        pieces.append(reader.piece().toString());
    }
    EXPECT_FALSE(reader.next()) << "it stays at the end";
    EXPECT_TRUE(reader.piece().isEmpty());
    return pieces;
}

QStringList piecesOf(const QByteArray &bytes)
{
    QBuffer buffer;
    buffer.setData(bytes);
    buffer.open(QIODevice::ReadOnly);
    return piecesOf(buffer);
}

TEST(ByteLineReader, ReadsLinesWithTheirLineFeed)
{
    struct Row
    {
        QByteArray bytes;
        QStringList expected;
        const char *reason;
    };
    const Row rows[] = {
        {"", {}, "empty"},
        {"a", {QStringLiteral("a")}, "no line end"},
        {"\n", {QStringLiteral("\n")}, "an empty line"},
        {"a\nb", {QStringLiteral("a\n"), QStringLiteral("b")}, "the last line without its end"},
        {"a\r\nb\r\n", {QStringLiteral("a\n"), QStringLiteral("b\n")}, "CR LF becomes LF"},
        {"a\r\r\nb\r\r\n", {QStringLiteral("a\r\n"), QStringLiteral("b\r\n")}, "a saved report keeps one CR"},
        {"a\rb\r", {QStringLiteral("a\rb\r")}, "a lone CR ends nothing, also at the end"},
        {"\r\n\n\r\n", {QStringLiteral("\n"), QStringLiteral("\n"), QStringLiteral("\n")}, "line ends alone"},
        {"\xEF\xBB\xBFTALVEN\r\r\n", {QStringLiteral("ï»¿TALVEN\r\n")}, "a byte-order mark is three characters"},
        {"\x80\xE9\xFF", {QStringLiteral("\u0080é\u00FF")}, "each byte is the character of its value"},
        {QByteArray("a\0b\n", 4), {QStringView(u"a\0b\n", 4).toString()}, "a zero is a character"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(piecesOf(row.bytes), row.expected) << row.reason;
    }
}

TEST(ByteLineReader, LongLinesComeInPieces)
{
    const auto x = [](int count) { return QByteArray(count, 'x'); };
    const auto piece = [](int count, const char *end = "") { return QString(count, u'x') + QLatin1String(end); };

    struct Row
    {
        QByteArray bytes;
        QStringList expected;
        const char *reason;
    };
    const Row rows[] = {
        {x(1021) + "\n", {piece(1021, "\n")}, "the longest line in one piece"},
        {x(1021) + "\r\n", {piece(1021, "\n")}, "the longest line in one piece, with CR LF"},
        {x(1022) + "\n", {piece(1022), QStringLiteral("\n")}, "only its end is left for the next piece"},
        {x(1022) + "\r\n", {piece(1022), QStringLiteral("\n")}, "only its end is left, with CR LF"},
        {x(1022), {piece(1022)}, "no line end"},
        {x(1023), {piece(1022), piece(1)}, "one more"},
        {x(1021) + "\r", {piece(1021, "\r")}, "a lone CR in the last place"},
        {x(1021) + "\ra", {piece(1021, "\r"), QStringLiteral("a")}, "a lone CR in the last place, more follows"},
        {x(1021) + "\r\r\na",
         {piece(1021, "\r"), QStringLiteral("\n"), QStringLiteral("a")},
         "a saved report's line end across the pieces"},
        {x(1020) + "\r\r\n", {piece(1020, "\r\n")}, "a saved report's line that just fits"},
        {x(1022) + "\r", {piece(1022), QStringLiteral("\r")}, "a lone CR after the last place"},
        {x(1500) + "\nb", {piece(1022), piece(478, "\n"), QStringLiteral("b")}, "two pieces"},
        {x(2044) + "\n", {piece(1022), piece(1022), QStringLiteral("\n")}, "two full pieces"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(piecesOf(row.bytes), row.expected) << row.reason;
    }
}

/// What the reader does, stated for the whole text at once.
QStringList expectedPieces(QByteArray bytes)
{
    const QString text = QString::fromLatin1(bytes.replace("\r\n", "\n"));
    QStringList pieces;
    for (qsizetype at = 0; at < text.size();) {
        const qsizetype feed = text.indexOf(u'\n', at);
        const qsizetype end = std::min({text.size(), at + 1022, feed < 0 ? text.size() : feed + 1});
        pieces.append(text.sliced(at, end - at));
        at = end;
    }
    return pieces;
}

TEST(ByteLineReader, LinesAreWholeWhereverTheyAreInTheFile)
{
    // Bytes are taken from the device in chunks: line ends are before, on and after the places where one ends.
    for (const int chunk : {256 * 1024, 2 * 256 * 1024}) {
        for (int before = chunk - 3; before <= chunk + 1; ++before) {
            QByteArray bytes;
            while (bytes.size() + 500 < before) {
                bytes += QByteArray(498, 'x') + "\r\n";
            }
            bytes += QByteArray(before - bytes.size(), 'y') + "\r\nlast";
            EXPECT_EQ(piecesOf(bytes), expectedPieces(bytes)) << before;
        }
    }
}

TEST(ByteLineReader, ReadsAnyMixtureOfLineEnds)
{
    std::mt19937 random(1);
    for (int round = 0; round < 300; ++round) {
        QByteArray bytes;
        while (bytes.size() < 5000) {
            const auto length = static_cast<int>(random() % 3 == 0 ? 1015 + random() % 12 : random() % 8);
            bytes += QByteArray(length, 'x');
            const char *const ends[] = {"\r\n", "\n", "\r", "\r\r\n", "\n\r", ""};
            bytes += ends[random() % std::size(ends)];
        }
        ASSERT_EQ(piecesOf(bytes), expectedPieces(bytes)) << "round " << round;
    }
}

/// Gives a few bytes at a time, and fails after the last of them when it is asked to.
class SlowDevice : public QIODevice
{
public:
    SlowDevice(QByteArray bytes, qint64 atATime, bool failsAtEnd)
        : bytes_(std::move(bytes)), atATime_(atATime), failsAtEnd_(failsAtEnd)
    {
        open(QIODevice::ReadOnly | QIODevice::Unbuffered);
    }
    bool isSequential() const override { return true; }

protected:
    qint64 readData(char *data, qint64 size) override
    {
        const qint64 count = std::min({size, atATime_, bytes_.size() - at_});
        std::copy_n(bytes_.constData() + at_, count, data);
        at_ += count;
        return count == 0 && failsAtEnd_ ? -1 : count;
    }
    qint64 writeData(const char *, qint64) override { return -1; }

private:
    QByteArray bytes_;
    qint64 atATime_;
    bool failsAtEnd_;
    qint64 at_ = 0;
};

TEST(ByteLineReader, ADeviceMayGiveFewerBytesThanAskedFor)
{
    const QByteArray bytes = "a\r\n" + QByteArray(1500, 'x') + "\r\r\nb\r\n\r\n" + QByteArray(1022, 'y') + "\r\nc";
    for (const qint64 atATime : {1, 2, 3, 1021, 1022, 1023}) {
        for (const bool failsAtEnd : {false, true}) {
            SlowDevice device(bytes, atATime, failsAtEnd);
            EXPECT_EQ(piecesOf(device), expectedPieces(bytes)) << atATime << " bytes at a time";
        }
    }
}

} // namespace
