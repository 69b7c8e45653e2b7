#pragma once

#include "KaReportExport.h"

#include <QRect>
#include <QString>

#include <functional>
#include <memory>
#include <vector>

class CViewPane;
class UDocument;
class UView;

/// Makes documents of one kind with the panes and views that show them, and owns the documents.
class KAREPORT_EXPORT UDocTemplate
{
public:
    /// Makes a document; null when it cannot be made.
    using DocumentFactory = std::function<std::unique_ptr<UDocument>()>;
    using PaneFactory = std::function<CViewPane *()>; ///< a pane owns itself until it is closed
    /// Makes a view; null when it cannot be made.
    using ViewFactory = std::function<std::unique_ptr<UView>()>;

    /// @param resourceId   identifies the texts, menus and icons of the kind
    /// @param makePane, makeView  may be empty in a program without windows: documents are then made without a view
    /// @param creatorName  the name by which the template is found
    /// @param savesInFrame, reserved  for the host's frame, which a program without windows does not have
    UDocTemplate(unsigned resourceId, DocumentFactory makeDocument, PaneFactory makePane, ViewFactory makeView,
                 QString creatorName, int savesInFrame, int reserved);
    ~UDocTemplate();
    UDocTemplate(const UDocTemplate &) = delete;
    UDocTemplate &operator=(const UDocTemplate &) = delete;

    /// The number that identifies the texts, menus and icons of the kind.
    unsigned GetResourceId() const { return resourceId_; }
    /// Whether the template has a name; case counts.
    bool IsThatCreator(const QString &name) const { return creatorName_ == name; }
    /// The documents of this template, in the order in which they were made.
    const std::vector<UDocument *> &GetDocuments() const { return documents_; }

    /// Makes a document, new when the path is empty, else loaded from the file, and a pane that shows it.
    /// @param makeVisible  whether the pane is shown; the flag before it always has the same value
    /// @param pane         the pane to take; null makes a new one
    /// @param style        window style of a new pane
    /// @param rect         place of a new pane, null for the usual one
    /// @return the document, or null when it cannot be made or loaded
    UDocument *OpenReportDocumentFile(const QString &path, int addToFrame, int makeVisible, CViewPane *pane,
                                      unsigned style, const QRect *rect);
    /// Makes a pane with a view of a document; null in a program without windows, and without memory.
    CViewPane *CreateNewPane(UDocument *document, CViewPane *parent, unsigned style, const QRect *rect);
    /// Closes the template's documents and their panes without asking.
    void CloseAllDocuments();
    /// Lets the views of a pane show their document for the first time, and shows the pane if wanted. Without memory for
    /// the first, the pane is not shown.
    void InitialUpdatePane(CViewPane *pane, UDocument *document, int makeVisible);

private:
    friend class UDocument;
    struct UnfinishedDocument;

    void Forget(UDocument *document);
    void ShowIn(CViewPane *pane, UDocument *document);

    unsigned resourceId_;
    DocumentFactory makeDocument_;
    PaneFactory makePane_;
    ViewFactory makeView_;
    QString creatorName_;
    std::vector<UDocument *> documents_;
};
