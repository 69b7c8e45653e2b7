#include "UApplication.h"

namespace
{

constexpr qsizetype mostRecentFiles = 10;

UApplication *&currentApplication()
{
    static UApplication *application = nullptr;
    return application;
}

} // namespace

UApplication::UApplication()
{
    currentApplication() = this;
}

UApplication::~UApplication()
{
    // Documents that close may still ask for the application and its templates.
    for (const auto &docTemplate : templates_) {
        docTemplate->CloseAllDocuments();
    }
    templates_.clear();
    currentApplication() = nullptr;
}

UApplication *UApplication::Get()
{
    return currentApplication();
}

UDocTemplate *UApplication::AddDocTemplate(std::unique_ptr<UDocTemplate> docTemplate)
{
    return templates_.emplace_back(std::move(docTemplate)).get();
}

void UApplication::AddToRecentFileList(const QString &path)
{
    recentFiles_.removeAll(path);
    recentFiles_.prepend(path);
    if (recentFiles_.size() > mostRecentFiles) {
        recentFiles_.removeLast();
    }
}

void UApplication::OnDocumentEvent(UDocument & /*document*/, UDocument::DocumentEvent /*event*/) {}

void UApplication::ForgetReport(const UDocument *report)
{
    if (currentReport_ == report) {
        currentReport_ = nullptr;
    }
}

void UApplication::ForgetView(const UView *view)
{
    if (companionView_ == view) {
        companionView_ = nullptr;
    }
}
