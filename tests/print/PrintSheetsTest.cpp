#include "PrintSheets.h"

#include "PagedText.h"
#include "PrintQt.h"

#include <QTextCursor>

#include <gmock/gmock.h>

namespace
{

using kareport::PrintSheet;
using kareport::ReportPage;

/// Pages of so many lines each, where every line has as many characters, its end included.
std::vector<ReportPage> pagesOf(std::vector<qint64> lines, qint64 characters)
{
    std::vector<ReportPage> pages;
    qint64 at = 0;
    for (const qint64 count : lines) {
        pages.push_back({at, at + count * characters, count});
        at += count * characters;
    }
    return pages;
}

std::vector<qint64> startsOf(const std::vector<PrintSheet> &sheets)
{
    std::vector<qint64> starts;
    for (const PrintSheet &sheet : sheets) {
        starts.push_back(sheet.start);
    }
    return starts;
}

/// What every plan of sheets keeps: nothing is left out, nothing printed twice, and each sheet has room for what it is given.
void expectWhole(PagedText &text, const QRect &room, const std::vector<PrintSheet> &sheets,
                 const std::vector<ReportPage> &pages, const char *reason)
{
    kareport::LinePager pager = text.pager();
    std::size_t sheet = 0;
    for (const ReportPage &page : pages) {
        qint64 at = page.begin;
        for (; sheet < sheets.size() && sheets[sheet].start < page.end; ++sheet) {
            ASSERT_EQ(sheets[sheet].start, at) << reason;
            at = sheets[sheet].stop;
            EXPECT_EQ(pager.layOutScaled(room, sheets[sheet].start, at, sheets[sheet].scale), at) << reason;
        }
        EXPECT_EQ(at, page.end) << reason;
    }
    EXPECT_EQ(sheet, sheets.size()) << reason;
}

TEST(PrintSheets, EachPageBeginsASheetInTypeThatHasRoomForAll)
{
    struct Row
    {
        std::vector<qint64> pages; ///< lines
        qint64 usual;
        QRect room;
        std::vector<qint64> starts; ///< lines
        std::vector<qreal> scales;
        const char *reason;
    };
    const QRect sixty = PagedText::room(60, 10);
    const Row rows[] = {
        {{60, 60, 3}, 60, sixty, {0, 60, 120}, {1, 1, 1}, "the sheet takes the page"},
        {{50, 50}, 50, sixty, {0, 50}, {1, 1}, "the sheet would take more lines: the page stays a page"},
        {{72, 72, 3},
         72,
         sixty,
         {0, 72, 144},
         {60 / 72.0, 60 / 72.0, 60 / 72.0},
         "fewer lines than the page has: all pages alike, the short one too"},
        {{3, 72}, 72, sixty, {0, 3}, {60 / 72.0, 60 / 72.0}, "whichever comes first"},
        {{3, 3}, 72, sixty, {0, 3}, {1, 1}, "no page has the lines that it might have"},
        {{60, 80, 60}, 60, sixty, {0, 60, 140}, {1, 0.75, 1}, "a page of more lines than usual is smaller by itself"},
        {{96}, 60, sixty, {0}, {0.625}, "just at 5 points"},
        {{97, 10}, 60, sixty, {0, 96, 97}, {0.625, 0.625, 1}, "a line more goes on on a sheet of its own"},
        {{200}, 200, sixty, {0, 96, 192}, {0.625, 0.625, 0.625}, "three pieces"},
        {{60, 0, 60}, 60, sixty, {0, 60, 60}, {1, 1, 1}, "a blank page is a sheet"},
    };
    for (const Row &row : rows) {
        PagedText text(shortLines(300));
        const std::vector<ReportPage> pages = pagesOf(row.pages, 5);
        kareport::LinePager pager = text.pager();
        const std::vector<PrintSheet> sheets = printSheets(pager, row.room, pages, row.usual);
        std::vector<qint64> starts = row.starts;
        std::for_each(starts.begin(), starts.end(), [](qint64 &start) { start *= 5; });
        EXPECT_EQ(startsOf(sheets), starts) << row.reason;
        ASSERT_EQ(sheets.size(), row.scales.size()) << row.reason;
        for (std::size_t i = 0; i < sheets.size(); ++i) {
            // The part of a line that roundings may take belongs to the sheet, and 8 points are 67 dots.
            EXPECT_NEAR(sheets[i].scale, row.scales[i], 0.006) << row.reason << "; sheet " << i;
        }
        expectWhole(text, row.room, sheets, pages, row.reason);
    }
}

TEST(PrintSheets, TheWidestRowDecidesAndWhatIsStillTooWideIsBroken)
{
    struct Row
    {
        QString wide;
        qreal scale;
        std::size_t sheets;
        const char *reason;
    };
    const QRect room = PagedText::room(20, 20);
    const auto utf16 = [](const char16_t *text) { return QString::fromUtf16(text); };
    const Row rows[] = {
        {QString(20, u'x'), 1, 1, "fits"},
        {QString(25, u'x'), 0.8, 1, "25 characters on 20"},
        {QString(20, u'x') + QString(50, u' '), 1, 1, "blanks at its end may be in the margin"},
        {QString(32, u'x'), 0.625, 1, "just at 5 points"},
        {QString(40, u'x'), 0.625, 1, "broken into two rows; the page has room for them"},
        {QString(32 * 40, u'x'), 0.625, 2, "40 rows and 4: 32 rows of 5 points a sheet"},
        {QString(7000, u'x'), 0.625, 7, "219 rows and 4, laid out in pieces"},
        {utf16(u"測量測量測量測量測量測量測量測量"), -1, 1, "wide characters need more than a cell each"},
        {QStringLiteral("a\tb\tc"), -1, 1, "tabs go as far as on the screen: 25 characters and one"},
        {utf16(u"one\u2028two\u2028three"), 1, 1, "a break within a paragraph makes rows"},
    };
    for (const Row &row : rows) {
        PagedText text(shortLines(2) + row.wide + u'\n' + shortLines(2));
        const std::vector<ReportPage> pages = {{0, text.document().characterCount() - 1, 5}};
        kareport::LinePager pager = text.pager();
        const std::vector<PrintSheet> sheets = printSheets(pager, room, pages, 5);
        EXPECT_EQ(sheets.size(), row.sheets) << row.reason;
        if (row.scale < 0) {
            EXPECT_LT(sheets[0].scale, 1) << row.reason;
            EXPECT_GT(sheets[0].scale, 0.625) << row.reason;
        } else {
            EXPECT_NEAR(sheets[0].scale, row.scale, 0.008) << row.reason;
        }
        expectWhole(text, room, sheets, pages, row.reason);
    }
}

TEST(PrintSheets, LargeCharactersTakeTheRoomThatTheyNeed)
{
    PagedText text(shortLines(40));
    QTextCursor cursor(&text.document());
    cursor.setPosition(100, QTextCursor::KeepAnchor);
    QTextCharFormat large;
    large.setFontPointSize(16);
    cursor.mergeCharFormat(large);
    const std::vector<ReportPage> pages = pagesOf({20, 20}, 5);
    kareport::LinePager pager = text.pager();
    const QRect room = PagedText::room(30, 80);
    const std::vector<PrintSheet> sheets = printSheets(pager, room, pages, 20);
    ASSERT_EQ(sheets.size(), 2U);
    EXPECT_NEAR(sheets[0].scale, 30 / 40.0, 0.02) << "20 lines twice as high on a sheet of 30";
    EXPECT_EQ(sheets[0].scale, sheets[1].scale);
    expectWhole(text, room, sheets, pages, "two sizes");
}

TEST(PrintSheets, ASheetThatTakesNothingIsOneForEachPage)
{
    PagedText text(shortLines(30));
    kareport::LinePager pager = text.pager();
    for (const QRect &room : {QRect(), QRect(567, 567, -10, 1000), QRect(567, 567, 1000, 0)}) {
        EXPECT_EQ(startsOf(printSheets(pager, room, pagesOf({10, 20}, 5), 20)), (std::vector<qint64>{0, 50}));
    }
    EXPECT_TRUE(printSheets(pager, PagedText::room(3, 3), {}, 20).empty());
}

TEST(PrintSheets, ScaledRowsBreakAsRowsOfTheOwnSizeDo)
{
    PagedText text(QStringLiteral("a line that is longer than a row ").repeated(9) + u'\n' + shortLines(40));
    kareport::LinePager pager = text.pager();
    for (const qreal scale : {1.0, 0.5, 0.9, 0.6666666}) {
        const QRect room = PagedText::room(12, 30);
        const QRect small(room.topLeft(), QSizeF(QSizeF(room.size()) * scale).toSize());
        EXPECT_EQ(pager.layOutScaled(small, 0, -1, scale), pager.layOut(room, 0, -1)) << scale;
        EXPECT_EQ(pager.layOutScaled(small, 7, 400, scale), pager.layOut(room, 7, 400)) << scale;
    }
}

} // namespace
