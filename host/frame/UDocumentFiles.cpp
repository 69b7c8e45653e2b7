#include "UDocument.h"

#include "AppMessageBox.h"
#include "MemoryLasts.h"
#include "ReplaceFile.h"
#include "UArchive.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>

// A document and the file that it is opened from and saved in. What a document has become stays so when those who are told of
// it have no memory.

bool UDocument::OnNewDocument()
{
    const bool isEmptied = kareport::doneWhileMemoryLasts([this] { DeleteContents(); });
    if (!isEmptied) {
        return false;
    }
    path_.clear();
    SetModifiedFlag(false);
    kareport::doneWhileMemoryLasts([this] { OnDocumentEvent(DocumentEvent::AfterNewDocument); });
    return true;
}

bool UDocument::OnOpenDocument(const QString &path)
{
    const std::weak_ptr<const bool> life = life_;
    bool isEmptied = false;
    const bool isLoaded = kareport::whileMemoryLasts(false, [&] {
        QFile file(path);
        if (!file.open(QIODevice::ReadOnly)) {
            return false;
        }
        UArchive archive(file, UArchive::Mode::Loading, QFileInfo(path).absoluteFilePath());
        isEmptied = true;
        DeleteContents();
        SetModifiedFlag(true); // until all of it has been read
        Serialize(archive);
        return archive.IsGood();
    });
    if (life.expired()) {
        return false; // what took the text has closed the document
    }
    if (!isLoaded) {
        if (isEmptied) {
            kareport::doneWhileMemoryLasts([this] { DeleteContents(); }); // of what has been read
        }
        return false;
    }
    SetModifiedFlag(false);
    kareport::doneWhileMemoryLasts([this] { OnDocumentEvent(DocumentEvent::AfterOpenDocument); });
    return true;
}

bool UDocument::OnSaveDocument(const QString &path)
{
    const bool saved = kareport::whileMemoryLasts(false, [&] {
        return kareport::replaceFile(path, [&](QIODevice &device) {
            UArchive archive(device, UArchive::Mode::Storing, QFileInfo(path).absoluteFilePath());
            Serialize(archive);
            return archive.IsGood();
        });
    });
    if (saved) {
        SetModifiedFlag(false);
        kareport::doneWhileMemoryLasts([this] { OnDocumentEvent(DocumentEvent::AfterSaveDocument); });
    }
    return saved;
}

void UDocument::Serialize(UArchive & /*archive*/) {}

bool UDocument::DoSave(const QString &path, bool replace)
{
    const bool wasModified = IsModified();
    const std::weak_ptr<const bool> life = life_;
    if (path.isEmpty() || !OnSaveDocument(path)) {
        return false;
    }
    if (!replace || life.expired()) {
        return true; // who was told of the save may have closed the document
    }
    SetPathName(path, true);
    if (path_ != path) {
        SetModifiedFlag(wasModified); // without memory for the path, the document belongs to another file, or to none
        return false;
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
    const std::weak_ptr<const bool> life = life_;
    // Where there is no memory for the question, nothing is closed.
    const MessageAnswer answer = kareport::whileMemoryLasts(MessageAnswer::Cancel, [this] {
        const QString question = Xlate("Save changes to %1?").arg(title_.isEmpty() ? Xlate("Untitled") : title_);
        return AppMessageBox(question, MessageButtons::YesNoCancel);
    });
    if (life.expired()) {
        return false; // it was closed while the question was open: there is nothing left to save or to close
    }
    switch (answer) {
    case MessageAnswer::Yes: return DoFileSave();
    case MessageAnswer::No: return true;
    default: return false;
    }
}
