#include "TemplateFile.h"

#include "PrintQt.h"
#include "ScanText.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <random>
#include <string_view>
#include <vector>

using kareport::ScanText;
using kareport::TemplateFile;

using namespace std::string_view_literals;

namespace
{

TemplateFile fileOf(std::string_view bytes)
{
    return TemplateFile(QByteArrayView(bytes.data(), static_cast<qsizetype>(bytes.size())));
}

struct Row
{
    std::string_view bytes;
    std::u16string_view text;
    const char *reason;
};

constexpr Row rows[] = {
    {""sv, u""sv, "an empty file"},
    {"<Name>A</Name>\r\n"sv, u"<Name>A</Name>\r\n"sv, "plain ASCII, as it is"},
    {"\xC3\xA9"sv, u"é"sv, "two bytes of UTF-8"},
    {"\xE7\x82\xB9"sv, u"点"sv, "three bytes of UTF-8"},
    {"\xF0\x9F\x98\x80"sv, u"\U0001F600"sv, "four bytes of UTF-8 are a surrogate pair"},
    {"\xE9"sv, u"é"sv, "a byte that UTF-8 does not know is Latin-1"},
    {"\xC3\xA9\xE9"sv, u"\u00C3\u00A9é"sv, "one such byte makes the whole file Latin-1"},
    {"\xC3"sv, u"\u00C3"sv, "cut off in the middle of a character"},
    {"\xE7\x82"sv, u"\u00E7\u0082"sv, "cut off before the last byte of a character"},
    {"\xA9"sv, u"©"sv, "a second byte without a first"},
    {"\xC0\x80"sv, u"\u00C0\u0080"sv, "a zero in two bytes is not valid UTF-8"},
    {"\xE0\x80\xAF"sv, u"\u00E0\u0080\u00AF"sv, "more bytes than the character needs"},
    {"\xED\xA0\x80"sv, u"\u00ED\u00A0\u0080"sv, "half of a surrogate pair is not a character"},
    {"\xF4\x90\x80\x80"sv, u"\u00F4\u0090\u0080\u0080"sv, "beyond the last code point"},
    {"\x80\x9F\xFF"sv, u"\u0080\u009F\u00FF"sv, "Latin-1 to its ends, nothing of another code page"},
    {"\xEF\xBB\xBF<Name>\xC3\xA9"sv, u"<Name>é"sv, "a byte-order mark is not part of the text"},
    {"a\0b"sv, u"a"sv, "a zero byte ends the text of the only chunk"},
    {"\0ab"sv, u""sv, "a zero byte at the front"},
    {"ab\0"sv, u"ab"sv, "a zero byte at the end"},
    {"\xC3\xA9\0\xE9"sv, u"\u00C3\u00A9"sv, "a byte that is not read decides as well: the whole file is Latin-1"},
};

TEST(TemplateFile, DecodesTheWholeFileInOneEncoding)
{
    for (const Row &row : rows) {
        EXPECT_EQ(fileOf(row.bytes).text(), QString::fromStdU16String(std::u16string(row.text))) << row.reason;
    }
}

constexpr qsizetype chunk = 4095;

struct ZeroRow
{
    qsizetype size;
    qsizetype zero; ///< where the zero byte is among "x"
    qsizetype kept;
    const char *reason;
};

constexpr ZeroRow zeroRows[] = {
    {chunk, chunk - 1, chunk - 1, "the last byte of the only chunk"},
    {chunk + 10, 0, 10, "the first chunk is dropped, the second stays"},
    {chunk + 10, 100, 110, "the rest of the first chunk is dropped"},
    {chunk + 10, chunk - 1, chunk + 9, "the last byte of the first chunk"},
    {chunk + 10, chunk, chunk, "the first byte of the second chunk"},
    {chunk + 10, chunk + 9, chunk + 9, "the last byte of the file"},
    {3 * chunk, chunk + 5, 2 * chunk + 5, "the second of three chunks"},
    {3 * chunk, 3 * chunk - 1, 3 * chunk - 1, "the last byte of a file that fills its chunks"},
};

TEST(TemplateFile, ZeroByteEndsTheTextOfItsChunk)
{
    for (const ZeroRow &row : zeroRows) {
        QByteArray bytes(row.size, 'x');
        bytes[row.zero] = '\0';
        EXPECT_EQ(TemplateFile(bytes).text(), QString(row.kept, u'x')) << row.reason;
    }
}

TEST(TemplateFile, ZeroBytesInSeveralChunksEndEachItsOwn)
{
    QByteArray bytes(3 * chunk, 'a');
    std::fill(bytes.begin() + chunk, bytes.begin() + 2 * chunk, 'b');
    std::fill(bytes.begin() + 2 * chunk, bytes.end(), 'c');
    bytes[2] = '\0';
    bytes[7] = '\0'; // after the first, in what is dropped already
    bytes[chunk + 3] = '\0';
    bytes[2 * chunk + 1] = '\0';
    EXPECT_EQ(TemplateFile(bytes).text(), QStringLiteral("aabbbc"));
}

TEST(TemplateFile, CharacterAcrossAChunkBoundaryStaysWhole)
{
    const char *const characters[] = {"\xC3\xA9", "\xE7\x82\xB9", "\xF0\x9F\x98\x80"};
    for (const char *character : characters) {
        const QByteArray bytes(character);
        for (qsizetype before = chunk - bytes.size(); before <= chunk; ++before) {
            const QString expected = QString(before, u'x') + QString::fromUtf8(bytes) + QStringLiteral("yz");
            EXPECT_EQ(TemplateFile(QByteArray(before, 'x') + bytes + "yz").text(), expected)
                << bytes.size() << " bytes after " << before;
        }
    }
}

TEST(TemplateFile, ZeroByteBeforeACharacterAcrossABoundaryKeepsTheNextChunk)
{
    // The first byte of the character is dropped with the rest of its chunk, the second one is left alone.
    QByteArray bytes = QByteArray(chunk - 1, 'x') + "\xC3\xA9" + "tail";
    bytes[3] = '\0';
    const QString text = TemplateFile(bytes).text();
    EXPECT_TRUE(text.startsWith(QStringLiteral("xxx")));
    EXPECT_TRUE(text.endsWith(QStringLiteral("tail")));
    EXPECT_EQ(text.size(), 3 + 1 + 4);
}

struct StripRow
{
    const char *bytes;
    const char16_t *scanned;
    std::vector<qsizetype> places; ///< of every scanned character and of the end
    const char *reason;
};

TEST(TemplateFile, ScansWithoutTabsAndLineEnds)
{
    const StripRow stripRows[] = {
        {"", u"", {0}, "an empty file"},
        {"abc", u"abc", {0, 1, 2, 3}, "nothing to strip"},
        {"a\tb\nc\rd\r\ne", u"abcde", {0, 2, 4, 6, 9, 10}, "each of the three, anywhere"},
        {"\n\n\tab", u"ab", {3, 4, 5}, "at the front"},
        {"ab\r\n\t", u"ab", {0, 1, 2}, "at the end: the end is after the last character"},
        {"\t\r\n", u"", {0}, "nothing else in the file"},
        {" a  b ", u" a  b ", {0, 1, 2, 3, 4, 5, 6}, "blanks are kept"},
        {"a\v\f\x1F\xC2\xA0z", u"a\v\f\u001F\u00A0z", {0, 1, 2, 3, 4, 5, 6}, "other white space is kept"},
        {"<Na\nme>Stake\tout</Na\r\nme>",
         u"<Name>Stakeout</Name>",
         {0, 1, 2, 4, 5, 6, 7, 8, 9, 10, 11, 13, 14, 15, 16, 17, 18, 19, 22, 23, 24, 25},
         "inside tags and values as well"},
    };
    for (const StripRow &row : stripRows) {
        const ScanText scanned = scanTextOf(fileOf(row.bytes));
        EXPECT_EQ(scanned.text(), QString::fromUtf16(row.scanned)) << row.reason;
        std::vector<qsizetype> places;
        for (qsizetype i = 0; i <= scanned.size(); ++i) {
            places.push_back(scanned.sourceOf(i));
        }
        EXPECT_EQ(places, row.places) << row.reason;
    }
}

TEST(TemplateFile, ReadsAFile)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("vérité.xml"));
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("<Name>\xE9</Name>\r\n");
    file.close();
    const auto read = TemplateFile::read(path);
    ASSERT_TRUE(read);
    EXPECT_EQ(read->text(), QStringLiteral("<Name>é</Name>\r\n")) << "line ends are not translated on reading";
}

TEST(TemplateFile, ReadsAnEmptyFile)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("empty.xml"));
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.close();
    const auto read = TemplateFile::read(path);
    ASSERT_TRUE(read);
    EXPECT_TRUE(read->text().isEmpty());
    EXPECT_TRUE(scanTextOf(*read).isEmpty());
}

TEST(TemplateFile, CannotReadWhatIsNotAFile)
{
    const QTemporaryDir folder;
    EXPECT_FALSE(TemplateFile::read(folder.filePath(QStringLiteral("missing.xml"))));
    EXPECT_FALSE(TemplateFile::read(folder.path())) << "a folder";
}

TEST(TemplateFile, IsReadForScanningAsItsTextIsScanned)
{
    // Bytes of every kind next to each other: what is stripped, what is just next to it, zeros, pieces of characters.
    const std::vector<QByteArray> pieces = {"\t",
                                            "\n",
                                            "\r",
                                            "\r\n\t\t",
                                            "\x08",
                                            "\x0B",
                                            "\x0C",
                                            "\x0E",
                                            "<Name>",
                                            "</>",
                                            "ABCDEFGHIJKLMNOPQRSTUVWXYZ",
                                            " ",
                                            "\xC3\xA4",
                                            "\xE6\xBC\xA2",
                                            "\xF0\x9F\x98\x80",
                                            QByteArray(1, '\0'),
                                            "\xE4",
                                            "\x80"};
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("t.xml"));
    std::mt19937 random(20240305);
    for (int round = 0; round < 2000; ++round) {
        // Half of the files are UTF-8, and a zero is rare: it takes the rest of its chunk.
        const std::size_t kinds = round % 2 == 0 ? pieces.size() - 2 : pieces.size();
        QByteArray bytes;
        for (auto length = random() % 400; length > 0; --length) {
            const QByteArray &piece = pieces[random() % kinds];
            bytes += piece.startsWith('\0') && random() % 50 != 0 ? QByteArray("x") : piece;
        }
        if (round % 10 == 0) {
            bytes = bytes.repeated(40); // several chunks
        }
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(bytes);
        file.close();
        const auto scanned = TemplateFile::readScanned(path);
        ASSERT_TRUE(scanned);
        ASSERT_EQ(*scanned, scanTextOf(TemplateFile(bytes)).text()) << bytes.toHex(' ').constData();
    }
    EXPECT_FALSE(TemplateFile::readScanned(folder.filePath(QStringLiteral("missing.xml"))));
    EXPECT_FALSE(TemplateFile::readScanned(folder.path())) << "a folder";
}

} // namespace
