// A host's own documents, in place of those of KaReportHost. It shows no windows: what would dock a pane is there and does
// nothing.
#include <KaReport/CPropertyPane.h>
#include <KaReport/PlainWidgets.h>
#include <KaReport/UApplication.h>
#include <KaReport/UArchive.h>
#include <KaReport/UDocTemplate.h>
#include <KaReport/UDocument.h>
#include <KaReport/UView.h>
#include <KaReport/UXTPMDIFrameWnd.h>

#include <QFile>
#include <QLabel>

#include <algorithm>

namespace
{
UApplication *application = nullptr;
}

namespace kareport
{

/// What a pane of this host docks as.
class PaneDock : public QDockWidget
{};

CommandTarget::~CommandTarget() = default;

bool CommandTarget::runCommand(unsigned /*id*/)
{
    return false;
}

bool CommandTarget::updateCommand(unsigned /*id*/, CommandState & /*state*/) const
{
    return false;
}

QLabel *plainLabel(const QString &text, QWidget *parent)
{
    return new QLabel(text, parent);
}

void keepLabelsPlain(const QWidget & /*window*/) {}

} // namespace kareport

UArchive::UArchive(QIODevice &device, Mode mode, QString path) : device_(device), mode_(mode), path_(std::move(path)) {}

void UArchive::Write(QByteArrayView bytes)
{
    good_ = good_ && device_.write(bytes.data(), bytes.size()) == bytes.size();
}

// Application and document templates

UApplication::UApplication()
{
    application = this;
}

UApplication::~UApplication()
{
    templates_.clear();
    application = nullptr;
}

UApplication *UApplication::Get()
{
    return application;
}

UDocTemplate *UApplication::AddDocTemplate(std::unique_ptr<UDocTemplate> docTemplate)
{
    return templates_.emplace_back(std::move(docTemplate)).get();
}

bool UApplication::IsOpen(const void *document) const
{
    return std::any_of(templates_.begin(), templates_.end(), [document](const auto &one) {
        const auto &open = one->GetDocuments();
        return std::find(open.begin(), open.end(), document) != open.end();
    });
}

void UApplication::AddToRecentFileList(const QString & /*path*/) {}
void UApplication::OnDocumentEvent(UDocument & /*document*/, UDocument::DocumentEvent /*event*/) {}

UDocTemplate::UDocTemplate(unsigned resourceId, DocumentFactory makeDocument, PaneFactory makePane,
                           ViewFactory makeView, QString creatorName, int /*savesInFrame*/, int /*reserved*/)
    : resourceId_(resourceId),
      makeDocument_(std::move(makeDocument)),
      makePane_(std::move(makePane)),
      makeView_(std::move(makeView)),
      creatorName_(std::move(creatorName))
{}

UDocTemplate::~UDocTemplate()
{
    while (!documents_.empty()) {
        documents_.back()->OnCloseDocument();
    }
}

UDocument *UDocTemplate::OpenReportDocumentFile(const QString & /*path*/, int /*addToFrame*/, int /*makeVisible*/,
                                                CViewPane * /*pane*/, unsigned /*style*/, const QRect * /*rect*/)
{
    UDocument *document = makeDocument_().release();
    document->docTemplate_ = this;
    documents_.push_back(document);
    document->OnNewDocument();
    return document;
}

CViewPane *UDocTemplate::CreateNewPane(UDocument *, CViewPane *, unsigned, const QRect *)
{
    return nullptr;
}

void UDocTemplate::InitialUpdatePane(CViewPane *, UDocument *, int) {}

void UDocTemplate::Forget(UDocument *document)
{
    std::erase(documents_, document);
}

// Documents

UDocument::UDocument() = default;

UDocument::~UDocument()
{
    if (docTemplate_ != nullptr) {
        docTemplate_->Forget(this);
    }
}

void UDocument::SetTitle(const QString &title)
{
    title_ = title;
}

void UDocument::SetPathName(const QString &path, bool /*addToRecentFiles*/)
{
    path_ = path;
}

bool UDocument::OnNewDocument()
{
    return true;
}

bool UDocument::OnSaveDocument(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly)) {
        return false;
    }
    UArchive archive(file, UArchive::Mode::Storing, path);
    Serialize(archive);
    return archive.IsGood();
}

void UDocument::OnCloseDocument()
{
    DeleteContents();
    delete this;
}

bool UDocument::OnOpenDocument(const QString & /*path*/)
{
    return false;
}

bool UDocument::DoSave(const QString &path, bool /*replace*/)
{
    return OnSaveDocument(path);
}

bool UDocument::DoFileSave()
{
    return OnSaveDocument(path_);
}

bool UDocument::SaveModified()
{
    return true;
}

bool UDocument::CanCloseFrame(CViewPane * /*pane*/)
{
    return true;
}

bool UDocument::IsShown(const CViewPane * /*except*/) const
{
    return false;
}

bool UDocument::OnTextReceived(unsigned /*id*/, const QString & /*text*/)
{
    return false;
}

void UDocument::UpdateAllViews(UView * /*sender*/, long /*hint*/, void * /*hintObject*/) {}
void UDocument::UpdateFrameCounts() {}
void UDocument::Serialize(UArchive & /*archive*/) {}
void UDocument::DeleteContents() {}
void UDocument::OnAutoDelete() {}
void UDocument::OnDocumentEvent(DocumentEvent /*event*/) {}
void UDocument::OnReportClosed(UDocument * /*report*/) {}

// Views, panes and the frame: none is ever made

UView::UView() = default;
UView::~UView() = default;
void UView::OnInitialUpdate() {}
void UView::OnUpdate(UView *, long, void *) {}
void UView::OnActivateView(bool, UView *, UView *) {}

bool UView::IsVisible() const
{
    return false;
}

CViewPane::CViewPane() = default;
CViewPane::~CViewPane() = default;
void CViewPane::AddView(std::unique_ptr<UView> /*view*/) {}
void CViewPane::RemoveView(UView * /*view*/) {}
void CViewPane::SetPlace(CViewPane *, unsigned, const QRect *) {}
void CViewPane::SetWindowTextW(const QString & /*text*/) {}
void CViewPane::UpdateTitle() {}
void CViewPane::ShowPane(bool /*show*/) {}
void CViewPane::BringToTop() {}
void CViewPane::ClosePane() {}
void CViewPane::GetPaneCaptions(QStringList & /*captions*/, const UDocument * /*except*/) {}

UDocument *CViewPane::GetActiveDocument() const
{
    return nullptr;
}

bool CViewPane::CanClosePane()
{
    return true;
}

bool CViewPane::IsOpen(const CViewPane * /*pane*/)
{
    return false;
}

COneViewPane::COneViewPane() = default;
COneViewPane::~COneViewPane() = default;
void COneViewPane::AddView(std::unique_ptr<UView> /*view*/) {}
void COneViewPane::SetPlace(CViewPane *, unsigned, const QRect *) {}
void COneViewPane::UpdateTitle() {}
void COneViewPane::ShowPane(bool /*show*/) {}
void COneViewPane::BringToTop() {}
void COneViewPane::OnSysCommand(unsigned, long) {}
void COneViewPane::SetCaptionState(CaptionState /*state*/) {}
void COneViewPane::MakeDock() {}
void COneViewPane::DropDock() {}

bool COneViewPane::IsVisible() const
{
    return false;
}

bool COneViewPane::IsInFront() const
{
    return false;
}

QDockWidget *COneViewPane::GetDock() const
{
    return nullptr;
}

CPropertyPane::CPropertyPane() = default;
CPropertyPane::~CPropertyPane() = default;
void CPropertyPane::OnUpdateProperties(UDocument * /*document*/) {}
void CPropertyPane::UpdateAllPropertyPane(UDocument * /*document*/) {}

UXTPMDIFrameWnd::UXTPMDIFrameWnd(QWidget *parent) : QMainWindow(parent) {}
UXTPMDIFrameWnd::~UXTPMDIFrameWnd() = default;

UXTPMDIFrameWnd *UXTPMDIFrameWnd::Get()
{
    return nullptr;
}

void UXTPMDIFrameWnd::SetActiveViewForFrameAndPane(UView * /*view*/) {}
void UXTPMDIFrameWnd::ResetActiveViewForFrameAndPane(UView * /*view*/) {}

QAction *UXTPMDIFrameWnd::AddCommand(QMenu & /*menu*/, unsigned /*id*/, const QString & /*text*/)
{
    return nullptr;
}

void UXTPMDIFrameWnd::DockPane(COneViewPane & /*pane*/) {}
void UXTPMDIFrameWnd::DockBar(COneViewPane & /*pane*/, Qt::DockWidgetArea /*area*/) {}
void UXTPMDIFrameWnd::SettlePanes() {}
void UXTPMDIFrameWnd::UpdateCommands() {}

bool UXTPMDIFrameWnd::CanAct(unsigned /*command*/) const
{
    return true;
}

bool UXTPMDIFrameWnd::event(QEvent *event)
{
    return QMainWindow::event(event);
}

const std::vector<kareport::Command> &UXTPMDIFrameWnd::commands() const
{
    static const std::vector<kareport::Command> none;
    return none;
}
