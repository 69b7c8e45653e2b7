#include "DataReport.h"
#include "GroupedList.h"
#include "PlainGroupText.h"
#include "RandomRuns.h"
#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <map>
#include <vector>

// Pages of tables with groups in groups.

namespace
{

using namespace kareport;

std::vector<TotalLine> total(const char *label)
{
    TotalLine line;
    line.label = plainText(QString::fromLatin1(label));
    line.cells.push_back(TotalCell());
    return {line};
}

/// Rows in groups of two levels.
class NestedObjects : public UDataObjectList, public GroupedList
{
public:
    UDataObject *GetAt(std::size_t index) override
    {
        const auto begins = beginnings.find(index);
        level_ = begins != beginnings.end() ? begins->second : shape.levels.size();
        return UDataObjectList::GetAt(index);
    }
    const TableGroups &groups() const override { return shape; }
    std::size_t firstNewLevel() const override { return level_; }
    void noteLeftOut(std::vector<LeftOut> /*variables*/) override {}

    TableGroups shape;
    std::map<std::size_t, std::size_t> beginnings; ///< the rows that begin groups, with their levels

private:
    std::size_t level_ = 0;
};

struct Nest
{
    std::vector<std::vector<int>> sizes; ///< of the inner groups of each outer one
    int linesPerPage = 20;
    int outerKeep = 1;
    int innerKeep = 1;
    bool innerNewPage = false;
    bool outerNewPage = false;
    int before = 0;
    bool hasPageTotals = false;
    QString tail; ///< of the text of each row
};

/// The lines of each page, without blank ones; a page without any is left out.
std::vector<QStringList> pagesOf(const Nest &nest)
{
    TableReport table({markup::field("Number", "Pt", "4"), markup::field("Count", "Count", "5", "RIGHT")}, "32",
                      nest.linesPerPage);
    table.report.SetHeaderFlag(false);
    table.goToLine(2);
    NestedObjects list;
    std::size_t row = 0;
    for (const std::vector<int> &outer : nest.sizes) {
        list.beginnings[row] = 0;
        for (const int size : outer) {
            list.beginnings.emplace(row, 1);
            for (int i = 0; i < size; ++i, ++row) {
                UDataObject &object = list.Add();
                object.Set(1, UPointNumber(QStringLiteral("r%1").arg(row) + nest.tail));
                object.Set(8, qint32(row));
            }
        }
    }
    TotalledVariable variable;
    variable.field.VariableName = QStringLiteral("Count");
    variable.field.Width = 5;
    variable.field.Align = QStringLiteral("R");
    variable.field.ID = 8;
    list.shape.variables.push_back(variable);
    const auto addLevel = [&](const char *heading, const char *label, int keep, bool newPage) {
        GroupLevel level;
        level.ids = {1};
        level.hasHeading = true;
        level.heading = plainText(QString::fromLatin1(heading));
        level.keep = keep;
        level.before = nest.before;
        level.newPage = newPage;
        level.totals = total(label);
        list.shape.levels.push_back(level);
    };
    addLevel("Outer", "o", nest.outerKeep, nest.outerNewPage);
    addLevel("Inner", "i", nest.innerKeep, nest.innerNewPage);
    list.shape.tableTotals = total("t");
    if (nest.hasPageTotals) {
        list.shape.pageTotals = total("p");
    }
    EXPECT_TRUE(table.report.WriteDataTable(&list, 0, 0, 1));
    const QStringList lines = table.report.GetText().toString().split(QStringLiteral("\r\n"));
    std::vector<QStringList> pages;
    for (qsizetype at = 0; at < lines.size(); at += nest.linesPerPage) {
        QStringList page;
        for (const QString &line : lines.mid(at, nest.linesPerPage)) {
            if (!line.trimmed().isEmpty() && line != u"start") {
                page.append(line.simplified());
            }
        }
        if (!page.isEmpty()) {
            pages.push_back(page);
        }
    }
    return pages;
}

bool isHeading(const QString &line)
{
    return line == u"Outer" || line == u"Inner" || line == u"Pt Count";
}

bool isTotal(const QString &line)
{
    return line.startsWith(u'-') || line.startsWith(u"i ") || line.startsWith(u"o ") || line.startsWith(u"t ") ||
           line.startsWith(u"p ");
}

/// What is wrong with the pages of a table; empty for nothing.
std::string wrongWith(const Nest &nest)
{
    const std::vector<QStringList> pages = pagesOf(nest);
    int row = 0;
    int inner = 0;
    for (std::size_t i = 0; i < pages.size(); ++i) {
        QStringList page = pages[i];
        const std::string all = page.join(u'\n').toStdString();
        if (page.front() == u"Pt Count") {
            page.removeFirst();
        }
        if (page.isEmpty() || isTotal(page.front())) {
            return "a total is alone:\n" + all;
        }
        if (isHeading(page.back())) {
            return "a heading is alone:\n" + all;
        }
        for (qsizetype line = 0; line < page.size(); ++line) {
            const bool isAtTop = line == 0 || (line == 1 && page.front() == u"Outer");
            if (page[line] == u"Inner" && inner++ > 0 && nest.innerNewPage && !isAtTop) {
                return "a group does not begin a page:\n" + all;
            }
            if (page[line] == u"Outer" && row > 0 && (nest.outerNewPage || nest.innerNewPage) && line != 0) {
                return "an outer group does not begin a page:\n" + all;
            }
            if (page[line].startsWith(u'r') && page[line].section(u' ', 1).toInt() != row++) {
                return "a row is missing before:\n" + all;
            }
        }
    }
    int rows = 0;
    for (const std::vector<int> &outer : nest.sizes) {
        for (const int size : outer) {
            rows += size;
        }
    }
    return row == rows ? std::string() : "rows are missing at the end";
}

TEST(GroupedTableNest, AnInnerGroupBeginsAPage)
{
    Nest nest;
    nest.sizes = {{2, 1}, {3, 2, 1}};
    nest.innerNewPage = true;
    EXPECT_EQ(wrongWith(nest), "");
    nest.outerKeep = 3;
    EXPECT_EQ(wrongWith(nest), "") << "also where the outer heading keeps rows with it";
    EXPECT_EQ(pagesOf(nest).size(), 5U) << "the heading around a group goes with it";
}

TEST(GroupedTableNest, RowsThatNoPageHoldsTogetherLeaveNothingAlone)
{
    for (int size = 1; size < 40; ++size) {
        Nest nest;
        nest.sizes = {{size}, {size, 3}};
        nest.innerKeep = 1000;
        EXPECT_EQ(wrongWith(nest), "") << size;
        nest.hasPageTotals = true;
        EXPECT_EQ(wrongWith(nest), "") << size << ", with totals of pages";
    }
}

TEST(GroupedTableNest, RandomGroupsLeaveNothingAlone)
{
    RandomRuns runs("groups in groups", 1, 400);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        Nest nest;
        for (int outer = random.below(4) + 1; outer > 0; --outer) {
            std::vector<int> &sizes = nest.sizes.emplace_back();
            for (int inner = random.below(4) + 1; inner > 0; --inner) {
                sizes.push_back(random.below(12) + 1);
            }
        }
        nest.outerKeep = random.below(8) + 1;
        nest.innerKeep = random.below(20) + 1;
        nest.innerNewPage = random.below(3) == 0;
        nest.outerNewPage = random.below(3) == 0;
        nest.before = random.below(2);
        nest.hasPageTotals = random.below(2) == 0;
        // Both headings with a row and all totals find room on a page.
        nest.linesPerPage = 16 + random.below(12);
        ASSERT_EQ(wrongWith(nest), "") << "seed " << runs.seed();
    }
}

TEST(GroupedTableNest, ALineBreakInACellCountsAsALine)
{
    for (int size = 1; size < 12; ++size) {
        Nest nest;
        nest.sizes = {{size, 2}};
        nest.tail = QStringLiteral("\r\nx");
        nest.innerKeep = 3;
        const std::vector<QStringList> pages = pagesOf(nest);
        for (const QStringList &page : pages) {
            EXPECT_FALSE(isHeading(page.back())) << size << ":\n" << page.join(u'\n').toStdString();
            EXPECT_FALSE(isTotal(page.front())) << size << ":\n" << page.join(u'\n').toStdString();
        }
    }
}

} // namespace
