#include "OpenedTemplate.h"

#include "TemplateDialog.h"
#include "TemplateFindBar.h"

#include <QAbstractItemView>
#include <QCheckBox>
#include <QComboBox>
#include <QCompleter>
#include <QHelpEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenuBar>
#include <QPushButton>
#include <QTextBlock>
#include <QToolTip>
#include <QTreeWidget>

#include <gtest/gtest.h>

namespace
{

using kareport::TemplateWindow;

TEST(TemplateWindow, ATemplateOpensBesideItsPages)
{
    OpenedTemplate opened;
    EXPECT_TRUE(opened.pages().contains(QStringLiteral("North"))) << opened.pages().toStdString();
    EXPECT_TRUE(opened.remarks().isEmpty()) << opened.remarks().join(u'\n').toStdString();
    EXPECT_FALSE(opened.window->isWindowModified());
    EXPECT_TRUE(opened.desk.frame->OpenFile(opened.folder.path("t.xml")));
    int windows = 0;
    for (QWidget *widget : QApplication::topLevelWidgets()) {
        windows += dynamic_cast<TemplateWindow *>(widget) != nullptr ? 1 : 0;
    }
    EXPECT_EQ(windows, 1) << "a template that is open comes to the front";
    EXPECT_TRUE(kareport::openTemplateAt(opened.folder.path("t.xml"), 2, 3));
    EXPECT_EQ(opened.window->edit().textCursor().blockNumber(), 1);
    EXPECT_EQ(opened.window->edit().textCursor().positionInBlock(), 2);
    EXPECT_FALSE(kareport::openTemplateAt(opened.folder.path("none.xml")));
    EXPECT_EQ(opened.desk.messages.size(), 1);
}

TEST(TemplateWindow, ThePagesFollowWhatIsTyped)
{
    OpenedTemplate opened;
    const QString before = opened.pages();
    opened.putAfter("<Label>North");
    opened.type("XYZ");
    opened.settle();
    EXPECT_TRUE(opened.pages().contains(QStringLiteral("NorthXYZ"))) << opened.pages().toStdString();
    EXPECT_TRUE(opened.window->isWindowModified());
    opened.window->edit().undo();
    opened.settle();
    EXPECT_EQ(opened.pages(), before);
    EXPECT_FALSE(opened.window->isWindowModified());
}

TEST(TemplateWindow, TheLastGoodPagesStandWhileTheTextIsBroken)
{
    OpenedTemplate opened;
    const QString before = opened.pages();
    EXPECT_TRUE(opened.window->message().isHidden());
    opened.putAfter("<Use>");
    opened.type("x");
    opened.settle();
    EXPECT_EQ(opened.pages(), before);
    EXPECT_FALSE(opened.window->message().isHidden());
    EXPECT_FALSE(opened.remarks().isEmpty());
    EXPECT_FALSE(opened.window->edit().remarks().empty());
    opened.window->edit().undo();
    opened.settle();
    EXPECT_TRUE(opened.window->message().isHidden()) << opened.window->message().text().toStdString();
    EXPECT_TRUE(opened.remarks().isEmpty());
}

TEST(TemplateWindow, AClickOnThePageGoesToTheField)
{
    OpenedTemplate opened;
    auto &page = opened.window->page();
    const qsizetype at = opened.pages().indexOf(QStringLiteral("North"));
    ASSERT_GE(at, 0);
    QTextCursor cursor(page.document());
    cursor.setPosition(static_cast<int>(at) + 2);
    page.setTextCursor(cursor);
    QTest::mouseClick(page.viewport(), Qt::LeftButton, Qt::NoModifier, page.cursorRect().center());
    EXPECT_EQ(opened.window->edit().textCursor().selectedText(), QStringLiteral("North"));
    const QString text = opened.text();
    const qsizetype label = text.indexOf(QStringLiteral("<Label>North"));
    EXPECT_EQ(opened.window->edit().textCursor().selectionStart(), label + 7);
    EXPECT_GT(page.markedCount(), 5) << "the label and every value of the column";

    opened.putAfter("<Use>");
    EXPECT_EQ(page.markedCount(), 0);
    opened.putAfter("<Label>North");
    EXPECT_GT(page.markedCount(), 5);

    cursor.setPosition(static_cast<int>(at) + 2);
    page.setTextCursor(cursor);
    opened.putAfter("<Use>");
    page.setFocus();
    QTest::keyClick(&page, Qt::Key_Return);
    EXPECT_EQ(opened.window->edit().textCursor().selectionStart(), label + 7) << "by the keyboard as well";
}

TEST(TemplateWindow, RemarksAreUnderTheWordsAndInTheList)
{
    OpenedTemplate opened;
    opened.putAfter("<Type>");
    opened.type("Z");
    opened.settle();
    ASSERT_FALSE(opened.remarks().isEmpty());
    auto &edit = opened.window->edit();
    const kareport::TextRange range = edit.remarks().front().range;
    EXPECT_NE(edit.remarkAt(range.begin), nullptr);
    opened.putAfter("<Use>");
    QTest::keyClick(&edit, Qt::Key_F8);
    EXPECT_EQ(edit.textCursor().selectionStart(), range.begin);
    opened.putAfter("<Use>");
    Q_EMIT opened.window->remarks().itemActivated(opened.window->remarks().topLevelItem(0), 0);
    EXPECT_EQ(edit.textCursor().selectionStart(), range.begin);
    const QPoint place = edit.cursorRect().center();
    QHelpEvent help(QEvent::ToolTip, place, edit.viewport()->mapToGlobal(place));
    QApplication::sendEvent(edit.viewport(), &help);
    EXPECT_TRUE(QToolTip::text().contains(edit.remarks().front().text.left(8))) << QToolTip::text().toStdString();
    QToolTip::hideText();
}

TEST(TemplateWindow, OffersWhatCanBeWritten)
{
    OpenedTemplate opened;
    auto &edit = opened.window->edit();
    opened.putAfter("<Tables>");
    opened.type("<");
    ASSERT_TRUE(edit.completer().popup()->isVisible());
    EXPECT_EQ(edit.completer().currentCompletion(), QStringLiteral("Table"));
    QTest::keyClick(edit.completer().popup(), Qt::Key_Return);
    EXPECT_TRUE(opened.text().contains(QStringLiteral("<Tables><Table></Table>"))) << opened.text().toStdString();
    edit.undo();
    edit.undo();
    opened.putAfter("<Type>");
    opened.choose("Complete");
    EXPECT_GT(edit.completer().completionCount(), 10);
    QTest::keyClick(edit.completer().popup(), Qt::Key_Escape);
    EXPECT_FALSE(edit.completer().popup()->isVisible());
}

TEST(TemplateWindow, CommandsInsertAndRenameInOneStep)
{
    OpenedTemplate opened;
    const QString before = opened.text();
    struct Row
    {
        const char *command;
        const char *inserted;
    };
    for (const Row &row : {Row{"Field", "<Field>"}, Row{"Table", "<Name>Table1</Name>"},
                           Row{"Block", "<Name>Block1</Name>"}, Row{"Dictionary", "<DictionaryName>Dictionary1"}})
    {
        opened.putAfter("<Label>North");
        const qsizetype count = before.count(QString::fromLatin1(row.inserted));
        opened.choose(row.command);
        EXPECT_GT(opened.text().count(QString::fromLatin1(row.inserted)), count) << row.command;
        opened.settle();
        EXPECT_TRUE(opened.remarks().isEmpty()) << row.command << opened.remarks().join(u'\n').toStdString();
        opened.window->edit().undo();
        EXPECT_EQ(opened.text(), before) << row.command;
    }
    opened.putAfter("<VariableName>North");
    QString proposed;
    opened.window->askNewName = [&proposed](const QString &name) {
        proposed = name;
        return std::optional(QStringLiteral("Ordinate"));
    };
    opened.choose("Rename Variable...");
    EXPECT_EQ(proposed, QStringLiteral("Northing"));
    EXPECT_FALSE(opened.text().contains(QStringLiteral("<VariableName>Northing")));
    opened.settle();
    EXPECT_TRUE(opened.remarks().isEmpty());
    opened.window->edit().undo();
    EXPECT_EQ(opened.text(), before);
    opened.putAfter("<Title>");
    EXPECT_FALSE(opened.command("Field")->isEnabled()) << "there is no table at the cursor";
}

TEST(TemplateWindow, FindsAndReplaces)
{
    OpenedTemplate opened;
    const QString before = opened.text();
    opened.choose("Find and Replace...");
    auto &bar = opened.window->findBar();
    ASSERT_TRUE(bar.isVisible());
    bar.field().setText(QStringLiteral("<variablename>"));
    const qsizetype count = before.count(QStringLiteral("<VariableName>"));
    EXPECT_TRUE(bar.count().text().contains(QString::number(count)));
    QTest::keyClick(&bar.field(), Qt::Key_Return);
    EXPECT_EQ(opened.window->edit().textCursor().selectedText(), QStringLiteral("<VariableName>"));
    const int first = opened.window->edit().textCursor().selectionStart();
    opened.choose("Find Next");
    EXPECT_GT(opened.window->edit().textCursor().selectionStart(), first);
    opened.choose("Find Previous");
    EXPECT_EQ(opened.window->edit().textCursor().selectionStart(), first);
    bar.matchCase().setChecked(true);
    EXPECT_TRUE(bar.count().text().contains(u'0'));
    EXPECT_FALSE(bar.findNext());
    bar.matchCase().setChecked(false);
    bar.replacement().setText(QStringLiteral("<V>"));
    bar.replaceAll();
    EXPECT_EQ(opened.text().count(QStringLiteral("<V>")), count);
    opened.window->edit().undo();
    EXPECT_EQ(opened.text(), before) << "in one step";
    bar.findNext();
    bar.replace();
    EXPECT_EQ(opened.text().count(QStringLiteral("<V>")), 1);
    QTest::keyClick(&bar.field(), Qt::Key_Escape);
    EXPECT_FALSE(bar.isVisible());
}

TEST(TemplateWindow, SavesTheBytesThatWereNotEdited)
{
    QByteArray content = controlTemplates();
    content.replace("\n", "\r\n");
    content = "\xEF\xBB\xBF<!-- caf\xC3\xA9 -->\n" + content; // one line of its own kind
    OpenedTemplate opened(content);
    EXPECT_TRUE(opened.window->save());
    EXPECT_EQ(opened.folder.bytesOf("t.xml"), content);
    opened.putAfter("<Label>North");
    opened.type("2");
    EXPECT_TRUE(opened.window->isWindowModified());
    opened.choose("Save");
    EXPECT_FALSE(opened.window->isWindowModified());
    QByteArray expected = content;
    expected.replace("<Label>North", "<Label>North2");
    EXPECT_EQ(opened.folder.bytesOf("t.xml"), expected);
    opened.window->askSaveName = [&] { return std::optional(opened.folder.path("copy.xml")); };
    opened.choose("Save As...");
    EXPECT_EQ(opened.folder.bytesOf("copy.xml"), expected);
    EXPECT_EQ(opened.window->path(), opened.folder.path("copy.xml"));
}

TEST(TemplateWindow, ClosingAsksAboutChanges)
{
    OpenedTemplate opened;
    opened.putAfter("<Label>North");
    opened.type("2");
    opened.desk.answer = MessageAnswer::Cancel;
    EXPECT_FALSE(opened.window->close());
    EXPECT_FALSE(opened.desk.frame->close()) << "the program stays open with it";
    EXPECT_EQ(opened.desk.messages.size(), 2);
    opened.desk.answer = MessageAnswer::Yes;
    EXPECT_TRUE(opened.window->close());
    EXPECT_TRUE(opened.folder.bytesOf("t.xml").contains("<Label>North2"));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_EQ(windowOf(opened.folder.path("t.xml")), nullptr);
}

TEST(TemplateWindow, AFileThatChangesIsLoadedAgainWhenTheUserWants)
{
    OpenedTemplate opened;
    opened.desk.answer = MessageAnswer::Yes;
    QByteArray content = opened.folder.bytesOf("t.xml");
    content.replace("<Label>North", "<Label>Elsewhere");
    opened.folder.put("t.xml", content);
    EXPECT_TRUE(QTest::qWaitFor([&] { return opened.text().contains(QStringLiteral("Elsewhere")); }, 10'000));
    EXPECT_EQ(opened.desk.messages.size(), 1);
    EXPECT_FALSE(opened.window->isWindowModified());
    opened.settle();
    EXPECT_TRUE(opened.pages().contains(QStringLiteral("Elsewhere")));
}

TEST(TemplateWindow, ShowsTheDataOfAJobAndRemembersIt)
{
    OpenedTemplate opened;
    auto &choice = opened.window->dataChoice();
    EXPECT_EQ(choice.currentIndex(), 0);
    const int job = choice.findText(QStringLiteral("job.json"));
    ASSERT_GE(job, 0) << "a job of the folder that uses the template";
    EXPECT_LT(choice.findText(QStringLiteral("other.json")), 0);
    choice.setCurrentIndex(job);
    Q_EMIT choice.activated(job);
    opened.settle();
    const QString shown = opened.pages().trimmed();
    const QString whole = QString::fromUtf8(opened.folder.run("render job.json -o -").out).trimmed();
    EXPECT_EQ(shown.toStdString(), whole.toStdString()) << opened.window->message().text().toStdString();
    QByteArray points = opened.folder.bytesOf("points.csv");
    const qsizetype last = points.trimmed().lastIndexOf('\n') + 1;
    opened.folder.put("points.csv", points + points.mid(last));
    EXPECT_TRUE(QTest::qWaitFor([&] { return opened.pages().trimmed() != shown; }, 10'000))
        << "data that changes is read again";
    opened.window->close();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    EXPECT_TRUE(kareport::openTemplateAt(opened.folder.path("t.xml")));
    opened.window = windowOf(opened.folder.path("t.xml"));
    EXPECT_EQ(opened.window->data().file, opened.folder.path("job.json"));
}

TEST(TemplateWindow, ADataFileIsWrittenThroughTheTableOfTheCursor)
{
    OpenedTemplate opened;
    opened.putAfter("<Label>North");
    opened.window->askData = [&] { return std::optional(opened.folder.path("points.csv")); };
    opened.choose("Choose Data...");
    opened.settle();
    EXPECT_TRUE(opened.window->message().isHidden()) << opened.window->message().text().toStdString();
    EXPECT_EQ(opened.window->data().table, QStringLiteral("Points"));
    opened.window->askData = [&] { return std::optional(opened.folder.path("none.csv")); };
    opened.choose("Choose Data...");
    opened.settle();
    EXPECT_FALSE(opened.window->message().isHidden());
}

TEST(TemplateWindow, TheTemplateDialogOpensTheEditor)
{
    const Desk desk;
    const CommandLineFolder folder;
    kareport::TemplateDialog dialog;
    dialog.setTemplateFile(folder.path("t.xml"));
    for (auto *button : dialog.findChildren<QPushButton *>()) {
        if (QString(button->text()).remove(u'&') == u"Edit Template") {
            button->click();
        }
    }
    EXPECT_NE(windowOf(folder.path("t.xml")), nullptr);
}

TEST(TemplateWindow, EveryControlHasANameAndAKeyboardWay)
{
    OpenedTemplate opened;
    opened.choose("Find and Replace...");
    for (const QWidget *widget : opened.window->findChildren<QWidget *>()) {
        const bool isControl = widget->focusPolicy() != Qt::NoFocus && widget->isVisible() &&
                               !widget->objectName().startsWith(u"qt_") && widget->parentWidget() != nullptr &&
                               qobject_cast<const QMenuBar *>(widget) == nullptr;
        if (isControl && qobject_cast<const QAbstractButton *>(widget) == nullptr) {
            EXPECT_FALSE(widget->accessibleName().isEmpty() && widget->accessibleDescription().isEmpty())
                << widget->metaObject()->className() << ' ' << widget->objectName().toStdString();
        }
    }
    opened.window->edit().setFocus();
    opened.window->activateWindow();
    EXPECT_TRUE(QTest::qWaitForWindowActive(opened.window));
    opened.choose("Text, Pages, Remarks");
    EXPECT_TRUE(opened.window->page().hasFocus());
    opened.choose("Text, Pages, Remarks");
    EXPECT_TRUE(opened.window->remarks().hasFocus());
    opened.choose("Text, Pages, Remarks");
    EXPECT_TRUE(opened.window->edit().hasFocus());
}

} // namespace
