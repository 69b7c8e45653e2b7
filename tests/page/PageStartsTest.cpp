#include "PageStarts.h"

#include "PageHeader.h"

#include <gtest/gtest.h>

using kareport::PageStarts;

namespace
{

using Positions = std::vector<qint64>;

/// A text and its page starts, edited together.
class StartedText
{
public:
    explicit StartedText(QString text, Positions starts = {}) : text_(std::move(text))
    {
        starts_.assign(std::move(starts));
    }
    void replace(qint64 at, qint64 removed, const QString &inserted)
    {
        const bool wants = starts_.wantsRemoved(at, removed, inserted.size());
        starts_.carryOut(starts_.prepare(at, removed, wants ? text_.mid(at, removed) : QString(), inserted,
                                         at == 0 || text_[at - 1] == u'\n'));
        text_.replace(at, removed, inserted);
    }
    const Positions &positions() const { return starts_.positions(); }

private:
    QString text_;
    PageStarts starts_;
};

QString header(int page)
{
    return kareport::pageHeaderLine(QStringLiteral("A"), QStringLiteral("T"),
                                    QDateTime(QDate(2024, 3, 5), QTime(14, 7)), QStringLiteral("   Page:"), 80) +
           QString::number(page).rightJustified(3) + QStringLiteral("\r\n");
}

// Three pages of two lines, five characters a line.
const QString threePages = QStringLiteral("1a.\r\n1b.\r\n2a.\r\n2b.\r\n3a.\r\n3b.\r\n");
const Positions threeStarts = {0, 10, 20};

TEST(PageStarts, AnEditCarriesThemAlong)
{
    struct Row
    {
        qint64 at;
        qint64 removed;
        QString inserted;
        Positions expected;
        const char *reason;
    };
    const QString lineEnd = QStringLiteral("\r\n");
    const Row rows[] = {
        {0, 0, QString(), {0, 10, 20}, "nothing"},
        {5, 0, QStringLiteral("x"), {0, 11, 21}, "a letter in a page moves those after it"},
        {12, 0, QStringLiteral("xyz"), {0, 10, 23}, "and only those"},
        {10, 0, QStringLiteral("x"), {0, 10, 21}, "a letter at a page's start is the page's"},
        {10, 0, lineEnd, {0, 12, 22}, "a line end there is the page's before"},
        {10, 0, QStringLiteral("x\r\n"), {0, 13, 23}, "as a line is"},
        {10, 0, QStringLiteral("x\r\ny"), {0, 10, 24}, "but not one that is not ended"},
        {0, 0, lineEnd, {0, 12, 22}, "before the first page there is none"},
        {30, 0, QStringLiteral("x\r\n"), {0, 10, 20}, "at the end"},
        {8, 2, QString(), {0, 8, 18}, "without its line end the start stays before its page"},
        {10, 5, QString(), {0, 10, 15}, "the first line of a page goes, not the page"},
        {10, 5, QStringLiteral("new\r\n"), {0, 10, 20}, "or is another one"},
        {10, 10, QString(), {0, 10}, "a whole page goes"},
        {5, 10, QString(), {0, 10}, "what is left of two pages is one"},
        {0, 30, QString(), {0}, "all goes but the beginning"},
        {5, 20, QStringLiteral("x\r\n"), {0}, "three pages become one"},
        {0, 30, threePages, {0, 10, 20}, "the same text in its place"},
        {0, 30, QString(threePages).replace(12, 1, u'X'), {0, 10, 20}, "a control may report more than has changed"},
        {3, 24, QString(threePages).mid(3, 24).insert(10, QStringLiteral("x")), {0, 10, 21}, "or less of it"},
        {15,
         0,
         header(7) + QStringLiteral("7a.\r\n"),
         {0, 10, 15, 20 + header(7).size() + 5},
         "a header line begins a page"},
        {10,
         0,
         header(7),
         {0, 10, 10 + header(7).size(), 20 + header(7).size()},
         "put in at a page's start it comes before that page"},
        {12, 0, header(7), {0, 10, 20 + header(7).size()}, "within a line it is the end of a line"},
    };
    for (const Row &row : rows) {
        StartedText text(threePages, threeStarts);
        text.replace(row.at, row.removed, row.inserted);
        EXPECT_EQ(text.positions(), row.expected) << row.reason;
    }
}

TEST(PageStarts, TheInverseOfAnEditGivesThemBack)
{
    struct Row
    {
        qint64 at;
        qint64 removed;
        QString inserted;
        const char *reason;
    };
    const Row rows[] = {
        {10, 0, QStringLiteral("\r\n"), "a line end at a page's start"},
        {10, 0, QStringLiteral("x"), "a letter there"},
        {8, 2, QString(), "the line end before a page"},
        {10, 1, QString(), "a page's first letter"},
        {10, 5, QString(), "its first line"},
        {5, 5, QString(), "the last line of a page"},
        {5, 10, QString(), "the end of one page and the beginning of the next"},
        {10, 10, QString(), "a whole page"},
        {0, 10, QString(), "the first page"},
        {0, 30, QString(), "all"},
        {7, 20, QString(), "from line to line"},
        {7, 20, QStringLiteral("x\r\n"), "with something in its place"},
        {0, 30, QStringLiteral("y\r\n1b.\r\n"), "with something alike in its place"},
        {5, 0, header(9), "a page where there was none"},
        {10, 0, header(9), "a page before another"},
        {5, 10, header(9) + QStringLiteral("x\r\n") + header(10), "pages in place of pages"},
    };
    for (const Row &row : rows) {
        StartedText text(threePages, threeStarts);
        const QString removed = threePages.mid(row.at, row.removed);
        for (int turn = 0; turn < 3; ++turn) {
            text.replace(row.at, row.removed, row.inserted);
            text.replace(row.at, row.inserted.size(), removed);
            EXPECT_EQ(text.positions(), threeStarts) << row.reason << ", turn " << turn;
        }
    }
}

TEST(PageStarts, EditsAreTakenBackOneAfterTheOther)
{
    StartedText text(threePages, threeStarts);
    text.replace(10, 10, QString());
    text.replace(10, 5, QString()); // what was the first line of page 3
    text.replace(3, 0, QStringLiteral("xx"));
    text.replace(3, 2, QString());
    text.replace(10, 0, QStringLiteral("3a.\r\n"));
    EXPECT_EQ(text.positions(), Positions({0, 10}));
    text.replace(10, 0, QStringLiteral("2a.\r\n2b.\r\n"));
    EXPECT_EQ(text.positions(), threeStarts);
}

TEST(PageStarts, AHeaderLineThatBeginsNoPageComesBackAsThat)
{
    const QString second = header(2);
    StartedText text(QStringLiteral("1a.\r\n") + second + QStringLiteral("2a.\r\n"), {0});
    text.replace(5, second.size(), QString());
    text.replace(5, 0, second);
    EXPECT_EQ(text.positions(), Positions({0})) << "undone";
    text.replace(5, second.size(), QString());
    text.replace(0, 0, second);
    EXPECT_EQ(text.positions(), Positions({0, second.size()})) << "pasted elsewhere";
}

TEST(PageStarts, TwoLikePiecesAtOnePlaceComeBackOneAfterTheOther)
{
    StartedText text(QStringLiteral("1a.\r\n\r\n\r\n2a.\r\n"), {0, 5});
    const QString lineEnd = QStringLiteral("\r\n");
    text.replace(5, 2, QString());
    text.replace(5, 2, QString());
    text.replace(5, 0, lineEnd);
    text.replace(5, 0, lineEnd);
    EXPECT_EQ(text.positions(), Positions({0, 5})) << "the blank lines were the second page's";
    text.replace(5, 0, lineEnd);
    EXPECT_EQ(text.positions(), Positions({0, 7})) << "this one was never there";
}

TEST(PageStarts, ACutPageIsPutInElsewhere)
{
    StartedText text(threePages, threeStarts);
    text.replace(10, 10, QString());
    text.replace(20, 0, QStringLiteral("2a.\r\n2b.\r\n"));
    EXPECT_EQ(text.positions(), Positions({0, 10, 20}));
    text.replace(0, 10, QString());
    text.replace(10, 0, QStringLiteral("1a.\r\n1b.\r\n"));
    EXPECT_EQ(text.positions(), Positions({0, 10, 20})) << "before the last page";
}

TEST(PageStarts, WhatIsRememberedIsBounded)
{
    StartedText text(threePages, threeStarts);
    text.replace(10, 10, QString());
    for (int i = 0; i < 300; ++i) {
        text.replace(0, 1, QString());
        text.replace(0, 0, QStringLiteral("1"));
        text.replace(0, 0, QString(i + 3, u'x'));
    }
    EXPECT_EQ(text.positions().size(), 2U);
}

} // namespace
