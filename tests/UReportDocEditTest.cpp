#include "ReportFixture.h"

#include <QBuffer>

#include <gtest/gtest.h>

namespace
{

TEST(UReportDocEdit, AReplacedPieceIsAModification)
{
    const FixedSurroundings surroundings;
    struct Row
    {
        qint64 at;
        qint64 removed;
        const char16_t *inserted;
        bool expected;
        bool modified;
        const char16_t *text;
        const char *reason;
    };
    constexpr Row rows[] = {
        {1, 0, u"x", true, true, u"ax\r\nb", "inserted"},
        {1, 2, u"", true, true, u"ab", "a line end removed"},
        {0, 0, u"", true, false, u"a\r\nb", "nothing replaced by nothing"},
        {4, 1, u"x", false, false, u"a\r\nb", "behind the text"},
        {-1, 1, u"x", false, false, u"a\r\nb", "before the text"},
    };
    for (const Row &row : rows) {
        UReportDoc report;
        report.SetData(QStringLiteral("a\r\nb"));
        report.SetModifiedFlag(false);
        EXPECT_EQ(report.ReplaceText(row.at, row.removed, row.inserted), row.expected) << row.reason;
        EXPECT_EQ(report.IsModified(), row.modified) << row.reason;
        EXPECT_EQ(report.GetTextLength(), QStringView(row.text).size()) << row.reason;
        EXPECT_EQ(report.CopyText(), QString::fromUtf16(row.text)) << row.reason;
        EXPECT_EQ(textOf(report), QString::fromUtf16(row.text)) << row.reason;
    }
}

TEST(UReportDocEdit, CountersStaySoThatWhatIsWrittenNextContinuesThePages)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.WriteLine(QStringLiteral("one"), 0, 2, 0);
    const int lines = report.GetLineCount();
    EXPECT_TRUE(report.ReplaceText(0, 3, u"1\r\n2\r\n3"));
    EXPECT_EQ(report.GetLineCount(), lines);
    report.WriteLine(QStringLiteral("two"), 0, 1, 0);
    EXPECT_EQ(textOf(report), QStringLiteral("1\r\n2\r\n3\r\n\r\ntwo\r\n"));
}

TEST(UReportDocEdit, AnEditedTextIsSavedAsEdited)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetData(QStringLiteral("one\r\n"));
    ASSERT_TRUE(report.ReplaceText(0, 1, u"O"));
    ASSERT_TRUE(report.ReplaceText(3, 0, u" \u00E9"));
    QBuffer bytes;
    ASSERT_TRUE(bytes.open(QIODevice::WriteOnly));
    ASSERT_TRUE(report.WriteText(bytes, kareport::LineEnds::PlainText));
    EXPECT_EQ(bytes.data(), QByteArray("One \xC3\xA9\n"));
}

TEST(UReportDocEdit, CopyingDoesNotChangeWhatIsCopied)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    EXPECT_EQ(report.CopyText(), QString());
    const QString withZero = QStringLiteral("a") + QChar(0) + QStringLiteral("b\u6E2C");
    report.SetData(withZero);
    const QString copy = report.CopyText();
    EXPECT_EQ(copy, withZero) << "a character 0 does not end the text";
    ASSERT_TRUE(report.ReplaceText(0, 1, u"x"));
    EXPECT_EQ(copy, withZero) << "a copy stays as it was";
}

} // namespace
