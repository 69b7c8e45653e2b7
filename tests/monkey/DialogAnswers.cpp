#include "DialogAnswers.h"

#include <QAbstractButton>
#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QLineEdit>
#include <QMessageBox>
#include <QProgressDialog>
#include <QPushButton>
#include <QSpinBox>

#include <utility>

namespace monkey
{

namespace
{

constexpr int lookInterval = 2; // milliseconds
/// Windows that ask again are answered so often before they are closed by Escape, and so often before they count as stuck.
constexpr int patience = 12;
constexpr int mostLooks = 200;

} // namespace

DialogAnswers::DialogAnswers()
{
    connect(&timer_, &QTimer::timeout, this, [this] { look(); });
    timer_.start(lookInterval);
}

std::vector<Answer> DialogAnswers::take()
{
    return std::exchange(answers_, {});
}

void DialogAnswers::look()
{
    if (QWidget *popup = QApplication::activePopupWidget()) {
        popup->close();
        return;
    }
    QWidget *window = QApplication::activeModalWidget();
    if (window == nullptr || !window->isVisible()) {
        return;
    }
    looks_ = window == last_ ? looks_ + 1 : 0;
    last_ = window;
    auto *dialog = qobject_cast<QDialog *>(window);
    if (dialog == nullptr || looks_ > mostLooks) {
        stuck.append(QLatin1String(window->metaObject()->className()) + u' ' + window->windowTitle());
        window->close();
    } else if (qobject_cast<QProgressDialog *>(dialog) != nullptr) {
        if (chance_.oneIn(40)) {
            static_cast<QProgressDialog *>(dialog)->cancel();
        }
        looks_ = 0; // it goes with the work that it shows
    } else if (looks_ > patience) {
        dialog->reject();
    } else {
        answer(*dialog);
    }
}

void DialogAnswers::answer(QDialog &dialog)
{
    if (auto *box = qobject_cast<QMessageBox *>(&dialog)) {
        answerBox(*box);
    } else if (auto *asked = qobject_cast<QFileDialog *>(&dialog)) {
        answerFile(*asked);
    } else {
        answerOther(dialog);
    }
}

void DialogAnswers::answerBox(QMessageBox &box)
{
    QList<QAbstractButton *> buttons;
    for (QAbstractButton *button : box.buttons()) {
        if (button->isVisible() && button->isEnabled()) {
            buttons.append(button);
        }
    }
    QAbstractButton *yes = box.button(QMessageBox::Yes);
    QAbstractButton *chosen = agrees && yes != nullptr ? yes : buttons.isEmpty() ? nullptr : chance_.of(buttons);
    if (chosen == nullptr || (!agrees && chance_.oneIn(8))) {
        answers_.push_back({box.text(), QMessageBox::Cancel});
        box.reject(); // the Escape key
        return;
    }
    answers_.push_back({box.text(), box.standardButton(chosen)});
    chosen->click();
}

void DialogAnswers::answerFile(QFileDialog &dialog)
{
    const bool saves = dialog.acceptMode() == QFileDialog::AcceptSave;
    const QString given = std::exchange(nextFile, QString());
    const QString name = !given.isEmpty() ? given : file ? file(chance_, saves) : QString();
    if (name.isEmpty() || (given.isEmpty() && chance_.oneIn(5))) {
        dialog.reject();
        return;
    }
    if (saves && given.isEmpty() && chance_.oneIn(3)) {
        const QStringList kinds = dialog.nameFilters();
        dialog.selectNameFilter(kinds.at(chance_.below(kinds.size())));
    }
    if (auto *field = dialog.findChild<QLineEdit *>(QStringLiteral("fileNameEdit"))) {
        field->setText(name);
    }
    // As the Open or Save button does, which may ask whether a file is to be replaced.
    QMetaObject::invokeMethod(&dialog, "accept");
}

void DialogAnswers::answerOther(QDialog &dialog)
{
    for (QSpinBox *number : dialog.findChildren<QSpinBox *>()) {
        if (chance_.oneIn(6)) {
            number->stepBy(chance_.below(9) - 4);
        }
    }
    for (QComboBox *choice : dialog.findChildren<QComboBox *>()) {
        if (choice->count() > 0 && chance_.oneIn(6)) {
            choice->setCurrentIndex(chance_.below(choice->count()));
        }
    }
    QList<QAbstractButton *> buttons;
    if (const auto *box = dialog.findChild<QDialogButtonBox *>()) {
        for (QAbstractButton *button : box->buttons()) {
            if (button->isVisible() && button->isEnabled()) {
                buttons.append(button);
            }
        }
    }
    if (buttons.isEmpty() || chance_.oneIn(3)) {
        dialog.reject();
    } else {
        chance_.of(buttons)->click();
    }
}

} // namespace monkey
