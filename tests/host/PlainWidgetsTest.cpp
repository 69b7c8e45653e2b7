#include "PlainWidgets.h"

#include "FrameFixture.h"
#include "PlainTabTips.h"
#include "PrintQt.h"
#include "TemporaryFolder.h"

#include <QDockWidget>
#include <QHelpEvent>
#include <QLabel>
#include <QMainWindow>
#include <QMenu>
#include <QMessageBox>
#include <QTabBar>
#include <QTest>
#include <QTimer>
#include <QToolTip>

#include <gtest/gtest.h>

namespace
{

const QString markup = QStringLiteral("<img src=\"file:///gone.png\"> & <b>bold</b>");

/// Answers the next message box by a key, and says what it looked like.
class AnsweredBox
{
public:
    explicit AnsweredBox(Qt::Key key)
    {
        QTimer::singleShot(0, &timer_, [this, key] {
            auto *box = qobject_cast<QMessageBox *>(QApplication::activeModalWidget());
            ASSERT_NE(box, nullptr);
            format = box->textFormat();
            text = box->text();
            caption = box->windowTitle();
            icon = box->icon();
            width = box->width();
            for (const QLabel *label : box->findChildren<QLabel *>()) {
                isPlain = isPlain && (label->text().isEmpty() || label->textFormat() == Qt::PlainText);
            }
            QTest::keyClick(box, key);
        });
    }

    Qt::TextFormat format = Qt::AutoText;
    QString text;
    QString caption;
    QMessageBox::Icon icon = QMessageBox::NoIcon;
    int width = 0;
    bool isPlain = true;

private:
    QTimer timer_;
};

TEST(PlainWidgets, AMessageIsShownToTheLetter)
{
    for (const MessageButtons buttons : {MessageButtons::Ok, MessageButtons::YesNo, MessageButtons::YesNoCancel}) {
        const AnsweredBox box(Qt::Key_Escape);
        kareport::showMessageBox(nullptr, {markup, markup, buttons, kareport::MessageIcon::None});
        EXPECT_EQ(box.text, markup);
        EXPECT_EQ(box.format, Qt::PlainText) << "a picture that a title names is not opened";
        EXPECT_TRUE(box.isPlain);
        EXPECT_EQ(box.caption, markup);
        EXPECT_GT(box.width, QFontMetrics(QMessageBox().font()).horizontalAdvance(markup)) << "all of it is seen";
    }
}

TEST(PlainWidgets, AMessageIsAnsweredByItsButtons)
{
    struct Row
    {
        MessageButtons buttons;
        Qt::Key key;
        MessageAnswer answer;
        const char *reason;
    };
    const Row rows[] = {
        {MessageButtons::Ok, Qt::Key_Return, MessageAnswer::Ok, "the only button"},
        {MessageButtons::Ok, Qt::Key_Escape, MessageAnswer::Ok, "there is nothing to refuse"},
        {MessageButtons::YesNo, Qt::Key_Return, MessageAnswer::Yes, "the first button"},
        {MessageButtons::YesNo, Qt::Key_Escape, MessageAnswer::Cancel, "no answer, least of all No"},
        {MessageButtons::YesNoCancel, Qt::Key_Return, MessageAnswer::Yes, "the first button"},
        {MessageButtons::YesNoCancel, Qt::Key_Escape, MessageAnswer::Cancel, "its own button"},
    };
    for (const Row &row : rows) {
        const AnsweredBox box(row.key);
        EXPECT_EQ(kareport::showMessageBox(nullptr, {QStringLiteral("text"), QString(), row.buttons, {}}), row.answer)
            << row.reason;
        EXPECT_EQ(box.icon, row.buttons == MessageButtons::Ok ? QMessageBox::Warning : QMessageBox::Question)
            << row.reason;
    }
}

TEST(PlainWidgets, LabelsShowTextsToTheLetter)
{
    const std::unique_ptr<QLabel> label(kareport::plainLabel(markup));
    EXPECT_EQ(label->textFormat(), Qt::PlainText);
    EXPECT_EQ(label->text(), markup);
    QWidget window;
    auto *foreign = new QLabel(markup, &window);
    auto *inner = new QLabel(new QWidget(&window));
    kareport::keepLabelsPlain(window);
    EXPECT_EQ(foreign->textFormat(), Qt::PlainText) << "one that Qt has made";
    EXPECT_EQ(foreign->text(), markup);
    EXPECT_EQ(inner->textFormat(), Qt::PlainText) << "at any depth, also before it has a text";
}

TEST(PlainWidgets, ToolTipsAndMenuEntriesShowTextsToTheLetter)
{
    struct Row
    {
        QString text;
        QString toolTip;
        QString menuText;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("/road/a.rep"), QStringLiteral("/road/a.rep"), QStringLiteral("/road/a.rep"), "a plain name"},
        {QStringLiteral("R&D"), QStringLiteral("R&D"), QStringLiteral("R&&D"), "an ampersand marks no key"},
        {QStringLiteral("a\tb\nc"), QStringLiteral("a\tb\nc"), QStringLiteral("a b c"),
         "what follows a tab would be shown where the keys are"},
        {QStringLiteral("<b>a</b>"), QStringLiteral("<qt>&lt;b&gt;a&lt;/b&gt;</qt>"), QStringLiteral("<b>a</b>"),
         "tool tips take it for HTML, menus do not"},
        {QStringLiteral("a <b"), QStringLiteral("a <b"), QStringLiteral("a <b"), "no HTML"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::plainToolTip(row.text), row.toolTip) << row.reason;
        EXPECT_EQ(kareport::plainMenuText(row.text), row.menuText) << row.reason;
    }
}

TEST(PlainWidgets, TheTipsOfTabsShowTitlesToTheLetter)
{
    QMainWindow frame;
    new kareport::PlainTabTips(frame);
    QDockWidget *first = nullptr;
    for (const QString &title : {QStringLiteral("<u>first</u> && more"), QStringLiteral("second")}) {
        auto *dock = new QDockWidget(title, &frame);
        frame.addDockWidget(Qt::TopDockWidgetArea, dock);
        if (first != nullptr) {
            frame.tabifyDockWidget(first, dock);
        } else {
            first = dock;
        }
    }
    frame.show();
    QTest::qWait(1); // tabs are polished by an event of their own
    auto *bar = frame.findChild<QTabBar *>();
    ASSERT_NE(bar, nullptr);
    ASSERT_EQ(bar->count(), 2);
    const QPoint place = bar->tabRect(0).center();
    QHelpEvent hovered(QEvent::ToolTip, place, bar->mapToGlobal(place));
    QCoreApplication::sendEvent(bar, &hovered);
    EXPECT_EQ(QToolTip::text(), QStringLiteral("<qt>&lt;u&gt;first&lt;/u&gt; &amp; more</qt>"));
    QToolTip::hideText();
}

} // namespace
