#pragma once

#include "KaReportExport.h"

#include <QtGlobal>

class CViewPane;
class QWidget;
class UDocument;

/// A view of a document, shown in a pane. The pane owns it.
class KAREPORT_EXPORT UView
{
public:
    UView();
    virtual ~UView();
    UView(const UView &) = delete;
    UView &operator=(const UView &) = delete;

    /// The longest file in bytes that a view of text takes.
    static constexpr qint64 nMaxSize = 0x3FFFFFFF;

    UDocument *GetDocument() const { return document_; }
    /// The pane that shows the view; null for a view without one.
    CViewPane *GetParentPane() const { return pane_; }

    /// The window that shows the view, owned by it; null for a view without one.
    virtual QWidget *GetWidget() { return nullptr; }

    /// Called once when the view and its document are ready: updates the view.
    virtual void OnInitialUpdate();
    /// Called when the document has changed. The arguments are those of `UDocument::UpdateAllViews`.
    virtual void OnUpdate(UView *sender, long hint, void *hintObject);
    /// Whether the user can see the view.
    virtual bool IsVisible() const;

private:
    friend class CViewPane;
    friend class UDocument;

    UDocument *document_ = nullptr;
    CViewPane *pane_ = nullptr;
};
