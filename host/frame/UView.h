#pragma once

#include "KaReportExport.h"

#include <QtGlobal>

#include <memory>

class CViewPane;
class QWidget;
class UDocument;
class XInput;

/// A view of a document, shown in a pane. The pane owns it.
class KAREPORT_EXPORT UView
{
public:
    /// A view that is in no pane and shows no document yet.
    UView();
    /// Takes the view out of its document and of what the application and the frame remember.
    virtual ~UView();
    UView(const UView &) = delete;
    UView &operator=(const UView &) = delete;

    /// The longest file in bytes that a view of text takes.
    static constexpr qint64 nMaxSize = 0x3FFFFFFF;

    /// The document shown; null before `UDocument::AddView` and once the document has gone.
    UDocument *GetDocument() const { return document_; }
    /// The pane that shows the view; null for a view without one.
    CViewPane *GetParentPane() const { return pane_; }

    /// A place that holds the view, and null once it has been destroyed: for code that remembers a view.
    std::shared_ptr<UView *const> GetHandle() const { return handle_; }

    /// The input operation that the view is in the middle of, not owned; null for none.
    XInput *Top() const { return top_; }
    /// The code that begins an operation sets it, and removes it when the operation ends.
    void SetTop(XInput *input) { top_ = input; }

    /// The window that shows the view, owned by it; null for a view without one.
    virtual QWidget *GetWidget() { return nullptr; }

    /// Called once when the view and its document are ready: updates the view.
    virtual void OnInitialUpdate();
    /// Called when the document has changed. The arguments are those of `UDocument::UpdateAllViews`.
    virtual void OnUpdate(UView *sender, long hint, void *hintObject);
    /// Tells the view that it has become the active one, or is it no longer. A view that has become active takes the
    /// keyboard, unless a part of it has it already.
    /// @param activated, deactivated  the view that is active from now on and the one before: the same one when the view
    ///                                only gets the keyboard back. Null for none
    virtual void OnActivateView(bool activate, UView *activated, UView *deactivated);
    /// Whether the user can see the view.
    virtual bool IsVisible() const;

private:
    friend class CViewPane;
    friend class UDocument;

    UDocument *document_ = nullptr;
    CViewPane *pane_ = nullptr;
    XInput *top_ = nullptr;
    std::shared_ptr<UView *> handle_;
};
