#include "UReportDoc.h"

#include "MemoryLasts.h"
#include "SingleByteText.h"

using kareport::RichTextImage;
using kareport::WideCharacters;

RichTextImage::Form UReportDoc::imageForm() const
{
    return IsExternalExcel() ? RichTextImage::Form::BareText : RichTextImage::Form::RichText;
}

void UReportDoc::SetRTFDataFlag(bool on)
{
    page_.losesNothing([&] { image_.setOn(on); });
}

bool UReportDoc::ResetFormatString(QString &document)
{
    return kareport::whileMemoryLasts(false, [&document] { return RichTextImage::cutToParagraph(document); });
}

void UReportDoc::WriteRTFData(const QString &text, int style)
{
    if (!image_.write(text, style, imageForm())) {
        page_.noteLostText();
    }
}

void UReportDoc::GetRTFData(QString &document) const
{
    document =
        kareport::whileMemoryLasts(QString(), [this] { return image_.document(fontName_, fontSize_, imageForm()); });
}

void UReportDoc::GetFontTableData(QString &table) const
{
    table = kareport::whileMemoryLasts(QString(), [this] { return RichTextImage::fontTable(fontName_, fontSize_); });
}

bool UReportDoc::WriteFontTable(QIODevice &device) const
{
    return kareport::whileMemoryLasts(false, [&] {
        return kareport::writeSingleByteText(device, RichTextImage::fontTable(fontName_, fontSize_),
                                             WideCharacters::RichTextEscape);
    });
}

bool UReportDoc::WriteRichTextFile(QIODevice &device) const
{
    return !HasLostText() && kareport::whileMemoryLasts(false, [&] {
        return kareport::writeSingleByteText(device, image_.document(fontName_, fontSize_, imageForm()),
                                             IsExternalExcel() ? WideCharacters::QuestionMark
                                                               : WideCharacters::RichTextEscape);
    });
}
