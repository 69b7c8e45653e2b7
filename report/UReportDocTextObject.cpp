#include "UReportDoc.h"

#include "EditedText.h"
#include "MemoryLasts.h"
#include "ReportParts.h"
#include "ReportViews.h"
#include "UApplication.h"
#include "UView.h"

#include <QBuffer>

namespace
{

/// What the user has made of a report's text in its views: of several, what the last one shows.
QString editedText(const UReportDoc &report)
{
    QString edited;
    for (UView *view : kareport::reportViews(report)) {
        auto *port = dynamic_cast<kareport::ReportViewPort *>(view);
        port->loadIfStale(); // the report was written again, and the view is hidden
        QBuffer bytes;
        bytes.open(QIODevice::WriteOnly);
        if (port->streamPlainText(bytes) && bytes.size() > 0) {
            // The receiving side expects the bytes of the plain text two to a character.
            edited = kareport::textOfBytes(bytes.data());
        }
    }
    return kareport::wrappedText(kareport::printableText(edited));
}

} // namespace

void UReportDoc::SetTextObject(void *object, unsigned id)
{
    parts_->textObject = object;
    parts_->textObjectId = id;
}

bool UReportDoc::HasTextObj() const
{
    return parts_->textObjectId != 0;
}

void *UReportDoc::GetTextObject() const
{
    return parts_->textObject;
}

void UReportDoc::SaveText()
{
    if (!HasTextObj() || GetTextObject() == nullptr) {
        return;
    }
    kareport::doneWhileMemoryLasts([this] {
        const QString text = editedText(*this);
        // The pointer may be stale.
        const UApplication *application = UApplication::Get();
        if (text.isEmpty() || application == nullptr || !application->IsOpen(GetTextObject())) {
            return;
        }
        auto *receiver = static_cast<UDocument *>(GetTextObject());
        const bool taken = receiver->OnTextReceived(parts_->textObjectId, text);
        if (!IsReportAvailable(this)) {
            return; // the receiver has closed the report
        }
        if (!taken || !application->IsOpen(GetTextObject())) {
            SetTextObject(nullptr, 0);
        }
    });
}
