#pragma once

#include "UApplication.h"

/// The desktop program: its files last used are kept in the user's profile.
class DeskApplication : public UApplication
{
public:
    DeskApplication();
    ~DeskApplication() override;

    void AddToRecentFileList(const QString &path) override;
    void OnDocumentEvent(UDocument &document, UDocument::DocumentEvent event) override;
};
