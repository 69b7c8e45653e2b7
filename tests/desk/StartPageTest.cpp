#include "DeskFixture.h"

#include "DeskCommandIds.h"
#include "ReportEdit.h"
#include "ShippedExamples.h"
#include "StartPage.h"
#include "UReportView.h"

#include <QDir>
#include <QDropEvent>
#include <QFile>
#include <QFileInfo>
#include <QMimeData>
#include <QUrl>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

StartPage &pageOf(const Desk &desk)
{
    return *dynamic_cast<StartPage *>(desk.frame->centralWidget());
}

void settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

void dropOn(QWidget &widget, const QMimeData &data)
{
    QDragEnterEvent enter(QPoint(9, 9), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&widget, &enter);
    EXPECT_TRUE(enter.isAccepted());
    QDropEvent drop(QPointF(9, 9), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&widget, &drop);
}

QString accessibleTextOf(const EntryList &list, int row)
{
    return list.item(row)->data(Qt::AccessibleTextRole).toString();
}

TEST(StartPage, StandsWhereNothingIsOpenAndGoesWithTheFirstReport)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    settle();
    EXPECT_TRUE(pageOf(desk).isVisible());
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    settle();
    EXPECT_FALSE(pageOf(desk).isVisible());
    const auto docks = desk.frame->findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    ASSERT_EQ(docks.size(), 1);
    EXPECT_GE(docks.front()->width(), desk.frame->width() - 4) << "the report has all the room";
    EXPECT_GE(docks.front()->height(), desk.frame->height() / 2);
    ASSERT_TRUE(desk.frame->OnCommand(fileCloseCommand));
    settle();
    EXPECT_TRUE(pageOf(desk).isVisible()) << "and comes back with the last one";
}

TEST(StartPage, ListsRecentFilesWithTheirPlaceAndGreysWhatIsGone)
{
    const JobFolder folder;
    folder.put("there.rep", savedText("TALVEN"));
    folder.put("<b>gone.rep", savedText("TALVEN"));
    Desk desk;
    desk.application->AddToRecentFileList(folder.path("there.rep"));
    desk.application->AddToRecentFileList(folder.path("<b>gone.rep"));
    QFile::remove(folder.path("<b>gone.rep"));
    pageOf(desk).refresh();
    EntryList &recent = pageOf(desk).recentList();
    ASSERT_EQ(recent.count(), 2);
    EXPECT_EQ(recent.item(0)->text(), QStringLiteral("<b>gone.rep")) << "a name is not markup";
    EXPECT_TRUE(accessibleTextOf(recent, 0).endsWith(QStringLiteral("not there")));
    EXPECT_TRUE(accessibleTextOf(recent, 1).contains(folder.path())) << accessibleTextOf(recent, 1).toStdString();
    const QString time =
        QLocale::system().toString(QFileInfo(folder.path("there.rep")).lastModified(), QLocale::ShortFormat);
    EXPECT_TRUE(accessibleTextOf(recent, 1).endsWith(time));
    const QImage shown = recent.grab().toImage();
    EXPECT_FALSE(shown.isNull());

    QTest::mouseClick(recent.viewport(), Qt::LeftButton, Qt::NoModifier,
                      recent.visualItemRect(recent.item(1)).center());
    settle();
    ASSERT_EQ(Desk::reports().size(), 1U) << "one click opens";
    EXPECT_EQ(Desk::reports().front()->GetPathName(), folder.path("there.rep"));
}

TEST(StartPage, IsUsedByKeys)
{
    const JobFolder folder;
    folder.put("a.rep", savedText("A"));
    folder.put("b.rep", savedText("B"));
    Desk desk;
    desk.application->AddToRecentFileList(folder.path("a.rep"));
    desk.application->AddToRecentFileList(folder.path("b.rep"));
    StartPage &page = pageOf(desk);
    page.refresh();
    desk.frame->activateWindow();
    page.takeKeyboard();
    ASSERT_TRUE(QTest::qWaitFor([&page] { return page.recentList().hasFocus(); }));
    EXPECT_EQ(page.recentList().currentRow(), 0);
    QTest::keyClick(&page.recentList(), Qt::Key_Left);
    EXPECT_TRUE(page.commandList().hasFocus());
    EXPECT_EQ(page.commandList().currentRow(), 0);
    QTest::keyClick(&page.commandList(), Qt::Key_Right);
    QTest::keyClick(&page.recentList(), Qt::Key_Right);
    EXPECT_TRUE(page.exampleList().hasFocus());
    QTest::keyClick(&page.exampleList(), Qt::Key_Left);
    QTest::keyClick(&page.recentList(), Qt::Key_Down);
    QTest::keyClick(&page.recentList(), Qt::Key_Return);
    settle();
    ASSERT_EQ(Desk::reports().size(), 1U);
    EXPECT_EQ(Desk::reports().front()->GetPathName(), folder.path("a.rep")) << "the second one";
}

TEST(StartPage, ItsCommandsAreThoseOfTheMenus)
{
    Desk desk;
    int asked = 0;
    desk.frame->askFile = [&asked]() -> std::optional<QString> {
        ++asked;
        return std::nullopt;
    };
    EntryList &commands = pageOf(desk).commandList();
    ASSERT_GE(commands.count(), 4);
    EXPECT_EQ(commands.item(0)->text(), QStringLiteral("Open..."));
    EXPECT_TRUE(accessibleTextOf(commands, 0).contains(QStringLiteral("Ctrl+O")));
    commands.setCurrentRow(0);
    QTest::keyClick(&commands, Qt::Key_Return);
    settle();
    EXPECT_EQ(asked, 1);
}

TEST(StartPage, AnExampleIsOpenedAsUntitledWorkAndNothingIsWrittenBesideIt)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    EntryList &examples = pageOf(desk).exampleList();
    ASSERT_GE(examples.count(), 20);
    const QStringList before = QDir(examplesFolder()).entryList(QDir::Files | QDir::Dirs);
    const auto found = examples.findItems(QStringLiteral("Control points, Kestrel Bay"), Qt::MatchExactly);
    ASSERT_FALSE(found.isEmpty());
    examples.setCurrentItem(found.front());
    QTest::keyClick(&examples, Qt::Key_Enter);
    settle();
    ASSERT_EQ(Desk::reports().size(), 1U) << desk.messages.join(u'\n').toStdString();
    const UReportDoc *report = Desk::reports().front();
    EXPECT_TRUE(report->GetPathName().isEmpty());
    EXPECT_FALSE(report->IsEmpty());
    EXPECT_TRUE(UApplication::Get()->GetRecentFileList().isEmpty()) << "it is not a file of the user's";
    SaveRequest asked;
    desk.frame->askExportFile = [&asked](const SaveRequest &request) -> std::optional<SaveChoice> {
        asked = request;
        return std::nullopt;
    };
    ASSERT_TRUE(desk.frame->OnCommand(exportPdfCommand));
    EXPECT_FALSE(asked.fileName.isEmpty());
    EXPECT_FALSE(asked.fileName.startsWith(examplesFolder())) << asked.fileName.toStdString();
    EXPECT_EQ(QDir(examplesFolder()).entryList(QDir::Files | QDir::Dirs), before);
}

TEST(StartPage, DataThatIsDroppedAnywhereIsProposedForANewReport)
{
    const JobFolder folder;
    folder.put("points.csv", "Number\n1\n");
    folder.put("a.rep", savedText("TALVEN"));
    Desk desk;
    QStringList proposed;
    desk.frame->askTemplate = [&proposed](const QString &file) -> std::optional<TemplateJob> {
        proposed.append(file);
        return std::nullopt;
    };
    QMimeData dropped;
    dropped.setUrls({QUrl::fromLocalFile(folder.path("points.csv")), QUrl::fromLocalFile(folder.path("a.rep"))});
    dropOn(*pageOf(desk).exampleList().viewport(), dropped);
    EXPECT_EQ(proposed, QStringList(folder.path("points.csv")));
    ASSERT_EQ(Desk::reports().size(), 1U);
    settle();

    // On the text of a report, which takes texts, as well.
    folder.put("b.rep", savedText("B"));
    dropped.setUrls({QUrl::fromLocalFile(folder.path("b.rep"))});
    dropOn(*dynamic_cast<UReportView *>(desk.frame->GetActiveView())->GetEdit().viewport(), dropped);
    EXPECT_EQ(Desk::reports().size(), 2U);
    EXPECT_EQ(Desk::textOf(*Desk::reports().front()), QStringLiteral("TALVEN\n")) << "its text stays";
}

} // namespace
