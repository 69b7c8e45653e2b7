#pragma once

#include "DefaultPrinter.h"
#include "UApplication.h"

class QWidget;

/// The desktop program: its files last used are kept in the user's profile.
class DeskApplication : public UApplication
{
public:
    DeskApplication();
    ~DeskApplication() override;

    void AddToRecentFileList(const QString &path) override;
    void OnDocumentEvent(UDocument &document, UDocument::DocumentEvent event) override;

private:
    kareport::DefaultPrinter printerBefore_;
};

namespace kareport
{

/// Shows the program's messages and questions for file names as dialogs of a window.
void installDialogs(QWidget *parent);

} // namespace kareport
