#include "ReportTextDecoder.h"
#include "PrintQt.h"
#include "ReportTextCodec.h"

#include <QBuffer>
#include <QRandomGenerator>

#include <gtest/gtest.h>

namespace
{

using kareport::decodeReportText;
using kareport::LineEnds;

TEST(ReportTextDecoder, ReadsWhatReportFilesHold)
{
    struct Row
    {
        QByteArray bytes;
        QString text;
        const char *reason;
    };
    const Row rows[] = {
        {"", QString(), "an empty file"},
        {"\xEF\xBB\xBF", QString(), "only the mark"},
        {"\xEF\xBB\xBF"
         "A\r\r\nB\r\r\n",
         QStringLiteral("A\r\nB\r\n"), "the doubled line ends are one each"},
        {"\xEF\xBB\xBF"
         "A\r\nB",
         QStringLiteral("A\r\nB"), "no line end has a CR too many: an editor wrote it"},
        {"\xEF\xBB\xBF"
         "A\r\nB\r\r\n",
         QStringLiteral("A\nB\r\n"), "a bare LF of the text was written as CR LF"},
        {"\xEF\xBB\xBF"
         "A\rB\r",
         QStringLiteral("A\rB\r"), "a CR alone is a character, at the end as well"},
        {"\xEF\xBB\xBF\r\r\r\n", QStringLiteral("\r\r\n"), "a CR before a line end"},
        {"\xEF\xBB\xBF\xC3\xA9\xE2\x88\x9E\xF0\x9F\x98\x80", QString::fromUtf8("é∞😀"), "two, three and four bytes"},
        {"\xEF\xBB\xBF\xEF\xBB\xBF"
         "A",
         QChar(QChar::ByteOrderMark) + QStringLiteral("A"), "a second mark is a character"},
        {"A\nB\n", QStringLiteral("A\r\nB\r\n"), "a text of another program"},
        {"A\r\nB", QStringLiteral("A\r\nB"), "the same with CR LF"},
        {QByteArray("a\0b\n", 4), QStringLiteral("a") + QChar(0) + QStringLiteral("b\r\n"), "a NUL is a character"},
    };
    for (const Row &row : rows) {
        QString text = QStringLiteral("before");
        EXPECT_FALSE(decodeReportText(row.bytes, text).has_value()) << row.reason;
        EXPECT_EQ(text, row.text) << row.reason;
    }
}

TEST(ReportTextDecoder, SaysWhereAFileIsNotUtf8)
{
    struct Row
    {
        QByteArray bytes;
        qsizetype line;
        qsizetype column;
        const char *reason;
    };
    const Row rows[] = {
        {"\xFF", 1, 1, "a byte that is never used"},
        {"ab\xE9", 1, 3, "Latin-1, cut off by the end"},
        {"ab\n\xC3\xA9x\xE9y\n", 2, 3, "columns are characters"},
        {"\xEF\xBB\xBF"
         "a\n\xED\xA0\x80",
         2, 1, "half a surrogate pair"},
        {"\xC0\x80", 1, 1, "an overlong form"},
        {"ok\n\xE2\x88", 2, 1, "cut off in the middle of a character"},
        {"\xE2\x88\n\x9E", 1, 1, "a line end in the middle of a character"},
    };
    for (const Row &row : rows) {
        QString text;
        const auto place = decodeReportText(row.bytes, text);
        ASSERT_TRUE(place.has_value()) << row.reason;
        EXPECT_EQ(place->line, row.line) << row.reason;
        EXPECT_EQ(place->column, row.column) << row.reason;
    }
}

TEST(ReportTextDecoder, GivesBackEveryTextThatIsWritten)
{
    // All that a line end can be mixed with, and characters of every length.
    const QList<QString> parts = {QStringLiteral("\r"),   QStringLiteral("\n"),   QStringLiteral("\r\n"),
                                  QStringLiteral("a"),    QString::fromUtf8("é"), QString::fromUtf8("∞"),
                                  QString::fromUtf8("😀"), QString(QChar(0))};
    QRandomGenerator random(20);
    for (int round = 0; round < 500; ++round) {
        QString text = QStringLiteral("first line\r\n"); // as reports end their lines
        for (quint32 count = random.bounded(40u); count > 0; --count) {
            text += parts[random.bounded(int(parts.size()))];
        }
        QBuffer file;
        file.open(QIODevice::WriteOnly);
        ASSERT_TRUE(kareport::writeReportText(file, QStringView(text), LineEnds::ReportFile));
        QString read;
        ASSERT_FALSE(decodeReportText(file.data(), read).has_value());
        EXPECT_EQ(read, text) << "round " << round;
    }
}

} // namespace
