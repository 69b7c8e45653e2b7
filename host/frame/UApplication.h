#pragma once

#include "KaReportExport.h"
#include "UDocTemplate.h"
#include "UDocument.h"

#include <QStringList>

#include <memory>
#include <vector>

/// The host application: its document templates and the files last used. There is at most one at a time.
class KAREPORT_EXPORT UApplication
{
public:
    /// Becomes the application that `Get` returns.
    UApplication();
    /// Closes all documents without asking and destroys the templates; `Get` then returns null.
    virtual ~UApplication();
    UApplication(const UApplication &) = delete;
    UApplication &operator=(const UApplication &) = delete;

    /// The application, or null when there is none.
    static UApplication *Get();

    /// Takes a template over. @return the template; null, with the template destroyed, when memory ends
    UDocTemplate *AddDocTemplate(std::unique_ptr<UDocTemplate> docTemplate);
    /// In the order in which they were added.
    const std::vector<std::unique_ptr<UDocTemplate>> &GetDocTemplates() const { return templates_; }

    /// The documents of all templates, those of a template together, in the order in which they were made. Throws
    /// std::bad_alloc without memory: who closes them must not miss one.
    std::vector<UDocument *> GetDocuments() const;
    /// Whether a pointer is an open document; it may be stale.
    bool IsOpen(const void *document) const;
    /// Closes the documents of all templates and their panes without asking.
    void CloseAllDocuments();

    /// Puts a file to the front of the list of files last used, which stays as it is when memory ends.
    virtual void AddToRecentFileList(const QString &path);
    /// The files last used, the last one first; at most ten.
    const QStringList &GetRecentFileList() const { return recentFiles_; }

    /// Called after a document has been made, opened, saved or closed.
    virtual void OnDocumentEvent(UDocument &document, UDocument::DocumentEvent event);

    /// The report that the user works with; null for none.
    UDocument *GetCurrentReport() const { return currentReport_; }
    /// The view that goes with the current report; null for none.
    UView *GetCompanionView() const { return companionView_; }
    /// Notes the report that the user works with; null for none.
    void SetCurrentReport(UDocument *report) { currentReport_ = report; }
    /// Notes the view that goes with the current report; null for none.
    void SetCompanionView(UView *view) { companionView_ = view; }
    /// Takes a document that is being destroyed, out of the pair; nothing when it is another one.
    void ForgetReport(const UDocument *report);
    /// Takes a view that is being destroyed, out of the pair; nothing when it is another one.
    void ForgetView(const UView *view);

private:
    UDocument *currentReport_ = nullptr;
    UView *companionView_ = nullptr;
    std::vector<std::unique_ptr<UDocTemplate>> templates_;
    QStringList recentFiles_;
};
