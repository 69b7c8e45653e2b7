#include "CReportToolBar.h"

#include "BracketTranslator.h"
#include "PrintQt.h"
#include "ReportResources.h"
#include "UXTPMDIFrameWnd.h"

#include <QAction>
#include <QApplication>
#include <QHelpEvent>
#include <QLineEdit>
#include <QMenu>
#include <QTest>
#include <QToolButton>
#include <QToolTip>
#include <QVBoxLayout>
#include <QWindow>

#include <gtest/gtest.h>

#include <array>
#include <utility>
#include <vector>

namespace
{

constexpr std::array<unsigned, 3> ids = {11007, 11009, 11011};
constexpr std::array<const char *, 3> names = {"Save", "View\\Edit Report", "Print"};

/// Handles the bar's commands, and counts how often each was run.
class Owner : public kareport::CommandTarget
{
public:
    Owner()
    {
        for (std::size_t i = 0; i < ids.size(); ++i) {
            commands_.push_back({ids.at(i), [this, i] { ++runs.at(i); },
                                 [this, i](kareport::CommandState &state) { state.enabled = enabled.at(i); }});
        }
    }
    const std::vector<kareport::Command> &commands() const override { return commands_; }
    void removeHandlers() { commands_.clear(); }

    std::array<bool, 3> enabled = {true, true, true};
    std::array<int, 3> runs = {};

private:
    std::vector<kareport::Command> commands_;
};

/// A frame that handles the same commands in its own way.
class Frame : public UXTPMDIFrameWnd
{
public:
    const std::vector<kareport::Command> &commands() const override { return owner.commands(); }

    Owner owner;
};

QToolButton *buttonOf(const QToolBar &bar, std::size_t index)
{
    return qobject_cast<QToolButton *>(bar.widgetForAction(bar.actions().at(static_cast<qsizetype>(index))));
}

std::array<bool, 3> enabledIn(const QToolBar &bar)
{
    return {buttonOf(bar, 0)->isEnabled(), buttonOf(bar, 1)->isEnabled(), buttonOf(bar, 2)->isEnabled()};
}

TEST(CReportToolBar, HasAButtonForEachCommandOfTheReportWindow)
{
    Owner owner;
    const CReportToolBar bar(&owner);
    ASSERT_EQ(bar.actions().size(), 3);
    for (std::size_t i = 0; i < ids.size(); ++i) {
        const QToolButton *button = buttonOf(bar, i);
        ASSERT_NE(button, nullptr) << names.at(i);
        EXPECT_EQ(button->defaultAction()->data().toUInt(), ids.at(i));
        EXPECT_EQ(button->toolTip(), QString::fromUtf8(names.at(i)));
        EXPECT_EQ(button->accessibleName(), QString::fromUtf8(names.at(i)));
        EXPECT_EQ(button->toolButtonStyle(), Qt::ToolButtonIconOnly);
        EXPECT_EQ(button->iconSize(), QSize(16, 16));
        EXPECT_EQ(button->icon().pixmap(16).toImage(), kareport::reportIcon(ids.at(i)).pixmap(16).toImage())
            << names.at(i);
    }
}

TEST(CReportToolBar, StaysWhereItIs)
{
    Owner owner;
    const CReportToolBar bar(&owner);
    EXPECT_EQ(bar.GetDockingMode(), 1) << "at once, without markers";
    EXPECT_FALSE(bar.isMovable());
    EXPECT_FALSE(bar.isFloatable());
    EXPECT_FALSE(bar.OnShowControlBarMenu(QPoint(1, 1)));
}

TEST(CReportToolBar, ShowsTheNameOfAButtonWhenTheMouseRestsOnIt)
{
    Owner owner;
    CReportToolBar bar(&owner);
    bar.show();
    for (std::size_t i = 0; i < ids.size(); ++i) {
        QToolButton *button = buttonOf(bar, i);
        const QPoint place = button->rect().center();
        QHelpEvent rest(QEvent::ToolTip, place, button->mapToGlobal(place));
        QApplication::sendEvent(button, &rest);
        EXPECT_EQ(QToolTip::text(), QString::fromUtf8(names.at(i)));
    }
    QToolTip::hideText();
}

TEST(CReportToolBar, AnActionThatIsNotOneOfItsCommandsHasNoName)
{
    Owner owner;
    const CReportToolBar bar(&owner);
    const QAction other;
    QString text = QStringLiteral("left over");
    EXPECT_TRUE(bar.OnUserToolTip(&other, text));
    EXPECT_EQ(text, QString());
}

TEST(CReportToolBar, NamesAreInTheUsersLanguage)
{
    const BracketTranslator translator;
    Owner owner;
    const CReportToolBar bar(&owner);
    for (std::size_t i = 0; i < ids.size(); ++i) {
        const QString expected = u'[' + QString::fromUtf8(names.at(i)) + u']';
        QString text;
        EXPECT_TRUE(bar.OnUserToolTip(bar.actions().at(static_cast<qsizetype>(i)), text));
        EXPECT_EQ(text, expected);
        EXPECT_EQ(buttonOf(bar, i)->toolTip(), expected);
        EXPECT_EQ(buttonOf(bar, i)->accessibleName(), expected);
    }
}

TEST(CReportToolBar, NamesFollowAChangeOfTheLanguage)
{
    Owner owner;
    const CReportToolBar bar(&owner);
    ASSERT_EQ(buttonOf(bar, 0)->toolTip(), QStringLiteral("Save"));
    const auto change = [] {
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents();
    };
    {
        const BracketTranslator translator;
        change();
        for (std::size_t i = 0; i < ids.size(); ++i) {
            const QString expected = u'[' + QString::fromUtf8(names.at(i)) + u']';
            EXPECT_EQ(buttonOf(bar, i)->toolTip(), expected);
            EXPECT_EQ(buttonOf(bar, i)->accessibleName(), expected);
        }
        EXPECT_EQ(bar.windowTitle(), QStringLiteral("[Report]"));
    }
    change();
    EXPECT_EQ(buttonOf(bar, 0)->toolTip(), QStringLiteral("Save")) << "and back";
}

/// A bar of a host that names one of its buttons in its own way.
class NamingBar : public CReportToolBar
{
public:
    using CReportToolBar::CReportToolBar;
    bool OnUserToolTip(const QAction *button, QString &text) const override
    {
        if (button->data().toUInt() == ids[0]) {
            text = QStringLiteral("Keep");
            return true;
        }
        text = QStringLiteral("never shown");
        return button->data().toUInt() == ids[1] && CReportToolBar::OnUserToolTip(button, text);
    }
};

TEST(CReportToolBar, AHostMayNameTheButtons)
{
    Owner owner;
    NamingBar bar(&owner);
    bar.show();
    EXPECT_EQ(buttonOf(bar, 0)->toolTip(), QStringLiteral("Keep"));
    EXPECT_EQ(buttonOf(bar, 0)->accessibleName(), QStringLiteral("Keep"));
    EXPECT_EQ(buttonOf(bar, 0)->defaultAction()->statusTip(), QStringLiteral("Keep")) << "in the status bar as well";
    EXPECT_EQ(buttonOf(bar, 1)->toolTip(), QStringLiteral("View\\Edit Report"));
    EXPECT_EQ(buttonOf(bar, 2)->toolTip(), QStringLiteral("Print")) << "left as it was";
}

TEST(CReportToolBar, ButtonsFollowTheOwnerAndNotTheFrame)
{
    for (const bool disableIfNoHandler : {false, true}) {
        for (int mask = 0; mask < 8; ++mask) {
            Frame frame;
            Owner owner;
            for (std::size_t i = 0; i < ids.size(); ++i) {
                owner.enabled.at(i) = (mask >> i & 1) != 0;
                frame.owner.enabled.at(i) = !owner.enabled.at(i);
            }
            CReportToolBar bar(&owner, &frame);
            bar.OnUpdateCmdUI(&frame, disableIfNoHandler);
            EXPECT_EQ(enabledIn(bar), owner.enabled) << mask;
            bar.OnUpdateCmdUI(nullptr, disableIfNoHandler);
            EXPECT_EQ(enabledIn(bar), owner.enabled) << mask << ": without a frame";
            std::swap(owner.enabled, frame.owner.enabled);
            bar.OnUpdateCmdUI(&frame, disableIfNoHandler);
            EXPECT_EQ(enabledIn(bar), owner.enabled) << mask << ": asked anew each time";
        }
    }
}

TEST(CReportToolBar, ACommandThatTheOwnerDoesNotHandleIsDisabled)
{
    Frame frame;
    Owner owner;
    CReportToolBar bar(&owner, &frame);
    bar.OnUpdateCmdUI(&frame, true);
    EXPECT_EQ(enabledIn(bar), (std::array<bool, 3>{true, true, true}));
    owner.removeHandlers();
    bar.OnUpdateCmdUI(&frame, false);
    EXPECT_EQ(enabledIn(bar), (std::array<bool, 3>{true, true, true})) << "unless it is asked to, it leaves such a one";
    bar.OnUpdateCmdUI(&frame, true);
    EXPECT_EQ(enabledIn(bar), (std::array<bool, 3>{})) << "although the frame handles it";
    buttonOf(bar, 0)->defaultAction()->setEnabled(true);
    buttonOf(bar, 0)->click();
    EXPECT_EQ(frame.owner.runs, (std::array<int, 3>{})) << "nor is it run there";
}

TEST(CReportToolBar, ButtonsAreRightAsSoonAsTheBarIsShown)
{
    Owner owner;
    owner.enabled = {false, true, false};
    CReportToolBar bar(&owner);
    bar.show();
    EXPECT_EQ(enabledIn(bar), owner.enabled);
    bar.hide();
    owner.enabled = {true, false, true};
    bar.show();
    EXPECT_EQ(enabledIn(bar), owner.enabled);
}

TEST(CReportToolBar, AClickRunsTheOwnersCommand)
{
    Frame frame;
    Owner owner;
    CReportToolBar bar(&owner, &frame);
    frame.show();
    for (std::size_t i = 0; i < ids.size(); ++i) {
        std::array<int, 3> expected = {};
        expected.at(i) = 1;
        owner.runs = {};
        QTest::mouseClick(buttonOf(bar, i), Qt::LeftButton);
        EXPECT_EQ(owner.runs, expected) << names.at(i);
    }
    owner.runs = {};
    owner.enabled = {};
    bar.OnUpdateCmdUI(&frame, true);
    for (std::size_t i = 0; i < ids.size(); ++i) {
        QTest::mouseClick(buttonOf(bar, i), Qt::LeftButton);
    }
    EXPECT_EQ(owner.runs, (std::array<int, 3>{})) << "disabled";
    EXPECT_EQ(frame.owner.runs, (std::array<int, 3>{})) << "the frame has nothing to do with it";
}

TEST(CReportToolBar, WithoutAnOwnerItHasNothingToRun)
{
    CReportToolBar bar(nullptr);
    bar.show();
    EXPECT_EQ(enabledIn(bar), (std::array<bool, 3>{}));
    for (std::size_t i = 0; i < ids.size(); ++i) {
        EXPECT_EQ(buttonOf(bar, i)->toolTip(), QString::fromUtf8(names.at(i)));
        buttonOf(bar, i)->defaultAction()->setEnabled(true);
        buttonOf(bar, i)->click();
    }
    bar.OnUpdateCmdUI(nullptr, true);
    EXPECT_EQ(enabledIn(bar), (std::array<bool, 3>{}));
}

TEST(CReportToolBar, WithoutAnOwnerItFollowsItsParent)
{
    Frame parent;
    parent.owner.enabled = {true, false, true};
    auto *bar = new CReportToolBar(nullptr, &parent);
    parent.show();
    bar->show();
    EXPECT_EQ(enabledIn(*bar), parent.owner.enabled);
    parent.owner.enabled = {true, true, false};
    bar->OnUpdateCmdUI(nullptr, true);
    EXPECT_EQ(enabledIn(*bar), parent.owner.enabled);
    buttonOf(*bar, 0)->click();
    buttonOf(*bar, 1)->click();
    EXPECT_EQ(parent.owner.runs, (std::array<int, 3>{1, 1, 0}));
}

/// The bar between two fields, in a window that has the keyboard.
struct Window
{
    Window()
    {
        auto *layout = new QVBoxLayout(&widget);
        layout->addWidget(before);
        layout->addWidget(bar);
        layout->addWidget(after);
        widget.show();
        QApplication::setActiveWindow(&widget);
        before->setFocus();
    }
    /// Presses a key where the keyboard is. @return where it is then
    QWidget *press(Qt::Key key) const
    {
        QTest::keyClick(widget.focusWidget(), key);
        return widget.focusWidget();
    }

    Owner owner;
    QWidget widget;
    QLineEdit *before = new QLineEdit;
    CReportToolBar *bar = new CReportToolBar(&owner);
    QLineEdit *after = new QLineEdit;
};

TEST(CReportToolBar, IsWorkedWithTheKeyboardAlone)
{
    Window window;
    for (std::size_t i = 0; i < ids.size(); ++i) {
        ASSERT_EQ(window.press(Qt::Key_Tab), buttonOf(*window.bar, i)) << names.at(i);
        EXPECT_TRUE(buttonOf(*window.bar, i)->hasFocus()) << names.at(i);
        window.press(Qt::Key_Space);
        EXPECT_EQ(window.owner.runs.at(i), 1) << names.at(i);
    }
    EXPECT_EQ(window.press(Qt::Key_Tab), window.after) << "the bar does not hold the keyboard";
    EXPECT_EQ(window.press(Qt::Key_Backtab), buttonOf(*window.bar, 2)) << "and back";

    window.owner.enabled = {false, true, false};
    window.bar->OnUpdateCmdUI(nullptr, true);
    window.before->setFocus();
    EXPECT_EQ(window.press(Qt::Key_Tab), buttonOf(*window.bar, 1)) << "what is disabled is skipped";
    EXPECT_EQ(window.press(Qt::Key_Tab), window.after);
}

TEST(CReportToolBar, AMouseClickLeavesTheKeyboardWhereItIs)
{
    const Window window;
    QTest::mouseClick(buttonOf(*window.bar, 0), Qt::LeftButton);
    EXPECT_EQ(window.owner.runs.at(0), 1);
    EXPECT_TRUE(window.before->hasFocus());
}

/// Presses the right button of the mouse on a widget, as the window system would. @return the menu that opens, or null
QMenu *menuByRightClick(QWidget &widget)
{
    QWidget *window = widget.window();
    QTest::mouseClick(window->windowHandle(), Qt::RightButton, {}, widget.mapTo(window, widget.rect().center()));
    return qobject_cast<QMenu *>(QApplication::activePopupWidget());
}

TEST(CReportToolBar, ARightClickShowsNoMenuOfBars)
{
    Owner owner;
    UXTPMDIFrameWnd frame;
    auto *other = frame.addToolBar(QStringLiteral("Other"));
    other->addAction(QStringLiteral("x"));
    auto *bar = new CReportToolBar(&owner);
    frame.addToolBar(bar);
    frame.resize(600, 300);
    frame.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&frame));

    QMenu *menu = menuByRightClick(*other);
    ASSERT_NE(menu, nullptr) << "the frame has such a menu";
    menu->close();
    ASSERT_EQ(bar->childAt(bar->rect().center()), nullptr);
    EXPECT_EQ(menuByRightClick(*bar), nullptr) << "beside the buttons";
    owner.enabled = {true, false, true};
    bar->OnUpdateCmdUI(&frame, true);
    for (std::size_t i = 0; i < ids.size(); ++i) {
        EXPECT_EQ(menuByRightClick(*buttonOf(*bar, i)), nullptr) << names.at(i);
    }
    EXPECT_EQ(owner.runs, (std::array<int, 3>{}));
}

} // namespace
