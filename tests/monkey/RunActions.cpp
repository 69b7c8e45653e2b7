#include "DeskActions.h"

#include "DeskFrame.h"
#include "NotesPane.h"
#include "UnitsBar.h"
#include "World.h"

#include <QComboBox>
#include <QDialog>
#include <QPushButton>
#include <QSpinBox>
#include <QTest>
#include <QTreeWidget>

namespace monkey
{

void chooseUnits(World &world, Chance &chance)
{
    const kareport::UnitsBar &bar = world.frame().runs().unitsBar();
    QList<QWidget *> boxes;
    for (QWidget *box : bar.findChildren<QWidget *>()) {
        const bool isBox = qobject_cast<QComboBox *>(box) != nullptr || qobject_cast<QSpinBox *>(box) != nullptr;
        if (isBox && box->isVisible() && box->isEnabled()) {
            boxes.append(box);
        }
    }
    if (boxes.isEmpty()) {
        return;
    }
    aimKeyboard(world);
    QWidget *box = chance.of(boxes);
    world.did = box->accessibleName();
    const Qt::Key key = chance.oneIn(2) ? Qt::Key_Down : Qt::Key_Up;
    for (int times = 1 + chance.below(3); times > 0; --times) {
        QTest::keyClick(box, key);
    }
    QTest::keyClick(box, chance.oneIn(4) ? Qt::Key_Escape : Qt::Key_Return);
}

void goToNote(World &world, Chance &chance)
{
    kareport::NotesPane &pane = world.frame().runs().notesPane();
    pane.open();
    if (pane.count() == 0) {
        return;
    }
    QTreeWidget &list = pane.list();
    list.setCurrentItem(list.topLevelItem(chance.below(list.topLevelItemCount())));
    world.did = list.currentItem()->text(1);
    QList<QPushButton *> buttons;
    for (auto *button : pane.findChildren<QPushButton *>()) {
        if (button->isEnabled() && button->isVisible()) {
            buttons.append(button);
        }
    }
    if (!buttons.isEmpty() && chance.oneIn(2)) {
        chance.of(buttons)->click();
    } else {
        QTest::keyClick(&list, Qt::Key_Return);
    }
    QCoreApplication::processEvents();
    // What was shown of a file is read and closed again.
    for (QObject *child : world.frame().children()) {
        if (auto *dialog = qobject_cast<QDialog *>(child); dialog != nullptr && dialog->isVisible()) {
            dialog->close();
            world.frame().activateWindow();
        }
    }
}

} // namespace monkey
