#include "PrintProgress.h"

#include "PlainWidgets.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QLabel>
#include <QProgressDialog>

#include <algorithm>

namespace kareport
{

namespace
{

/// Events are handled this often, well below the tenth of a second in which a window should answer.
constexpr qint64 interval = 40; // milliseconds

} // namespace

PrintProgress::PrintProgress(QWidget *parent, int expectedPages)
    : parent_(parent), expected_(std::max(1, expectedPages))
{
    sinceEvents_.start();
}

PrintProgress::~PrintProgress()
{
    delete dialog_;
}

void PrintProgress::show()
{
    shown_ = true;
    dialog_ = new QProgressDialog(parent_);
    dialog_->setWindowTitle(Xlate("Printing"));
    dialog_->setLabel(plainLabel());
    dialog_->setCancelButtonText(Xlate("Cancel"));
    dialog_->setWindowModality(Qt::ApplicationModal);
    dialog_->setAutoClose(false);
    dialog_->setAutoReset(false);
    dialog_->setMinimumDuration(0);
    dialog_->setMaximum(expected_);
    QObject::connect(dialog_, &QProgressDialog::canceled, dialog_, [this] { cancelled_ = true; });
}

bool PrintProgress::step(int page)
{
    if (sinceEvents_.elapsed() < interval) {
        return false;
    }
    if (!shown_) {
        // Before any other event: from now on no other window takes input, and none can change what is printed.
        show();
    }
    if (dialog_ != nullptr) {
        // The count of pages comes from the lines; long lines can make more.
        expected_ = std::max(expected_, page);
        dialog_->setMaximum(expected_);
        dialog_->setLabelText(Xlate("Page %1 of %2").arg(page).arg(expected_));
        dialog_->setValue(page - 1);
    }
    QCoreApplication::processEvents();
    sinceEvents_.restart();
    return true;
}

} // namespace kareport
