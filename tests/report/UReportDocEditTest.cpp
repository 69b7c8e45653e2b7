#include "ReportFixture.h"
#include "ReportTextCodec.h"

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
        {4, 1, u"x", false, false, u"a\r\nb", "after the text"},
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

TEST(UReportDocEdit, WhatIsWrittenAfterAnEditAndMakesTheTextGrowLeavesItWhole)
{
    const FixedSurroundings surroundings;
    struct Row
    {
        void (*grow)(UReportDoc &report);
        qsizetype written;
        const char *reason;
    };
    constexpr Row rows[] = {
        {[](UReportDoc &report) { EXPECT_TRUE(report.Write(QString(100, u'w'), 0)); }, 100, "a text"},
        {[](UReportDoc &report) { report.LineFeed(10); }, 20, "line ends"},
        {[](UReportDoc &report) { EXPECT_EQ(report.CheckSize(32001), 1); }, 0, "room for one character more"},
        {[](UReportDoc &report) { EXPECT_EQ(report.CheckSize(320000), 1); }, 0, "room for ten blocks"},
    };
    for (const Row &row : rows) {
        for (const qsizetype length : {2, 70000}) { // carried out when the text is read, and at once
            UReportDoc report;
            ASSERT_TRUE(report.Write(QString(31990, u'x'), 0));
            ASSERT_TRUE(report.ReplaceText(5, 1, QString(length, u'Y')));
            row.grow(report);
            const QString text = report.CopyText();
            EXPECT_EQ(text.size(), 31989 + length + row.written) << row.reason;
            EXPECT_EQ(text.count(u'x'), 31989) << row.reason << ", after an edit of " << length;
            EXPECT_EQ(text.count(u'Y'), length) << row.reason << ", after an edit of " << length;
            EXPECT_FALSE(text.contains(QChar(0))) << row.reason << ", after an edit of " << length;
        }
    }
}

} // namespace
