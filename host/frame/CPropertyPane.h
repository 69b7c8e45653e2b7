#pragma once

#include "COneViewPane.h"
#include "KaReportExport.h"

/// A pane of the main frame with a body of its own instead of a view, which follows a document.
class KAREPORT_EXPORT CPropertyPane : public COneViewPane
{
public:
    /// Makes the pane known, so that it is told of changed documents.
    CPropertyPane();
    /// Takes the pane out of those that are told.
    ~CPropertyPane() override;

    /// False: the caption is the pane's own.
    bool HasDocumentTitle() const override { return false; }

    /// Called when a document has changed; with null for one that has closed since.
    virtual void OnUpdateProperties(UDocument *document);

    /// Tells all open property panes that a document has changed. @param document  null when it has closed since
    static void UpdateAllPropertyPane(UDocument *document);
};
