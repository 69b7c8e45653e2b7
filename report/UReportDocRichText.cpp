#include "UReportDoc.h"

#include "SingleByteText.h"

using kareport::RichTextImage;
using kareport::WideCharacters;

RichTextImage::Form UReportDoc::imageForm() const
{
    return IsExternalExcel() ? RichTextImage::Form::BareText : RichTextImage::Form::RichText;
}

void UReportDoc::WriteRTFData(const QString &text, int style)
{
    image_.write(text, style, imageForm());
}

void UReportDoc::GetRTFData(QString &document) const
{
    document = image_.document(fontName_, fontSize_, imageForm());
}

void UReportDoc::GetFontTableData(QString &table) const
{
    table = RichTextImage::fontTable(fontName_, fontSize_);
}

bool UReportDoc::WriteFontTable(QIODevice &device) const
{
    QString table;
    GetFontTableData(table);
    return kareport::writeSingleByteText(device, table, WideCharacters::RichTextEscape);
}

bool UReportDoc::WriteRichTextFile(QIODevice &device) const
{
    QString document;
    GetRTFData(document);
    return kareport::writeSingleByteText(
        device, document, IsExternalExcel() ? WideCharacters::QuestionMark : WideCharacters::RichTextEscape);
}
