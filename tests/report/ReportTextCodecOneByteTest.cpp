#include "ReportTextCodec.h"

#include "ReportFixture.h"

#include <QBuffer>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <vector>

namespace
{

using kareport::LineEnds;
using kareport::ReportTextEncoder;

constexpr LineEnds bothLineEnds[] = {LineEnds::ReportFile, LineEnds::PlainText};

template <typename Text>
QByteArray written(Text text, LineEnds lineEnds)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(kareport::writeReportText(buffer, text, lineEnds));
    return buffer.data();
}

TEST(ReportTextCodecOneByte, CharactersAreWrittenAsUtf8)
{
    struct Row
    {
        QByteArray text;
        const char *reportFile; ///< in hexadecimal
        const char *plainText;
        const char *reason;
    };
    const Row rows[] = {
        {"", "efbbbf", "", "empty"},
        {"12\xB0\xFF\r\n", "efbbbf3132c2b0c3bf0d0d0a", "3132c2b0c3bf0a", "degree sign and the last character"},
        {"\x7F\x80\xA0", "efbbbf7fc280c2a0", "7fc280c2a0", "around the first character of two bytes"},
        {"\r", "efbbbf0d", "0d", "a carriage return at the end"},
        {"\r\r\n\n", "efbbbf0d0d0d0a0d0a", "0d0a0a", "line ends in a row"},
        {QByteArray(2, '\0'), "efbbbf0000", "0000", "characters 0 are text"},
    };
    for (const Row &row : rows) {
        const QLatin1StringView text(row.text);
        EXPECT_EQ(written(text, LineEnds::ReportFile).toHex().toStdString(), row.reportFile) << row.reason;
        EXPECT_EQ(written(text, LineEnds::PlainText).toHex().toStdString(), row.plainText) << row.reason;
    }
}

TEST(ReportTextCodecOneByte, AReportOfLatin1OnlyIsSavedInUtf8)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    UReportDoc report;
    ASSERT_TRUE(report.Write(QStringLiteral(u"12\u00B0\u00FF"), 0));
    report.LineFeed(1);
    EXPECT_TRUE(report.OnSaveDocument(path));
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll().toHex(' ').toStdString(), "ef bb bf 31 32 c2 b0 c3 bf 0d 0d 0a");
}

TEST(ReportTextCodecOneByte, ALineEndMayBeInTwoPieces)
{
    for (qsizetype at = 65532; at <= 65538; ++at) {
        const QByteArray front(at, 'x');
        const QByteArray text = front + "\r\n\xE9";
        const QLatin1StringView view(text);
        EXPECT_TRUE(written(view, LineEnds::ReportFile) == "\xEF\xBB\xBF" + front + "\r\r\n\xC3\xA9") << at;
        EXPECT_TRUE(written(view, LineEnds::PlainText) == front + "\n\xC3\xA9") << at;
        const QByteArray cutOff = front + '\r';
        EXPECT_TRUE(written(QLatin1StringView(cutOff), LineEnds::PlainText) == cutOff) << at << ": no LF after it";
    }
}

TEST(ReportTextCodecOneByte, BytesAndUtf16AreEncodedAlike)
{
    std::mt19937 random(7);
    const char special[] = {'\r', '\n', '\0', '\x7F', '\x80', '\xFF'};
    for (int round = 0; round < 300; ++round) {
        QByteArray text(static_cast<qsizetype>(random() % 200), 'x');
        for (char &c : text) {
            const unsigned kind = random() % 8;
            c = kind < 3 ? special[random() % sizeof special] : static_cast<char>(kind < 6 ? 'a' : random() % 256);
        }
        const QString wide = QString::fromLatin1(text);
        for (const LineEnds lineEnds : bothLineEnds) {
            ReportTextEncoder narrowEncoder(lineEnds);
            ReportTextEncoder wideEncoder(lineEnds);
            for (qsizetype at = 0; at < text.size();) {
                const qsizetype count = std::min(static_cast<qsizetype>(1 + random() % 60), text.size() - at);
                const bool last = at + count == text.size();
                std::vector<char> narrowBytes(ReportTextEncoder::bound(static_cast<std::size_t>(count)));
                std::vector<char> wideBytes(narrowBytes.size());
                narrowBytes.resize(
                    narrowEncoder.encode(QLatin1StringView(text).sliced(at, count), narrowBytes.data(), last));
                wideBytes.resize(wideEncoder.encode(QStringView(wide).sliced(at, count), wideBytes.data(), last));
                ASSERT_EQ(narrowBytes, wideBytes) << "round " << round << ", at " << at;
                at += count;
            }
        }
    }
}

} // namespace
