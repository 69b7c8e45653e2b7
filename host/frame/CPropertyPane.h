#pragma once

#include "COneViewPane.h"
#include "KaReportExport.h"

/// A pane of the main frame with a body of its own instead of a view, which follows a document.
class KAREPORT_EXPORT CPropertyPane : public COneViewPane
{
public:
    CPropertyPane();
    ~CPropertyPane() override;

    bool HasDocumentTitle() const override { return false; }

    /// Called when a document has changed; with null for one that has closed since.
    virtual void OnUpdateProperties(UDocument *document);

    /// Tells all open property panes that a document has changed. @param document  null when it has closed since
    static void UpdateAllPropertyPane(UDocument *document);
};
