#include "DataReport.h"
#include "GroupedList.h"
#include "PlainGroupText.h"
#include "RandomRuns.h"
#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <set>
#include <vector>

namespace
{

using namespace kareport;

/// Rows in groups of given sizes.
class GroupedObjects : public UDataObjectList, public GroupedList
{
public:
    UDataObject *GetAt(std::size_t index) override
    {
        isFirst_ = beginnings.count(index) != 0;
        return UDataObjectList::GetAt(index);
    }
    const TableGroups &groups() const override { return shape; }
    std::size_t firstNewLevel() const override { return isFirst_ ? 0 : shape.levels.size(); }
    void noteLeftOut(std::vector<LeftOut> variables) override { leftOut = std::move(variables); }

    TableGroups shape;
    std::set<std::size_t> beginnings;
    std::vector<LeftOut> leftOut;

private:
    bool isFirst_ = false;
};

/// A table of one level of groups, on pages of so many lines.
struct Layout
{
    std::vector<int> sizes;
    int linesPerPage = 10;
    int firstLine = 2; ///< of the page, where the table begins
    int keep = 1;
    int before = 0;
    bool newPage = false;
    bool hasGroupTotals = false;
    bool hasTableTotals = false;
    bool hasPageTotals = false;
    bool hasHeader = false;
};

sXmlReportField countField()
{
    sXmlReportField field;
    field.VariableName = QStringLiteral("Count");
    field.Width = 5;
    field.Align = QStringLiteral("R");
    field.ID = 8;
    field.Type = 0;
    return field;
}

QStringList written(const Layout &layout)
{
    TableReport table({markup::field("Number", "Pt", "4"), markup::field("Count", "Count", "5", "RIGHT")}, "32",
                      layout.linesPerPage);
    table.report.SetHeaderFlag(false);
    table.goToLine(layout.firstLine);
    table.report.SetHeaderFlag(layout.hasHeader);
    GroupedObjects list;
    std::size_t row = 0;
    for (const int size : layout.sizes) {
        list.beginnings.insert(row);
        for (int i = 0; i < size; ++i, ++row) {
            UDataObject &object = list.Add();
            object.Set(1, UPointNumber(QStringLiteral("r%1").arg(row)));
            object.Set(8, qint32(row));
        }
    }
    TotalledVariable variable;
    variable.field = countField();
    list.shape.variables.push_back(variable);
    GroupLevel level;
    level.ids = {1};
    level.hasHeading = true;
    level.heading = plainText(QStringLiteral("Group"));
    level.keep = layout.keep;
    level.before = layout.before;
    level.newPage = layout.newPage;
    const auto total = [](const char *label) {
        TotalLine line;
        line.label = plainText(QString::fromLatin1(label));
        line.cells.push_back(TotalCell());
        return std::vector<TotalLine>{line};
    };
    if (layout.hasGroupTotals) {
        level.totals = total("g");
    }
    list.shape.levels.push_back(level);
    if (layout.hasTableTotals) {
        list.shape.tableTotals = total("t");
    }
    if (layout.hasPageTotals) {
        list.shape.pageTotals = total("p");
    }
    EXPECT_TRUE(table.report.WriteDataTable(&list, 0, 0, 1));
    QStringList lines = table.report.GetText().toString().split(QStringLiteral("\r\n"));
    for (QString &line : lines) {
        line = line.simplified();
    }
    return lines;
}

/// Lays the same table out by counting lines.
class Model
{
public:
    explicit Model(const Layout &layout) : layout_(layout), pages_(1) {}

    /// The lines of each page.
    std::vector<QStringList> lay()
    {
        page() << QStringLiteral("start");
        while (page().size() < layout_.firstLine - 1) {
            page() << QString();
        }
        std::vector<QStringList> together;
        int row = 0;
        int all = 0;
        for (const int size : layout_.sizes) {
            int sum = 0;
            QStringList lines(QStringLiteral("Group"));
            for (int i = 0; i < size; ++i, ++row) {
                if (i >= layout_.keep && i > 0) {
                    together.push_back(lines);
                    lines.clear();
                }
                lines << QStringLiteral("r%1 %1").arg(row);
                sum += row;
            }
            if (layout_.hasGroupTotals) {
                lines << QStringLiteral("-----") << QStringLiteral("g %1").arg(sum);
            }
            all += sum;
            together.push_back(lines);
        }
        if (layout_.hasTableTotals) {
            last_ << QStringLiteral("-----") << QStringLiteral("t %1").arg(all);
        }
        for (std::size_t i = 0; i < together.size(); ++i) {
            write(together[i], i == 0, i + 1 == together.size());
        }
        return std::move(pages_);
    }

private:
    QStringList &page() { return pages_.back(); }
    qsizetype left() { return layout_.linesPerPage - 1 - page().size(); }
    qsizetype reserved() const { return layout_.hasPageTotals ? 2 : 0; }

    void turn()
    {
        pages_.emplace_back();
        top_ = 0;
        sum_ = 0;
        rows_ = 0;
        if (layout_.hasHeader) {
            // The header with its page number, three blank lines, and the heading.
            page() << QStringLiteral("H") << QString() << QString() << QString() << QStringLiteral("Pt Count");
            top_ = page().size();
        }
    }

    void endPage()
    {
        if (layout_.hasPageTotals && rows_ > 0) {
            page() << QStringLiteral("-----") << QStringLiteral("p %1").arg(sum_);
        }
        turn();
    }

    void write(const QStringList &lines, bool isFirst, bool isLast)
    {
        const bool isGroup = lines.first() == u"Group";
        const bool isAtTop = isFirst || page().size() == top_;
        qsizetype before = isGroup && !isAtTop ? layout_.before : 0;
        const qsizetype needed = lines.size() + before + reserved() + (isLast ? last_.size() : 0);
        if (isFirst) {
            if (layout_.linesPerPage - layout_.firstLine <= 3 || left() < needed + 1) {
                turn();
            } else {
                page() << QStringLiteral("Pt Count");
            }
        } else if (!isAtTop && (needed > left() || (isGroup && layout_.newPage))) {
            endPage();
            before = 0;
        }
        for (; before > 0; --before) {
            page() << QString();
        }
        for (const QString &line : lines) {
            page() << line;
            if (line.startsWith(u'r')) {
                sum_ += line.section(u' ', 1).toInt();
                ++rows_;
            }
        }
        if (isLast) {
            if (layout_.hasPageTotals) {
                page() << QStringLiteral("-----") << QStringLiteral("p %1").arg(sum_);
            }
            page() << last_;
        } else if (left() == 0) {
            turn(); // the last line of a page turns it
        }
    }

    const Layout &layout_;
    std::vector<QStringList> pages_;
    QStringList last_;
    qsizetype top_ = -1;
    int sum_ = 0;
    int rows_ = 0;
};

std::string shown(const QStringList &lines)
{
    return lines.join(u'\n').toStdString();
}

void expectPages(const Layout &layout)
{
    QStringList text = written(layout);
    for (QString &line : text) { // what a page's header says is not of interest here
        line = line.contains(QStringLiteral("Page:")) ? QStringLiteral("H") : line;
    }
    const std::vector<QStringList> pages = Model(layout).lay();
    qsizetype at = 0;
    for (std::size_t i = 0; i < pages.size(); ++i) {
        QStringList page = text.mid(at, layout.linesPerPage);
        QStringList expected = pages[i];
        while (!page.isEmpty() && page.last().isEmpty()) {
            page.removeLast();
        }
        while (!expected.isEmpty() && expected.last().isEmpty()) {
            expected.removeLast();
        }
        EXPECT_EQ(shown(page), shown(expected)) << "page " << i + 1 << " of " << layout.linesPerPage << " lines";
        at += layout.linesPerPage;
    }
}

TEST(GroupedTablePage, AHeadingStaysWithItsRowsAndATotalWithThem)
{
    Layout layout;
    layout.sizes = {4, 2, 3, 1};
    layout.hasGroupTotals = true;
    layout.hasTableTotals = true;
    expectPages(layout);
    layout.keep = 3;
    expectPages(layout);
    layout.newPage = true;
    expectPages(layout);
    layout.hasPageTotals = true;
    expectPages(layout);
}

TEST(GroupedTablePage, TheHeadingOfTheTableIsNotLeftAlone)
{
    Layout layout;
    layout.sizes = {2, 2};
    layout.keep = 2;
    layout.hasGroupTotals = true;
    layout.linesPerPage = 12;
    for (layout.firstLine = 2; layout.firstLine < 12; ++layout.firstLine) {
        expectPages(layout);
    }
}

TEST(GroupedTablePage, RandomTablesAreLaidOutAsCounted)
{
    RandomRuns runs("grouped tables", 1, 400);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        Layout layout;
        const int groups = random.below(8) + 1;
        for (int i = 0; i < groups; ++i) {
            layout.sizes.push_back(random.below(7) + 1);
        }
        layout.keep = random.below(4) + 1;
        layout.before = random.below(3);
        layout.newPage = random.below(4) == 0;
        layout.hasGroupTotals = random.below(2) == 0;
        layout.hasTableTotals = random.below(2) == 0;
        layout.hasPageTotals = random.below(2) == 0;
        layout.hasHeader = random.below(2) == 0;
        // What belongs together finds room on every page: heading, rows, totals of all kinds, and the header.
        const int least = 6 + layout.keep + 1 + 6 + (layout.hasHeader ? 5 : 0);
        layout.linesPerPage = least + random.below(12);
        layout.firstLine = random.below(layout.linesPerPage - 2) + 2;
        expectPages(layout);
        ASSERT_FALSE(::testing::Test::HasFailure()) << "seed " << runs.seed();
    }
}

TEST(GroupedTablePage, PagesThatAreTooSmallLoseNothing)
{
    for (int lines = 2; lines < 8; ++lines) {
        Layout layout;
        layout.sizes = {3, 1, 2};
        layout.keep = 3;
        layout.hasGroupTotals = true;
        layout.hasTableTotals = true;
        layout.hasPageTotals = lines % 2 == 0;
        layout.linesPerPage = lines;
        const QStringList text = written(layout);
        for (const char *line : {"r0 0", "r1 1", "r2 2", "g 3", "r3 3", "g 3", "r4 4", "r5 5", "g 9", "t 15"}) {
            EXPECT_TRUE(text.contains(QString::fromLatin1(line))) << lines << ": " << line;
        }
        EXPECT_EQ(text.count(QStringLiteral("Group")), 3) << lines;
    }
}

TEST(GroupedTablePage, AnEmptyTableHasItsHeadingAlone)
{
    Layout layout;
    layout.hasTableTotals = true;
    layout.hasPageTotals = true;
    EXPECT_EQ(written(layout).join(u'|'), QStringLiteral("start|Pt Count|"));
}

} // namespace
