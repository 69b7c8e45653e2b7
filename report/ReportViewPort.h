#pragma once

#include "KaReportExport.h"

class QIODevice;

namespace kareport
{

/// What a report document needs of the views that show its text, and what marks them among all views that a host may give
/// a report document.
class KAREPORT_EXPORT ReportViewPort
{
public:
    /// Whose pane a view is in.
    enum class Pane
    {
        OfHost,
        OwnShown, ///< made by the report for itself, and shown
        OwnHidden ///< the same, but the report has hidden it or has not shown it yet
    };

    virtual ~ReportViewPort();
    /// Loads the report's text where it was changed since and the view was not notified, as a hidden view is not.
    /// Nothing in a view that always shows what the report holds.
    virtual void loadIfStale() {}
    /// Loads at once what a view that loads a long text in pieces does not show yet.
    virtual void finishLoading() {}
    /// Writes what the view shows to an open device, as rich text. @return false as soon as a write fails
    virtual bool streamRichText(QIODevice &device) const = 0;
    /// The same as plain text of one byte a character. @return false as soon as a write fails
    virtual bool streamPlainText(QIODevice &device) const = 0;

    /// Whose pane the view is in; the host's until the report says otherwise.
    Pane pane() const { return pane_; }
    /// Notes whose pane the view is in; the report that opens it does.
    void setPane(Pane pane) { pane_ = pane; }

private:
    Pane pane_ = Pane::OfHost;
};

} // namespace kareport
