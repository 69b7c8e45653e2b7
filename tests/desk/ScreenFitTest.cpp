#include "ScreenFit.h"

#include "AboutDialog.h"
#include "CommandList.h"
#include "DeskFixture.h"
#include "DeskPreferences.h"
#include "HelpWindow.h"
#include "PreferencesDialog.h"
#include "TemplateDialog.h"

#include <QComboBox>
#include <QMenuBar>
#include <QScreen>
#include <QTabWidget>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(ScreenFit, NoWindowIsLargerThanTheScreen)
{
    Desk desk;
    const QSize room = desk.frame->screen()->availableSize();
    EXPECT_LE(desk.frame->width(), room.width());
    EXPECT_LE(desk.frame->height(), room.height());
    QDialog large(&*desk.frame);
    large.resize(room * 3);
    large.show();
    EXPECT_LE(large.width(), room.width());
    EXPECT_LE(large.height(), room.height());
    // The smallest size of each leaves room on a screen of 1366 by 768 pixels at 200 %.
    constexpr QSize small(683, 384);
    PreferencesDialog preferences(loadPreferences());
    TemplateDialog fromTemplate;
    CommandList commands(listedCommands(*desk.frame->menuBar()));
    HelpWindow help;
    AboutDialog about;
    for (QWidget *window : {static_cast<QWidget *>(&*desk.frame), static_cast<QWidget *>(&preferences),
                            static_cast<QWidget *>(&fromTemplate), static_cast<QWidget *>(&commands),
                            static_cast<QWidget *>(&help), static_cast<QWidget *>(&about)})
    {
        window->show();
        const QSize least = window->minimumSizeHint();
        EXPECT_LE(least.width(), small.width()) << window->windowTitle().toStdString();
        EXPECT_LE(least.height(), small.height()) << window->windowTitle().toStdString();
    }
}

TEST(ScreenFit, TheExamplesOfThePreferencesDoNotMoveWhatIsBesideThem)
{
    PreferencesDialog preferences(loadPreferences());
    preferences.show();
    const QSize before = preferences.sizeHint();
    for (auto *box : preferences.findChildren<QComboBox *>()) {
        for (int choice = 0; choice < box->count(); ++choice) {
            box->setCurrentIndex(choice);
            EXPECT_EQ(preferences.sizeHint().width(), before.width())
                << box->accessibleName().toStdString() << ' ' << choice;
        }
    }
}

} // namespace
