#include "WorkDialog.h"

#include "PlainWidgets.h"
#include "Xlate.h"

#include <QProgressDialog>

#include <algorithm>
#include <climits>

namespace kareport
{

WorkDialog::WorkDialog(QWidget *parent, const std::function<void()> &stop)
    : dialog_(new QProgressDialog(QString(), Xlate("Cancel"), 0, 100, parent))
{
    dialog_->setLabel(plainLabel()); // it names files
    dialog_->setWindowModality(Qt::ApplicationModal);
    // Only this class shows and hides it: while it is hidden, nothing keeps the user from other windows.
    dialog_->setMinimumDuration(INT_MAX);
    dialog_->setAutoReset(false);
    dialog_->setAutoClose(false);
    dialog_->reset();
    sinceStart_.start();
    QObject::connect(dialog_.get(), &QProgressDialog::canceled, dialog_.get(), stop);
    QObject::connect(dialog_.get(), &QDialog::rejected, dialog_.get(),
                     stop); // Escape before the dialog is the active window
}

WorkDialog::~WorkDialog() = default;

void WorkDialog::hide()
{
    dialog_->reset();
}

bool WorkDialog::isDue() const
{
    constexpr qint64 shortWork = 500; // milliseconds
    return sinceStart_.elapsed() >= shortWork;
}

void WorkDialog::show(const QString &what, int percent)
{
    dialog_->setLabelText(what);
    dialog_->show();
    dialog_->setRange(0, percent >= 0 ? 100 : 0);
    dialog_->setValue(std::max(percent, 0));
}

} // namespace kareport
