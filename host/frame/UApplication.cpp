#include "UApplication.h"

#include "MemoryLasts.h"

#include <algorithm>
#include <utility>

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
    CloseAllDocuments();
    templates_.clear();
    currentApplication() = nullptr;
}

UApplication *UApplication::Get()
{
    return currentApplication();
}

UDocTemplate *UApplication::AddDocTemplate(std::unique_ptr<UDocTemplate> docTemplate)
{
    return kareport::whileMemoryLasts<UDocTemplate *>(
        nullptr, [&] { return templates_.emplace_back(std::move(docTemplate)).get(); });
}

std::vector<UDocument *> UApplication::GetDocuments() const
{
    std::vector<UDocument *> documents;
    for (const auto &docTemplate : templates_) {
        documents.insert(documents.end(), docTemplate->GetDocuments().begin(), docTemplate->GetDocuments().end());
    }
    return documents;
}

bool UApplication::IsOpen(const void *document) const
{
    // Nothing is collected: it is asked where memory has ended as well.
    return std::any_of(templates_.begin(), templates_.end(), [document](const auto &docTemplate) {
        const std::vector<UDocument *> &documents = docTemplate->GetDocuments();
        return std::any_of(documents.begin(), documents.end(),
                           [document](const UDocument *open) { return open == document; });
    });
}

void UApplication::CloseAllDocuments()
{
    for (const auto &docTemplate : templates_) {
        docTemplate->CloseAllDocuments();
    }
}

void UApplication::AddToRecentFileList(const QString &path)
{
    // Made again, so that the list stays as it is when memory ends.
    kareport::doneWhileMemoryLasts([&] {
        QStringList files;
        files.append(path);
        for (const QString &file : std::as_const(recentFiles_)) {
            if (file != path && files.size() < mostRecentFiles) {
                files.append(file);
            }
        }
        recentFiles_ = std::move(files);
    });
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
