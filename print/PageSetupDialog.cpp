#include "PageSetupDialog.h"

#include "Xlate.h"

#include <QDialogButtonBox>
#include <QPointer>
#include <QVBoxLayout>

namespace kareport
{

PageSetupDialog::PageSetupDialog(const PageSetup &setup, QWidget *parent)
    : QDialog(parent), form_(new PageSetupForm(setup))
{
    setWindowTitle(Xlate("Page Setup"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    auto *layout = new QVBoxLayout(this);
    layout->addWidget(form_);
    auto *buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    connect(buttons, &QDialogButtonBox::accepted, this, &PageSetupDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &PageSetupDialog::reject);
    layout->addWidget(buttons);
    layout->setSizeConstraint(QLayout::SetFixedSize);
    form_->setFocus();
}

void PageSetupDialog::accept()
{
    if (form_->confirm()) {
        QDialog::accept();
    }
}

bool showPageSetup(PageSetup &setup, QWidget *parent)
{
    // The parent may be destroyed, and the dialog with it, while it is open.
    const QPointer<PageSetupDialog> dialog = new PageSetupDialog(setup, parent);
    const bool accepted = dialog->exec() == QDialog::Accepted && dialog != nullptr;
    if (accepted) {
        setup = dialog->setup();
    }
    delete dialog;
    return accepted;
}

} // namespace kareport
