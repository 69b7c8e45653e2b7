#include "UReportDoc.h"

#include "DataWriter.h"
#include "FieldFormatter.h"
#include "Folders.h"
#include "MemoryLasts.h"

#include <QDir>

#include <utility>

namespace
{

QString fileIn(QString folder, const QString &fileName)
{
    if (!folder.endsWith(u'/') && !folder.endsWith(QDir::separator())) {
        folder += QDir::separator();
    }
    return folder + fileName;
}

} // namespace

bool UReportDoc::LoadTemplateXml(const QString &fileName, const QString &templateName, const QString &tableName,
                                 const QString &blockName)
{
    return kareport::whileMemoryLasts(false,
                                      [&] { return loadTemplate(fileName, templateName, tableName, blockName); });
}

bool UReportDoc::loadTemplate(const QString &fileName, const QString &templateName, const QString &tableName,
                              const QString &blockName)
{
    // The handles point into the template that goes: they go with it.
    table_.reset();
    block_.reset();
    template_ = std::make_unique<UXmlReportTpl>();
    if (!template_->LoadTemplate(fileIn(GetLibraryDir(false), fileName), templateName) &&
        !template_->LoadTemplate(fileIn(GetStartPathName(), fileName), templateName))
    {
        return false;
    }
    pageBreaks_ = template_->GetPageBreakXmlOption();
    // The option is a signed 8-bit character and is widened with its sign.
    separator_ =
        static_cast<char16_t>(static_cast<qint16>(static_cast<signed char>(template_->GetSeparatorXmlOption())));
    if (!tableName.isEmpty() && !LoadTemplateTable(tableName)) {
        return false;
    }
    if (!blockName.isEmpty() && !LoadTemplateBlock(blockName)) {
        return false;
    }
    const quint64 losses = page_.losses();
    SetTitle(template_->GetTemplateTitle());
    return page_.losses() == losses;
}

bool UReportDoc::LoadTemplateTable(const QString &tableName)
{
    table_.reset();
    return kareport::whileMemoryLasts(false, [&] {
        if (!template_) {
            return false;
        }
        auto table = std::make_unique<UXmlReportTable>();
        table->SetColumnSeparator(static_cast<char>(separator_ & 0xFF));
        if (!table->LoadTable(tableName, template_.get())) {
            return false;
        }
        if (template_->SetNorthEastTableFieldOrder(tableName, static_cast<ORIENTATION_ORDER>(settings_.northEastOrder)))
        {
            table->ReorderingHeading();
        }
        if (!table->IsLoaded()) {
            return false;
        }
        table_ = std::move(table); // not before it is whole: what cannot be loaded is not written either
        return true;
    });
}

bool UReportDoc::LoadTemplateBlock(const QString &blockName)
{
    block_.reset();
    return kareport::whileMemoryLasts(false, [&] {
        if (!template_) {
            return false;
        }
        auto block = std::make_unique<UXmlReportBlock>();
        if (!block->LoadBlock(blockName, template_.get())) {
            return false;
        }
        block_ = std::move(block);
        return true;
    });
}

kareport::FormatOptions UReportDoc::formatOptions() const
{
    return {&settings_, separator_, zeroBlank_, printHash_};
}

QString UReportDoc::FormatXmlStringToDisplay(const sXmlReportField *field, int kind, const void *value,
                                             const QString &offsetStyle) const
{
    // A column of a template may be wider than there is memory.
    return kareport::whileMemoryLasts(QString(), [&] {
        kareport::TextBuffer text;
        kareport::FieldFormatter(*field).append(text, formatOptions(), kind, value, offsetStyle);
        return text.view().toString();
    });
}

/// Writes data. @return whether all of it was written
template <typename Work>
bool UReportDoc::writeData(Work write)
{
    if (page_.losesNothing(write)) {
        return true;
    }
    page_.setHeading({QString(), 0, 2}); // a table's own must not stand over what is written next
    return false;
}

bool UReportDoc::WriteDataBlock(const UDataObject *object, int linesBefore, int linesAfter)
{
    if (!block_ || !block_->IsLoaded() || object == nullptr) {
        return false;
    }
    return writeData([&] {
        const kareport::FormatOptions options = formatOptions();
        kareport::DataWriter(page_, options).writeBlock(*block_, *object, linesBefore, linesAfter);
    });
}

bool UReportDoc::WriteDataBlock(const QString &blockName, const UDataObject *object, int linesBefore, int linesAfter)
{
    return LoadTemplateBlock(blockName) && WriteDataBlock(object, linesBefore, linesAfter);
}

bool UReportDoc::WriteDataTable(UDataObjectList *list, int linesBefore, int linesAfter, int headingLinesAfter)
{
    if (!table_ || !table_->IsLoaded() || list == nullptr) {
        return false;
    }
    return writeData([&] {
        const kareport::FormatOptions options = formatOptions();
        kareport::DataWriter(page_, options)
            .writeTable(*table_, *list, {linesBefore, linesAfter, headingLinesAfter, chainageLabel_, writeTableName_});
    });
}

bool UReportDoc::WriteDataTable(const QString &tableName, UDataObjectList *list, int linesBefore, int linesAfter,
                                int headingLinesAfter)
{
    return LoadTemplateTable(tableName) && WriteDataTable(list, linesBefore, linesAfter, headingLinesAfter);
}

void UReportDoc::SetDataColumnSeparator(char16_t separator, bool raw)
{
    separator_ = raw ? u'\xFF' : separator;
}

void UReportDoc::SetExcelFormat()
{
    SetHeaderFlag(false);
    separator_ = u'\t';
}
