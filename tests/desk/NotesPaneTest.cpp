#include "TableDesk.h"

#include "CommandLine.h"
#include "DeskCommandIds.h"
#include "FilePlace.h"
#include "NotesPane.h"
#include "OpenTemplate.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"

#include <QDialog>
#include <QLabel>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QStatusBar>
#include <QTextBlock>
#include <QToolButton>
#include <QTreeWidget>

#include <gtest/gtest.h>

namespace
{

/// A desk with a report that has notes: an unknown column, and values that are too wide.
class NotedDesk : public TableDesk
{
public:
    NotedDesk()
    {
        QByteArray rows = "Number,North,Nort\n";
        for (int row = 1; row <= 100; ++row) {
            rows += QByteArray::number(row) + (row == 90 ? ",123456789.5,1\n" : ",5,1\n");
        }
        folder.put("p.csv", rows);
        report = open();
        frame->runs().showFront();
    }

    kareport::NotesPane &pane() { return frame->runs().notesPane(); }
    QTreeWidget &list() { return pane().list(); }
    /// The row of a kind of notes; null without one.
    QTreeWidgetItem *row(const char *kind)
    {
        return list().findItems(QString::fromUtf8(kind), Qt::MatchExactly).value(0);
    }
    QDialog *filePlace() const
    {
        for (QDialog *dialog : frame->findChildren<QDialog *>()) {
            if (dialog->isVisible() && dialog->findChild<QPlainTextEdit *>() != nullptr) {
                return dialog;
            }
        }
        return nullptr;
    }

    UReportDoc *report = nullptr;
};

TEST(NotesPane, IsNotPutAmongTheReports)
{
    NotedDesk desk;
    desk.pane().open();
    EXPECT_FALSE(desk.pane().isAreaAllowed(Qt::TopDockWidgetArea))
        << "where it would hide the report with the keyboard";
    for (const auto area : {Qt::LeftDockWidgetArea, Qt::RightDockWidgetArea, Qt::BottomDockWidgetArea}) {
        EXPECT_TRUE(desk.pane().isAreaAllowed(area));
    }
}

TEST(NotesPane, ListsWhatThereIsToSay)
{
    NotedDesk desk;
    ASSERT_NE(desk.report, nullptr);
    EXPECT_TRUE(desk.messages.isEmpty()) << "there is nothing to answer";
    EXPECT_TRUE(desk.pane().isVisible());
    ASSERT_EQ(desk.pane().count(), 2);
    const QTreeWidgetItem *column = desk.row("Unknown column");
    ASSERT_NE(column, nullptr);
    EXPECT_TRUE(column->text(1).contains(QStringLiteral("\"Nort\"")));
    EXPECT_EQ(column->text(2), QString());
    EXPECT_EQ(column->text(3), QStringLiteral("p.csv:1:14"));
    const QTreeWidgetItem *wide = desk.row("Value too wide");
    ASSERT_NE(wide, nullptr);
    EXPECT_GT(wide->text(2).toInt(), 90);
    EXPECT_EQ(wide->text(3), QStringLiteral("p.csv:91:4"));
    const auto *count = desk.frame->statusBar()->findChild<QToolButton *>();
    ASSERT_NE(count, nullptr);
    EXPECT_EQ(count->text(), QStringLiteral("2 notes"));
    EXPECT_TRUE(count->isVisible());

    desk.putRows(3);
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(desk.pane().count(), 0) << "the list empties with the next run";
    EXPECT_FALSE(count->isVisible());
}

TEST(NotesPane, AClickGoesToTheLineOfTheReport)
{
    NotedDesk desk;
    QTreeWidgetItem *wide = desk.row("Value too wide");
    ASSERT_NE(wide, nullptr);
    const QRect place = desk.list().visualItemRect(wide);
    QTest::mouseClick(desk.list().viewport(), Qt::LeftButton, {}, place.center());
    const kareport::ReportEdit &edit = TableDesk::viewOf(*desk.report)->GetEdit();
    EXPECT_TRUE(edit.textCursor().block().text().contains(QStringLiteral("123456789.500")))
        << edit.textCursor().block().text().toStdString();
    EXPECT_EQ(edit.textCursor().blockNumber() + 1, wide->text(2).toInt());
    EXPECT_EQ(desk.filePlace(), nullptr);
}

TEST(NotesPane, EnterGoesToThePlaceInTheFileWhereThereIsNoLine)
{
    NotedDesk desk;
    ASSERT_TRUE(desk.frame->OnCommand(kareport::goToNotesCommand));
    QTreeWidgetItem *column = desk.row("Unknown column");
    ASSERT_NE(column, nullptr);
    desk.list().setCurrentItem(column);
    QTest::keyClick(&desk.list(), Qt::Key_Return);
    QDialog *shown = desk.filePlace();
    ASSERT_NE(shown, nullptr);
    const auto *text = shown->findChild<QPlainTextEdit *>();
    EXPECT_TRUE(text->isReadOnly());
    EXPECT_EQ(text->textCursor().block().text(), QStringLiteral("  1  Number,North,Nort"));
    EXPECT_EQ(text->textCursor().selectedText(), QStringLiteral("Nort"));
    QTest::keyClick(shown, Qt::Key_Escape);
    EXPECT_FALSE(shown->isVisible());
}

TEST(NotesPane, ANoteOnAValueHasBothPlaces)
{
    NotedDesk desk;
    desk.list().setCurrentItem(desk.row("Value too wide"));
    QPushButton *file = nullptr;
    for (QPushButton *button : desk.pane().findChildren<QPushButton *>()) {
        EXPECT_TRUE(button->isEnabled()) << button->text().toStdString();
        file = button;
    }
    ASSERT_NE(file, nullptr);
    QTest::mouseClick(file, Qt::LeftButton);
    ASSERT_NE(desk.filePlace(), nullptr);
    const auto *text = desk.filePlace()->findChild<QPlainTextEdit *>();
    EXPECT_EQ(text->textCursor().block().text(), QStringLiteral(" 91  90,123456789.5,1"));
}

TEST(NotesPane, APlaceInATemplateOpensItsEditor)
{
    TableDesk desk;
    QByteArray text = desk.folder.bytesOf("t.xml");
    desk.folder.put("t.xml", text.replace("<Field><VariableName>North<", "\n<Field><VariableName>Norht<"));
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    desk.frame->runs().showFront();
    QTreeWidget &list = desk.frame->runs().notesPane().list();
    QTreeWidgetItem *field = list.findItems(QStringLiteral("Field without data"), Qt::MatchExactly).value(0);
    ASSERT_NE(field, nullptr);
    EXPECT_TRUE(field->text(3).startsWith(QStringLiteral("t.xml:2:"))) << field->text(3).toStdString();
    list.setCurrentItem(field);
    QTest::keyClick(&list, Qt::Key_Return);
    kareport::TemplateWindow *editor = nullptr;
    for (QWidget *window : QApplication::topLevelWidgets()) {
        auto *found = dynamic_cast<kareport::TemplateWindow *>(window);
        editor = found != nullptr && window->isVisible() ? found : editor;
    }
    ASSERT_NE(editor, nullptr);
    EXPECT_EQ(editor->edit().textCursor().blockNumber(), 1);
    kareport::dropTemplateEditors();
}

TEST(NotesPane, ShowsTheNotesOfTheReportInFront)
{
    NotedDesk desk;
    desk.folder.put("line.json", lineJob());
    ASSERT_NE(desk.open("line.json"), nullptr);
    desk.frame->runs().showFront();
    EXPECT_EQ(desk.pane().count(), 0);
    ASSERT_TRUE(desk.frame->OnCommand(kareport::previousReportCommand));
    desk.frame->runs().showFront();
    EXPECT_EQ(desk.pane().count(), 2);
    desk.report->OnCloseDocument();
    desk.frame->runs().showFront();
    EXPECT_EQ(desk.pane().count(), 0);
}

TEST(NotesPane, ThePaneIsHiddenByACommand)
{
    NotedDesk desk;
    ASSERT_TRUE(desk.frame->OnCommand(kareport::viewNotesCommand));
    EXPECT_FALSE(desk.pane().isVisible());
    ASSERT_TRUE(desk.frame->OnCommand(kareport::viewNotesCommand));
    EXPECT_TRUE(desk.pane().isVisible());
    desk.frame->close();
    desk.frame.reset();
    desk.frame.emplace(); // without a place in the layout that nothing is in
    desk.frame->show();
    EXPECT_EQ(desk.pane().count(), 0);
}

TEST(FilePlace, ReadsNoMoreThanAWindowNeeds)
{
    const JobFolder folder;
    QByteArray lines;
    for (int line = 1; line <= 5000; ++line) {
        lines += "line " + QByteArray::number(line) + (line % 2 == 0 ? "\r\n" : "\n");
    }
    folder.put("a.txt", lines + QByteArray(50'000, 'x') + "\nlast");
    kareport::FileLines read;
    ASSERT_TRUE(kareport::readLinesAround(folder.path("a.txt"), 3000, read));
    EXPECT_EQ(read.first, 2500);
    EXPECT_EQ(read.lines.size(), 1001);
    EXPECT_EQ(read.lines.front(), QStringLiteral("line 2500"));
    EXPECT_FALSE(read.isWhole);
    ASSERT_TRUE(kareport::readLinesAround(folder.path("a.txt"), 5002, read)) << "after a line that is cut";
    EXPECT_EQ(read.lines.back(), QStringLiteral("last"));
    EXPECT_LT(read.lines[read.lines.size() - 2].size(), 50'000);
    EXPECT_TRUE(read.isWhole);
    EXPECT_FALSE(kareport::readLinesAround(folder.path("a.txt"), 5003, read));
    EXPECT_FALSE(kareport::readLinesAround(folder.path("a.txt"), 0, read));
    EXPECT_FALSE(kareport::readLinesAround(folder.path("gone.txt"), 1, read));
    EXPECT_FALSE(kareport::readLinesAround(folder.path(), 1, read)) << "a folder";
}

TEST(NotesPane, GivesTheKeyboardBackToTheReport)
{
    struct Row
    {
        void (*leave)(NotedDesk &desk);
        bool isOpen; ///< afterwards
        const char *reason;
    };
    constexpr Row rows[] = {
        {[](NotedDesk &desk) { QTest::keyClick(&desk.list(), Qt::Key_Escape); }, true, "Escape"},
        {[](NotedDesk &desk) { desk.pane().close(); }, false, "its close button"},
        {[](NotedDesk &desk) { desk.frame->OnCommand(kareport::viewNotesCommand); }, false, "View > Notes"},
    };
    NotedDesk desk;
    ASSERT_NE(desk.report, nullptr);
    for (const Row &row : rows) {
        desk.frame->OnCommand(kareport::goToNotesCommand);
        ASSERT_TRUE(desk.list().hasFocus()) << row.reason;
        row.leave(desk);
        EXPECT_EQ(desk.pane().isVisible(), row.isOpen) << row.reason;
        const auto *view = dynamic_cast<const UReportView *>(desk.frame->GetActiveView());
        ASSERT_NE(view, nullptr) << row.reason;
        EXPECT_TRUE(view->GetEdit().hasFocus()) << row.reason;
    }
}

} // namespace
