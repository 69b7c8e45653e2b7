#include "ReportLines.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <vector>

namespace
{

using kareport::ReportLines;

TEST(ReportLines, KeepsEveryLineExactlyAsItWasAdded)
{
    struct Row
    {
        QString line;
        const char *reason;
    };
    const Row rows[] = {
        {QString(), "nothing"},
        {QStringLiteral("x"), "an odd number of bytes, before characters of two"},
        {QStringLiteral("測量"), "wide characters right after"},
        {QStringLiteral("  two blanks before and after  "), "blanks are text"},
        {QString(QChar(0)) + u'a' + QChar(0), "the character 0"},
        {QStringLiteral("N 45°12'30\" E \u00FF"), "the last character of one byte"},
        {QStringLiteral("\u0100"), "the first of two"},
        {QStringLiteral("a\r\nb\tc"), "line ends and tabs within"},
        {QStringLiteral("\U0001F4CF"), "a pair of characters"},
        {QString(600000, u'x'), "longer than a block"},
        {QString(300000, u'∞'), "longer than a block, wide"},
        {QString(), "nothing again"},
    };
    ReportLines lines;
    for (const Row &row : rows) {
        ASSERT_TRUE(lines.append(row.line)) << row.reason;
    }
    ASSERT_EQ(lines.count(), static_cast<int>(std::size(rows)));
    for (int number = 0; number < lines.count(); ++number) {
        EXPECT_EQ(lines.line(number), rows[number].line) << rows[number].reason;
    }
    EXPECT_EQ(lines.line(-1), QString());
    EXPECT_EQ(lines.line(lines.count()), QString());
}

TEST(ReportLines, KeepsLinesOverManyBlocks)
{
    ReportLines lines;
    const auto expected = [](int number) {
        const QString line = QString::number(number).repeated(number % 100);
        return number % 7 == 0 ? line + u'°' : number % 11 == 0 ? line + u'∞' : line;
    };
    constexpr int count = 20000;
    for (int number = 0; number < count; ++number) {
        ASSERT_TRUE(lines.append(expected(number)));
    }
    for (int number = 0; number < count; ++number) {
        ASSERT_EQ(lines.line(number), expected(number)) << number;
    }
}

TEST(ReportLines, ViewsLearnOfLinesTogether)
{
    ReportLines lines;
    struct Insertion
    {
        int first;
        int last;
        int rowsThen;
        bool operator==(const Insertion &) const = default;
    };
    std::vector<Insertion> insertions;
    QObject::connect(&lines, &ReportLines::rowsInserted, [&](const QModelIndex &, int first, int last) {
        insertions.push_back({first, last, lines.rowCount()});
    });
    lines.publish();
    EXPECT_TRUE(insertions.empty()) << "nothing to tell";
    EXPECT_FALSE(lines.hasUnpublished());
    for (int number = 0; number < 3; ++number) {
        lines.append(QString::number(number));
    }
    EXPECT_TRUE(lines.hasUnpublished());
    EXPECT_EQ(lines.count(), 3);
    EXPECT_EQ(lines.rowCount(), 0) << "no view knows of them";
    EXPECT_FALSE(lines.index(0).isValid());
    lines.publish();
    EXPECT_FALSE(lines.hasUnpublished());
    EXPECT_EQ(insertions, (std::vector<Insertion>{{0, 2, 3}}));
    lines.publish();
    lines.append(u"3");
    lines.publish();
    EXPECT_EQ(insertions, (std::vector<Insertion>{{0, 2, 3}, {3, 3, 4}})) << "one insertion for what is new";
}

TEST(ReportLines, IsAListOfTexts)
{
    ReportLines lines;
    lines.append(u"first");
    lines.append(u"測量");
    lines.publish();
    lines.append(u"not published");
    EXPECT_EQ(lines.rowCount(), 2);
    EXPECT_EQ(lines.rowCount(lines.index(0)), 0) << "a line has no rows of its own";
    EXPECT_EQ(lines.data(lines.index(0)).toString(), QStringLiteral("first"));
    EXPECT_EQ(lines.data(lines.index(1)).toString(), QStringLiteral("測量"));
    EXPECT_FALSE(lines.data(lines.index(0), Qt::DecorationRole).isValid());
    EXPECT_FALSE(lines.data(QModelIndex()).isValid());
    EXPECT_FALSE(lines.data(lines.index(2)).isValid());
    EXPECT_FALSE(lines.flags(lines.index(0)) & Qt::ItemIsEditable);
}

} // namespace
