#include "UDocument.h"

#include "AppMessageBox.h"
#include "ReplaceFile.h"
#include "UArchive.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>

// A document and the file that it is opened from and saved in.

bool UDocument::OnNewDocument()
{
    DeleteContents();
    path_.clear();
    SetModifiedFlag(false);
    OnDocumentEvent(DocumentEvent::AfterNewDocument);
    return true;
}

bool UDocument::OnOpenDocument(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return false;
    }
    DeleteContents();
    SetModifiedFlag(true); // until all of it has been read
    UArchive archive(file, UArchive::Mode::Loading, QFileInfo(path).absoluteFilePath());
    const std::weak_ptr<const bool> life = life_;
    Serialize(archive);
    if (life.expired()) {
        return false; // what took the text has closed the document
    }
    if (!archive.IsGood()) {
        DeleteContents();
        return false;
    }
    SetModifiedFlag(false);
    OnDocumentEvent(DocumentEvent::AfterOpenDocument);
    return true;
}

bool UDocument::OnSaveDocument(const QString &path)
{
    const bool saved = kareport::replaceFile(path, [&](QIODevice &device) {
        UArchive archive(device, UArchive::Mode::Storing, QFileInfo(path).absoluteFilePath());
        Serialize(archive);
        return archive.IsGood();
    });
    if (saved) {
        SetModifiedFlag(false);
        OnDocumentEvent(DocumentEvent::AfterSaveDocument);
    }
    return saved;
}

void UDocument::Serialize(UArchive & /*archive*/) {}

bool UDocument::DoSave(const QString &path, bool replace)
{
    if (path.isEmpty() || !OnSaveDocument(path)) {
        return false;
    }
    if (replace) {
        SetPathName(path, true);
    }
    return true;
}

bool UDocument::DoFileSave()
{
    return DoSave(path_, path_.isEmpty());
}

bool UDocument::SaveModified()
{
    if (!IsModified()) {
        return true;
    }
    const QString question = Xlate("Save changes to %1?").arg(title_.isEmpty() ? Xlate("Untitled") : title_);
    const std::weak_ptr<const bool> life = life_;
    const MessageAnswer answer = AppMessageBox(question, MessageButtons::YesNoCancel);
    if (life.expired()) {
        return false; // it was closed while the question was open: there is nothing left to save or to close
    }
    switch (answer) {
    case MessageAnswer::Yes: return DoFileSave();
    case MessageAnswer::No: return true;
    default: return false;
    }
}
