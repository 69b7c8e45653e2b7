#include "SheetLayout.h"

#include "PagedText.h"
#include "PrintQt.h"
#include "ReportPages.h"

#include <QTextBlock>
#include <QTextCursor>

#include <gmock/gmock.h>

#include <random>

namespace
{

using kareport::PageRow;
using kareport::PrintSheet;
using kareport::ReportPage;
using kareport::SheetLayout;
using kareport::SheetPaper;

SheetPaper paperFor(const QRect &room)
{
    return {QSize(11906, 16838), room, 600, 0};
}

std::optional<std::vector<ReportPage>> nothing()
{
    return std::nullopt;
}

/// Pages of so many lines each.
SheetLayout::FindPages pagesOf(QTextDocument &text, int lines)
{
    return [&text, lines]() -> std::optional<std::vector<ReportPage>> {
        return kareport::reportPages(QStringView(text.toPlainText()), {}, lines);
    };
}

std::vector<std::tuple<qint64, qint64, qreal>> valuesOf(const std::vector<PrintSheet> &sheets)
{
    std::vector<std::tuple<qint64, qint64, qreal>> values;
    for (const PrintSheet &sheet : sheets) {
        values.emplace_back(sheet.start, sheet.stop, sheet.scale);
    }
    return values;
}

void finish(SheetLayout &layout)
{
    while (!layout.work(0)) {
    }
}

TEST(SheetLayout, LinesThatFlowTakeTheSheetsThatAJobPrints)
{
    PagedText text(shortLines(205));
    const QRect room = PagedText::room(60, 80);
    SheetLayout layout(text.document(), paperFor(room), nothing);
    EXPECT_EQ(layout.count(), 0) << "nothing is looked at before there is time for it";
    finish(layout);
    std::vector<qint64> starts;
    for (const PrintSheet &sheet : layout.sheets()) {
        starts.push_back(sheet.start);
    }
    EXPECT_EQ(starts, text.starts(room));
    EXPECT_EQ(layout.sheets().back().stop, 205 * 5);
    EXPECT_EQ(layout.sheetAt(0), 0);
    EXPECT_EQ(layout.sheetAt(59 * 5 + 4), 0) << "the end of its last line";
    EXPECT_EQ(layout.sheetAt(60 * 5), 1);
    EXPECT_EQ(layout.sheetAt(100000), 3);
}

TEST(SheetLayout, PagesThatHaveSheetsOfTheirOwnTakeThoseThatAJobPrints)
{
    PagedText text(shortLines(150) + QString(120, u'x') + u'\n' + shortLines(30));
    const QRect room = PagedText::room(60, 80);
    SheetLayout layout(text.document(), paperFor(room), pagesOf(text.document(), 72));
    finish(layout);
    kareport::LinePager pager = text.pager();
    EXPECT_EQ(valuesOf(layout.sheets()),
              valuesOf(kareport::printSheets(pager, room, *pagesOf(text.document(), 72)(), 0)));
    EXPECT_EQ(layout.count(), 3);
    EXPECT_LT(layout.sheets().front().scale, 1) << "the row of 120 characters makes all smaller";
}

TEST(SheetLayout, AnEmptyTextHasNoSheet)
{
    PagedText text;
    SheetLayout flowing(text.document(), paperFor(PagedText::room(60, 80)), nothing);
    SheetLayout given(text.document(), paperFor(PagedText::room(60, 80)), pagesOf(text.document(), 60));
    finish(flowing);
    finish(given);
    EXPECT_EQ(flowing.count(), 0);
    EXPECT_EQ(given.count(), 0);
    EXPECT_EQ(flowing.sheetAt(0), -1);
}

TEST(SheetLayout, DrawsWhatAJobDraws)
{
    struct Row
    {
        const char *text;
        bool given;
        const char *reason;
    };
    const Row rows[] = {
        {"P1 |  1234.567 |\n  second line\n\nlast", false, "plain lines"},
        {"P1 |  1234.567 |\n  second line\n\nlast", true, "the same as a page"},
        {"a line that is much wider than the sheet takes, and is broken therefore at its words\nnext", false, "broken"},
        {"a line that is much wider than the sheet takes, so that the type becomes smaller\nnext", true, "smaller"},
        {"a \u0416 \u4e2d and e\u0301\n\u05d0\u05d1", false, "characters that need shaping"},
    };
    const QRect room = PagedText::room(20, 40);
    for (const Row &row : rows) {
        SCOPED_TRACE(row.reason);
        PagedText text(QString::fromUtf8(row.text));
        SheetLayout layout(text.document(), paperFor(room), row.given ? pagesOf(text.document(), 20) : nothing);
        finish(layout);
        ASSERT_EQ(layout.count(), 1);
        const QImage shown = sheetImage(QSize(2600, 2200), [&](QPainter &painter) { layout.draw(painter, 0); });
        const PrintSheet sheet = layout.sheets().front();
        const QImage printed = sheetImage(QSize(2600, 2200), [&](QPainter &painter) {
            kareport::LinePager pager(text.document(), *painter.device());
            row.given ? pager.layOutScaled(room, sheet.start, sheet.stop, sheet.scale, &painter)
                      : pager.layOut(room, sheet.start, -1, &painter);
        });
        EXPECT_EQ(shown, printed);
        EXPECT_NE(shown, sheetImage(QSize(2600, 2200), [](QPainter &) {})) << "something is drawn";
    }
}

TEST(SheetLayout, SaysWhereEachCharacterIs)
{
    struct Row
    {
        const char *text;
        std::vector<std::pair<qint64, qint64>> rows;
        const char *reason;
    };
    const Row rows[] = {
        {"ab\n\nc", {{0, 2}, {3, 3}, {4, 5}}, "a row a line, also an empty one"},
        {"1234567890123456789012345678901234567890xyz\nb", {{0, 40}, {40, 43}, {44, 45}}, "a line that is broken"},
        {"\u4e2d\u0416 b", {{0, 4}}, "wide characters"},
    };
    for (const Row &row : rows) {
        SCOPED_TRACE(row.reason);
        PagedText text(QString::fromUtf8(row.text));
        SheetLayout layout(text.document(), paperFor(PagedText::room(20, 40)), nothing);
        finish(layout);
        std::vector<std::pair<qint64, qint64>> found;
        qreal below = 0;
        for (const PageRow &place : layout.rows(0)) {
            found.emplace_back(place.start, place.stop);
            EXPECT_EQ(place.edges.size(), static_cast<std::size_t>(place.stop - place.start) + 1);
            EXPECT_TRUE(std::is_sorted(place.edges.begin(), place.edges.end()));
            EXPECT_GE(place.top, below);
            below = place.top + place.height;
        }
        EXPECT_EQ(found, row.rows);
    }
}

TEST(SheetLayout, ARowIsWhereItsCharactersAreDrawn)
{
    // Ten blanks, then letters: what is drawn begins where the eleventh character does. Also in smaller type.
    for (const bool isGiven : {false, true}) {
        PagedText text(QStringLiteral("\n          HHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHHH\n"));
        SheetLayout layout(text.document(), paperFor(PagedText::room(20, isGiven ? 40 : 60)),
                           isGiven ? pagesOf(text.document(), 20) : nothing);
        finish(layout);
        const QImage image = sheetImage(QSize(2600, 2200), [&](QPainter &painter) { layout.draw(painter, 0); });
        const PageRow row = layout.rows(0).at(1);
        QRect ink;
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                ink = image.pixelColor(x, y).lightness() < 128 ? ink.united(QRect(x, y, 1, 1)) : ink;
            }
        }
        EXPECT_GE(ink.left(), row.edges.at(10));
        EXPECT_LT(ink.left(), row.edges.at(11));
        EXPECT_LE(ink.right(), row.edges.back());
        EXPECT_GT(ink.right(), row.edges.at(row.edges.size() - 2));
        EXPECT_GE(ink.top(), row.top);
        EXPECT_LE(ink.bottom(), row.top + row.height);
    }
}

/// Edits at random places, with as much work on the sheets between them as chance allows.
void editAtRandom(QTextDocument &text, SheetLayout &layout, std::mt19937 &chance, int edits)
{
    const auto below = [&chance](int limit) {
        return static_cast<int>(chance() % static_cast<unsigned>(std::max(1, limit)));
    };
    static const QStringList pieces = {QStringLiteral("x"),
                                       QStringLiteral("\n"),
                                       QStringLiteral("a\nb\n"),
                                       QStringLiteral("wide ").repeated(30),
                                       QString(),
                                       QStringLiteral("\u05d0"),
                                       QStringLiteral("line\n").repeated(40)};
    for (int edit = 0; edit < edits; ++edit) {
        const int length = text.characterCount() - 1;
        const int position = below(length + 1);
        const int removed = std::min(length - position, below(3) == 0 ? below(400) : below(4));
        const QString &added = pieces.at(below(static_cast<int>(pieces.size())));
        QTextCursor cursor(&text);
        cursor.setPosition(position);
        cursor.setPosition(position + removed, QTextCursor::KeepAnchor);
        cursor.insertText(added);
        if (removed + added.size() > 0) {
            layout.noteEdit(position, removed, added.size());
        }
        for (int steps = below(6); steps > 0; --steps) {
            layout.work(0);
        }
    }
}

TEST(SheetLayoutRandom, AfterAnyEditsTheSheetsAreThoseOfAFreshLayout)
{
    for (const unsigned seed : {1U, 2U, 3U, 4U, 5U, 6U}) {
        for (const bool isGiven : {false, true}) {
            SCOPED_TRACE(testing::Message() << "seed " << seed << (isGiven ? ", pages" : ", lines that flow"));
            std::mt19937 chance(seed);
            PagedText text(shortLines(400));
            const QRect room = PagedText::room(30, 40);
            const auto pages = isGiven ? pagesOf(text.document(), 36) : SheetLayout::FindPages(nothing);
            SheetLayout layout(text.document(), paperFor(room), pages);
            for (int round = 0; round < 25; ++round) {
                editAtRandom(text.document(), layout, chance, 1 + round % 4);
                finish(layout);
                SheetLayout fresh(text.document(), paperFor(room), pages);
                finish(fresh);
                ASSERT_EQ(valuesOf(layout.sheets()), valuesOf(fresh.sheets())) << "round " << round;
            }
        }
    }
}

TEST(SheetLayout, AnEditIsFollowedWithoutFindingAllSheetsAgain)
{
    PagedText text(shortLines(6000));
    const QRect room = PagedText::room(60, 40);
    SheetLayout layout(text.document(), paperFor(room), nothing);
    finish(layout);
    ASSERT_EQ(layout.count(), 100);
    QTextCursor cursor(&text.document());
    cursor.setPosition(60 * 5 * 3 + 2);
    cursor.insertText(QStringLiteral("x"));
    layout.noteEdit(60 * 5 * 3 + 2, 0, 1);
    EXPECT_EQ(layout.sheetAt(60 * 5 * 50 + 1), 50) << "until then the sheets after it move along";
    int steps = 1;
    while (!layout.work(0)) {
        ++steps;
    }
    EXPECT_LE(steps, 5) << "the sheet, the one before it, and the next, which begins as before";
    EXPECT_EQ(layout.sheets().back().stop, 30001);
}

} // namespace
