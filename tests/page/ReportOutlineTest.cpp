#include "ReportOutline.h"

#include "LimitedMemory.h"
#include "PageWriter.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::PageWriter;
using kareport::ReportOutline;

/// The entries as "0 A 12", one after the other.
QString shown(const ReportOutline &outline)
{
    QStringList texts;
    for (const kareport::OutlineEntry &entry : outline.entries()) {
        texts.append(QStringLiteral("%1 %2 %3").arg(entry.level).arg(entry.text).arg(entry.at));
    }
    return texts.join(QStringLiteral(", "));
}

TEST(ReportOutline, AnEntryIsWhereSomethingIsSeen)
{
    ReportOutline outline;
    EXPECT_FALSE(outline.isWaiting());
    outline.announce(0, QStringLiteral("A"));
    outline.announce(1, QStringLiteral("T"));
    EXPECT_TRUE(outline.isWaiting());
    EXPECT_EQ(shown(outline), QString()) << "nothing is written yet";
    outline.place(3, u" \r\n\t");
    EXPECT_EQ(shown(outline), QString()) << "blanks";
    outline.place(7, u"\r\n  x y");
    EXPECT_EQ(shown(outline), QStringLiteral("0 A 11, 1 T 11"));
    EXPECT_FALSE(outline.isWaiting());
    outline.place(20, u"x");
    EXPECT_EQ(shown(outline), QStringLiteral("0 A 11, 1 T 11")) << "once";
}

TEST(ReportOutline, AnEntryThatNothingWasWrittenForGoes)
{
    struct Row
    {
        std::vector<int> levels; ///< announced one after the other, named A, B, ...
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {{0, 0}, "0 B 0", "a heading for another"},
        {{0, 1, 2}, "0 A 0, 1 B 0, 2 C 0", "each belongs to the one before"},
        {{0, 1, 2, 1}, "0 A 0, 1 D 0", "a table without rows"},
        {{0, 1, 2, 0}, "0 D 0", "all of a heading"},
        {{2, 1}, "1 B 0", "a smaller level"},
    };
    for (const Row &row : rows) {
        ReportOutline outline;
        char16_t name = u'A';
        for (const int level : row.levels) {
            outline.announce(level, QString(QChar(name++)));
        }
        outline.place(0, u"x");
        EXPECT_EQ(shown(outline), QString::fromUtf8(row.expected)) << row.reason;
    }
}

TEST(ReportOutline, EditsCarryTheEntriesAlong)
{
    struct Row
    {
        qint64 at;
        qint64 removed;
        const char *inserted;
        const char *expected;
        const char *reason;
    };
    // The entries A, B, C at the lines "aaa", "bbb", "ccc".
    const QString text = QStringLiteral("aaa\r\nbbb\r\nccc\r\n");
    constexpr Row rows[] = {
        {0, 0, "", "0 A 0, 0 B 5, 0 C 10", "nothing"},
        {7, 0, "x", "0 A 0, 0 B 5, 0 C 11", "a character after the beginning of a line"},
        {5, 0, "x", "0 A 0, 0 B 5, 0 C 11", "at its beginning: it becomes part of the line"},
        {5, 0, "new\r\n", "0 A 0, 0 B 10, 0 C 15", "a line before it"},
        {0, 0, "1\r\n2\r\n", "0 A 6, 0 B 11, 0 C 16", "lines before all"},
        {15, 0, "end", "0 A 0, 0 B 5, 0 C 10", "after all"},
        {6, 1, "", "0 A 0, 0 B 5, 0 C 9", "a character removed"},
        {5, 1, "", "0 A 0, 0 B 5, 0 C 9", "the first of a line"},
        {5, 3, "", "0 A 0, 0 B 5, 0 C 7", "a line but for its end"},
        {5, 5, "", "0 A 0, 0 C 5", "the whole line: its entry goes with it"},
        {3, 5, "", "0 A 0, 0 B 3, 0 C 5", "the end of a line and the text of the next one"},
        {4, 8, "", "0 A 0, 0 C 4", "up to within another line"},
        {5, 3, "other", "0 A 0, 0 B 5, 0 C 12", "a line replaced by another"},
        {0, 15, "", "", "everything"},
        {5, 0, "x\r\ny", "0 A 0, 0 B 5, 0 C 14", "a line and a word"},
    };
    for (const Row &row : rows) {
        ReportOutline outline;
        for (const char *name : {"A", "B", "C"}) {
            outline.announce(0, QString::fromUtf8(name));
            outline.place(5 * (*name - 'A'), u"x");
        }
        const QString inserted = QString::fromUtf8(row.inserted);
        const bool wanted = outline.wantsRemoved(row.at, row.removed);
        outline.carry(row.at, row.removed, wanted ? text.mid(row.at, row.removed) : QString(), inserted);
        EXPECT_EQ(shown(outline), QString::fromUtf8(row.expected)) << row.reason;
    }
}

TEST(ReportOutline, AnEntryThatWaitsIsNotCarried)
{
    ReportOutline outline;
    outline.announce(0, QStringLiteral("A"));
    outline.place(5, u"x");
    outline.announce(1, QStringLiteral("T"));
    outline.carry(0, 0, u"", u"ab");
    outline.place(30, u"x");
    EXPECT_EQ(shown(outline), QStringLiteral("0 A 7, 1 T 30"));
}

TEST(ReportOutline, ThePageWriterPlacesEntries)
{
    PageWriter page;
    page.setLinesPerPage(10);
    page.setHeaderFlag(true);
    page.setHeaderLine(QStringLiteral("H"));
    page.announceEntry(0, QStringLiteral("A"));
    page.setHeading({QStringLiteral("A"), 0, 1});
    page.writeLine(u"one", 0, 1, 0);
    EXPECT_EQ(shown(page.outline()), QStringLiteral("0 A 0")) << "the page begins with its header";
    page.announceEntry(1, QStringLiteral("T"));
    page.writeLine(u"two", 2, 1, 0);
    const QString text = page.text().view().toString();
    EXPECT_EQ(page.outline().entries().back().at, text.indexOf(u"two")) << "after the blank lines";
    page.announceEntry(1, QStringLiteral("U"));
    page.writeLine(QLatin1StringView("three"), -1, 1, 0);
    const QString all = page.text().view().toString();
    EXPECT_EQ(page.outline().entries().back().at, all.lastIndexOf(u'H')) << "a page that is begun for it";
    page.announceEntry(1, QStringLiteral("V"));
    EXPECT_EQ(page.outline().entries().size(), 3U) << "nothing is written for it";
    EXPECT_TRUE(page.replace(0, 0, u"before\r\n"));
    EXPECT_EQ(page.outline().entries().front().at, 8);
    page.clear();
    page.writeLine(u"one", 0, 1, 0);
    EXPECT_TRUE(page.outline().entries().empty());
}

/// Takes all that is written.
class AllTaken : public kareport::TextOutlet
{
public:
    bool write(QStringView) override { return true; }
    bool write(QLatin1StringView) override { return true; }
};

TEST(ReportOutline, ATextThatIsHandedOnHasNone)
{
    PageWriter page;
    AllTaken outlet;
    page.setOutlet(&outlet);
    page.announceEntry(0, QStringLiteral("A"));
    page.writeLine(u"one", 0, 1, 0);
    EXPECT_TRUE(page.outline().entries().empty());
    page.setOutlet(nullptr);
}

} // namespace
