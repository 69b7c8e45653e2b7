#include "AboutDialog.h"
#include "CommandList.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "DeskPreferences.h"
#include "FindBar.h"
#include "HelpWindow.h"
#include "PageSetupDialog.h"
#include "PreferencesDialog.h"
#include "ReportEdit.h"
#include "ReportViewWidget.h"
#include "TemplateDialog.h"
#include "UReportView.h"

#include <QAccessible>
#include <QMenuBar>
#include <QTabWidget>

#include <gtest/gtest.h>

#include <set>

namespace
{

using namespace kareport;

/// The roles of controls: what a user can do something with has to be called something.
bool isControl(QAccessible::Role role)
{
    static const std::set<QAccessible::Role> controls = {
        QAccessible::PushButton,   QAccessible::CheckBox, QAccessible::RadioButton, QAccessible::ComboBox,
        QAccessible::EditableText, QAccessible::SpinBox,  QAccessible::List,        QAccessible::Tree,
        QAccessible::Table,        QAccessible::PageTab,  QAccessible::MenuItem,    QAccessible::ButtonMenu,
        QAccessible::Slider,       QAccessible::Document, QAccessible::ListItem};
    return controls.count(role) > 0;
}

/// Adds what has no role, and the controls that have no name, of a part of a window.
void collect(QAccessibleInterface *part, const QString &way, QStringList &wrong, int depth = 0)
{
    if (part == nullptr || !part->isValid() || depth > 20 || part->state().invisible) {
        return;
    }
    const QString name = part->text(QAccessible::Name);
    const QObject *object = part->object();
    const QString here = way + u'/' +
                         (object != nullptr ? QString::fromLatin1(object->metaObject()->className()) : QString()) +
                         u'(' + name + u')';
    if (part->role() == QAccessible::NoRole) {
        wrong.append(here + QStringLiteral(" has no role"));
    }
    // The parts of a control, such as the field in a spin box, are called by it.
    const QAccessibleInterface *parent = part->parent();
    const bool isPart = parent != nullptr && isControl(parent->role()) && parent->role() != QAccessible::List &&
                        parent->role() != QAccessible::Tree && parent->role() != QAccessible::Table;
    if (isControl(part->role()) && name.isEmpty() && !isPart) {
        wrong.append(here + QStringLiteral(" has no name, role %1").arg(int(part->role())));
    }
    constexpr int most = 60; // rows of a list are alike
    for (int child = 0; child < std::min(part->childCount(), most); ++child) {
        collect(part->child(child), here, wrong, depth + 1);
    }
}

QString wrongOf(QWidget &window)
{
    window.show();
    QCoreApplication::processEvents();
    QStringList wrong;
    collect(QAccessible::queryAccessibleInterface(&window), QString(), wrong);
    return wrong.join(u'\n');
}

TEST(Accessibility, EveryControlOfEveryWindowHasARoleAndAName)
{
    QAccessible::setActive(true);
    const JobFolder folder;
    folder.put("a.json", lineJob());
    Desk desk;
    desk.answer = MessageAnswer::No;
    desk.application->AddToRecentFileList(folder.path("a.json"));
    EXPECT_EQ(wrongOf(*desk.frame).toStdString(), "") << "the start page";
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    ASSERT_TRUE(desk.frame->OnCommand(findCommand));
    EXPECT_EQ(wrongOf(*desk.frame).toStdString(), "") << "a report with the find bar";
    ASSERT_TRUE(desk.frame->OnCommand(goToPageCommand));
    EXPECT_EQ(wrongOf(*desk.frame).toStdString(), "") << "the page bar";
    desk.keepReportWindows();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    EXPECT_EQ(wrongOf(*desk.frame).toStdString(), "") << "the report window";
    PreferencesDialog preferences(loadPreferences());
    auto *tabs = preferences.findChild<QTabWidget *>();
    for (int tab = 0; tab < tabs->count(); ++tab) {
        tabs->setCurrentIndex(tab);
        EXPECT_EQ(wrongOf(preferences).toStdString(), "") << "preferences " << tab;
    }
    TemplateDialog fromTemplate;
    EXPECT_EQ(wrongOf(fromTemplate).toStdString(), "") << "from template";
    PageSetup setup;
    PageSetupDialog pageSetup(setup);
    EXPECT_EQ(wrongOf(pageSetup).toStdString(), "") << "page set-up";
    CommandList commands(listedCommands(*desk.frame->menuBar()));
    EXPECT_EQ(wrongOf(commands).toStdString(), "") << "commands";
    HelpWindow help;
    help.showPlace(QStringLiteral("guide-batch.md"));
    EXPECT_EQ(wrongOf(help).toStdString(), "") << "guide";
    AboutDialog about;
    EXPECT_EQ(wrongOf(about).toStdString(), "") << "about";
}

TEST(Accessibility, AReportIsReadLineByLine)
{
    QAccessible::setActive(true);
    const JobFolder folder;
    QByteArray text = "\xEF\xBB\xBF";
    for (int line = 1; line <= 200; ++line) {
        text += "Point " + QByteArray::number(line) + "   12.345\r\r\n";
    }
    folder.put("a.rep", text);
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    auto &edit = dynamic_cast<UReportView *>(desk.frame->GetActiveView())->GetEdit();
    QAccessibleInterface *shown = QAccessible::queryAccessibleInterface(&edit);
    ASSERT_NE(shown, nullptr);
    EXPECT_EQ(shown->role(), QAccessible::EditableText);
    EXPECT_FALSE(shown->text(QAccessible::Name).isEmpty());
    QAccessibleTextInterface *lines = shown->textInterface();
    ASSERT_NE(lines, nullptr);
    int offset = 0;
    for (int line = 1; line <= 200; ++line) {
        int start = -1;
        int end = -1;
        const QString read = lines->textAtOffset(offset, QAccessible::LineBoundary, &start, &end);
        EXPECT_EQ(read.trimmed(), QStringLiteral("Point %1   12.345").arg(line)) << line;
        EXPECT_EQ(start, offset);
        ASSERT_GT(end, offset) << line;
        offset = start + int(read.trimmed().size()) + 1;
    }
    // The cursor, which a screen reader follows, tells its line.
    QTest::keyClick(&edit, Qt::Key_Down);
    int start = -1;
    int end = -1;
    EXPECT_EQ(lines->textAtOffset(lines->cursorPosition(), QAccessible::LineBoundary, &start, &end).trimmed(),
              QStringLiteral("Point 2   12.345"));
}

TEST(Accessibility, EveryPartOfTheMainWindowIsReachedWithTheTabKey)
{
    Desk desk;
    desk.frame->activateWindow();
    ASSERT_TRUE(QTest::qWaitFor([] { return QApplication::focusWidget() != nullptr; }));
    std::set<QString> reached;
    for (int press = 0; press < 20; ++press) {
        reached.insert(QApplication::focusWidget()->accessibleName());
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    }
    for (const char *name : {"Start", "Examples"}) {
        EXPECT_EQ(reached.count(QString::fromLatin1(name)), 1U) << name;
    }
}

} // namespace
