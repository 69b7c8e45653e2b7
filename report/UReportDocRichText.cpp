#include "UReportDoc.h"

#include "MemoryLasts.h"
#include "ReportParts.h"
#include "SingleByteText.h"

using kareport::RichTextImage;
using kareport::WideCharacters;

void UReportDoc::SetRTFDataFlag(bool on)
{
    parts_->page.losesNothing([&] { parts_->mirrors.image.setOn(on); });
}

bool UReportDoc::GetRTFDataFlag() const
{
    return parts_->mirrors.image.isOn();
}

bool UReportDoc::ResetFormatString(QString &document)
{
    return kareport::whileMemoryLasts(false, [&document] { return RichTextImage::cutToParagraph(document); });
}

void UReportDoc::WriteRTFData(const QString &text, int style)
{
    if (!parts_->mirrors.image.write(text, style, parts_->mirrors.imageForm)) {
        parts_->page.noteLostText();
    }
}

void UReportDoc::GetRTFData(QString &document) const
{
    document = kareport::whileMemoryLasts(QString(), [this] {
        const QString image =
            parts_->mirrors.image.document(parts_->layout.fontName, parts_->layout.fontSize, parts_->mirrors.imageForm);
        return image.isEmpty() ? QStringLiteral("") : image;
    });
}

void UReportDoc::GetFontTableData(QString &table) const
{
    table = kareport::whileMemoryLasts(
        QString(), [this] { return RichTextImage::fontTable(parts_->layout.fontName, parts_->layout.fontSize); });
}

bool UReportDoc::WriteFontTable(QIODevice &device) const
{
    return kareport::whileMemoryLasts(false, [&] {
        const QString table = RichTextImage::fontTable(parts_->layout.fontName, parts_->layout.fontSize);
        return kareport::writeSingleByteText(device, table, WideCharacters::RichTextEscape);
    });
}

bool UReportDoc::WriteRichTextFile(QIODevice &device) const
{
    return !HasLostText() && kareport::whileMemoryLasts(false, [&] {
        const QString document =
            parts_->mirrors.image.document(parts_->layout.fontName, parts_->layout.fontSize, parts_->mirrors.imageForm);
        return kareport::writeSingleByteText(
            device, document, IsExternalExcel() ? WideCharacters::QuestionMark : WideCharacters::RichTextEscape);
    });
}
