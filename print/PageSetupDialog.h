#pragma once

#include "PageSetupForm.h"

#include <QDialog>

namespace kareport
{

/// Asks for the set-up of a page. It is not left with OK while the margins leave no room for text.
class PageSetupDialog : public QDialog
{
public:
    explicit PageSetupDialog(const PageSetup &setup, QWidget *parent = nullptr);

    PageSetup setup() const { return form_->setup(); }
    void accept() override;

private:
    PageSetupForm *form_;
};

/// Asks with it. @return false, with the set-up as it was, when it is cancelled
bool showPageSetup(PageSetup &setup, QWidget *parent);

} // namespace kareport
