#pragma once

#include "KaReportExport.h"

#include <QString>

#include <memory>
#include <vector>

class CViewPane;
class UArchive;
class UDocTemplate;
class UView;

/// A document of the host: its title, file, modified flag and views, and how it is opened, saved and closed.
///
/// The document template that made a document owns it. A document deletes itself when it is closed, unless
/// `SetAutoDelete` has switched that off.
class KAREPORT_EXPORT UDocument
{
public:
    /// What has happened to a document.
    enum class DocumentEvent
    {
        AfterNewDocument,
        AfterOpenDocument,
        AfterSaveDocument,
        AfterCloseDocument
    };

    UDocument();
    virtual ~UDocument();
    UDocument(const UDocument &) = delete;
    UDocument &operator=(const UDocument &) = delete;

    /// The title; empty until it is set.
    const QString &GetTitle() const { return title_; }
    /// Sets the title and the text of every pane that shows the document.
    virtual void SetTitle(const QString &title);
    /// The full path of the file that the document belongs to; empty for none.
    const QString &GetPathName() const { return path_; }
    /// Sets the file that the document belongs to; its name becomes the title. Without memory, neither changes.
    virtual void SetPathName(const QString &path, bool addToRecentFiles);

    /// Whether something has changed since the document was made, loaded or saved.
    virtual bool IsModified() const { return modified_; }
    /// Notes that something has changed, or that nothing has.
    virtual void SetModifiedFlag(bool modified = true) { modified_ = modified; }

    /// Views in the order in which they were added. The panes own them.
    const std::vector<UView *> &GetViews() const { return views_; }
    /// Adds a view, which shows this document from then on. The view stays its pane's. Without memory it is not added.
    void AddView(UView *view);
    /// Called by a view that is destroyed. A document closes with its last view, unless auto-delete is off.
    void RemoveView(UView *view);
    /// Tells every view but the sender that the document has changed. A view without memory for it does not keep the
    /// others from being told.
    virtual void UpdateAllViews(UView *sender, long hint = 0, void *hintObject = nullptr);
    /// Numbers the panes that show the document; hidden ones have the number 0.
    virtual void UpdateFrameCounts();

    /// Makes the document an unmodified one without a file, emptied by `DeleteContents`. @return false when that is not
    /// possible
    virtual bool OnNewDocument();
    /// Loads a file through `Serialize`. @return false when it cannot be opened, with the document as it was, or not be
    /// read, with the document empty
    virtual bool OnOpenDocument(const QString &path);
    /// Stores into a file through `Serialize`, in one step: a failed write leaves an earlier file as it was.
    virtual bool OnSaveDocument(const QString &path);
    /// Stores the document into an archive, or loads it from one; a plain document has nothing to store.
    virtual void Serialize(UArchive &archive);
    /// Saves under a path and, with `replace`, makes it the document's own. @return false when it is not saved, or when
    /// there is no memory for the new path: the document then counts as modified where it did
    virtual bool DoSave(const QString &path, bool replace);
    /// Saves under the document's own path.
    bool DoFileSave();

    /// Asks the user whether to save a modified document. @return false when the closing was cancelled, and when the
    /// document was closed while the question was open. A view or a document that is notified of a save may close it
    /// as well
    virtual bool SaveModified();
    /// Whether a pane that shows the document may be closed.
    virtual bool CanCloseFrame(CViewPane *pane);
    /// Whether the user can see the document in a window. @param except  a pane that does not count; null for none
    virtual bool IsShown(const CViewPane *except = nullptr) const;
    /// Closes the panes and the document.
    virtual void OnCloseDocument();
    /// Empties the document; a plain document has nothing to empty.
    virtual void DeleteContents();
    /// Called when a closed document is about to delete itself.
    virtual void OnAutoDelete();
    /// Called after the document has been made, opened, saved or closed: tells the application.
    virtual void OnDocumentEvent(DocumentEvent event);
    /// Whether the document was only opened for a search by the shell; never so in this host.
    virtual bool IsSearchAndOrganizeHandler() const { return false; }

    /// Whether the document deletes itself when it is closed, as it does at first.
    bool IsAutoDelete() const { return autoDelete_; }
    /// Sets whether the document deletes itself when it is closed. Where it does not, the code that said so deletes it.
    void SetAutoDelete(bool on) { autoDelete_ = on; }

    /// Tells the document that a report it had asked for has been closed and is about to be deleted.
    virtual void OnReportClosed(UDocument *report);
    /// Takes the text that the user has written for one of the document's objects.
    /// @return false when the document has no such object (any more)
    virtual bool OnTextReceived(unsigned id, const QString &text);

    /// The template that has made the document and owns it; null for one that was made otherwise.
    UDocTemplate *GetDocTemplate() const { return docTemplate_; }

protected:
    /// Closes the panes of all views, without closing the document with the last of them.
    void CloseAllPanes();
    /// Ends a document without views: tells of it, empties it, and deletes it where it deletes itself.
    void EndDocument();

private:
    friend class UDocTemplate;

    QString title_;
    QString path_;
    bool modified_ = false;
    bool autoDelete_ = true;
    std::vector<UView *> views_;
    UDocTemplate *docTemplate_ = nullptr;
    std::shared_ptr<const bool> life_ = std::make_shared<bool>(true); ///< ends with the document
};
