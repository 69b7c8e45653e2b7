#include "ReportMenu.h"

#include "ReportWindowFixture.h"

#include <QMenu>
#include <QMenuBar>

namespace
{

struct Entry
{
    unsigned id; ///< 0 for a line between entries
    const char *text;
    const char *key;
};

void expectEntries(const QMenu &menu, const std::vector<Entry> &expected)
{
    ASSERT_EQ(static_cast<std::size_t>(menu.actions().size()), expected.size()) << menu.title().toStdString();
    for (std::size_t i = 0; i < expected.size(); ++i) {
        const QAction *action = menu.actions().at(static_cast<qsizetype>(i));
        EXPECT_EQ(action->isSeparator(), expected[i].id == 0) << i;
        if (expected[i].id != 0) {
            EXPECT_EQ(action->data().toUInt(), expected[i].id) << i;
            EXPECT_EQ(action->text(), QString::fromUtf8(expected[i].text)) << i;
            EXPECT_EQ(action->shortcut().toString(), QString::fromUtf8(expected[i].key)) << expected[i].text;
        }
    }
}

TEST(ReportMenu, HasTheCommandsOfReportsInTheirOrder)
{
    const WindowDesk desk;
    const kareport::ReportMenu menu =
        kareport::addReportMenu(*UXTPMDIFrameWnd::Get(), *UXTPMDIFrameWnd::Get()->menuBar());
    expectEntries(*menu.file, {{57600, "&New", "Ctrl+N"},
                               {57601, "&Open...", "Ctrl+O"},
                               {57602, "&Close", ""},
                               {57603, "&Save", "Ctrl+S"},
                               {57604, "Save &As...", ""},
                               {32771, "Update Text", ""},
                               {0, "", ""},
                               {57607, "&Print...", "Ctrl+P"},
                               {57609, "Print Pre&view", ""},
                               {57606, "Pa&ge Setup...", ""},
                               {0, "", ""},
                               {57616, "Recent File", ""},
                               {0, "", ""},
                               {57665, "E&xit", ""}});
    expectEntries(*menu.edit, {{57643, "&Undo", "Ctrl+Z"},
                               {0, "", ""},
                               {57635, "Cu&t", "Ctrl+X"},
                               {57634, "&Copy", "Ctrl+C"},
                               {57637, "&Paste", "Ctrl+V"}});
    expectEntries(*menu.view, {{59392, "&Toolbar", ""}, {59393, "&Status Bar", ""}});
    expectEntries(*menu.window, {{57648, "&New Window", ""},
                                 {57650, "&Cascade", ""},
                                 {57651, "&Tile Horizontally", ""},
                                 {57652, "Tile Vertically", ""},
                                 {57649, "&Arrange Icons", ""}});
    expectEntries(*menu.help, {{57670, "&Help", ""}, {57664, "&About...", ""}});
    const QStringList titles = {QStringLiteral("&File"), QStringLiteral("&Edit"), QStringLiteral("&View"),
                                QStringLiteral("&Window"), QStringLiteral("&Help")};
    const QList<QAction *> menus = UXTPMDIFrameWnd::Get()->menuBar()->actions();
    ASSERT_EQ(menus.size(), titles.size());
    for (qsizetype i = 0; i < titles.size(); ++i) {
        EXPECT_EQ(menus[i]->text(), titles[i]);
    }
}

TEST(ReportMenu, ItsCommandsReachTheReportAndAreDisabledWithoutOne)
{
    const WindowDesk desk;
    UXTPMDIFrameWnd &frame = *UXTPMDIFrameWnd::Get();
    kareport::addReportMenu(frame, *frame.menuBar());
    frame.UpdateCommands();
    EXPECT_FALSE(frame.CommandAction(57637)->isEnabled()) << "no report";
    EXPECT_FALSE(frame.CommandAction(57600)->isEnabled()) << "this frame makes none";
    EXPECT_FALSE(frame.CommandAction(57616)->isEnabled()) << "nor does it list files";
    const UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_X);
    frame.UpdateCommands();
    ASSERT_TRUE(frame.CommandAction(57643)->isEnabled());
    frame.CommandAction(57643)->trigger();
    EXPECT_EQ(textOf(*report), QString()) << "taken back";
    EXPECT_FALSE(frame.CommandAction(57616)->isEnabled());
}

} // namespace
