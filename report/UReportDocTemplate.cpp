#include "UReportDoc.h"

#include "DataWriter.h"
#include "MemoryLasts.h"
#include "ReportParts.h"

namespace
{

/// Writes data. @return whether all of it was written
template <typename Work>
bool writeData(kareport::PageWriter &page, Work write)
{
    if (page.losesNothing(write)) {
        return true;
    }
    page.setHeading({QString(), 0, 2}); // a table's own must not be the heading of what is written next
    return false;
}

} // namespace

bool UReportDoc::LoadTemplateXml(const QString &fileName, const QString &templateName, const QString &tableName,
                                 const QString &blockName)
{
    return kareport::whileMemoryLasts(
        false, [&] { return loadTemplate(kareport::templatePaths(fileName), templateName, tableName, blockName); });
}

bool UReportDoc::LoadTemplateFile(const QString &path, const QString &templateName, const QString &tableName,
                                  const QString &blockName)
{
    return kareport::whileMemoryLasts(false, [&] {
        QStringList paths; // not made of its member in braces, which does not survive when memory runs out
        paths.append(path);
        return loadTemplate(paths, templateName, tableName, blockName);
    });
}

bool UReportDoc::loadTemplate(const QStringList &paths, const QString &templateName, const QString &tableName,
                              const QString &blockName)
{
    if (!parts_->data.load(paths, templateName, tableName, blockName)) {
        return false;
    }
    const quint64 losses = parts_->page.losses();
    SetTitle(parts_->data.loaded()->GetTemplateTitle());
    return parts_->page.losses() == losses;
}

bool UReportDoc::LoadTemplateTable(const QString &tableName)
{
    return kareport::whileMemoryLasts(false, [&] { return parts_->data.loadTable(tableName); });
}

bool UReportDoc::LoadTemplateBlock(const QString &blockName)
{
    return kareport::whileMemoryLasts(false, [&] { return parts_->data.loadBlock(blockName); });
}

const UXmlReportTpl *UReportDoc::GetTemplate() const
{
    return parts_->data.loaded();
}

QString UReportDoc::FormatXmlStringToDisplay(const sXmlReportField *field, int kind, const void *value,
                                             const QString &offsetStyle) const
{
    // A column of a template may be wider than there is memory.
    return kareport::whileMemoryLasts(QString(), [&] {
        kareport::TextBuffer text;
        kareport::FieldFormatter(*field).append(text, parts_->data.formatOptions(),
                                                static_cast<kareport::ValueKind>(kind), value, offsetStyle);
        return text.view().toString();
    });
}

bool UReportDoc::WriteDataBlock(const UDataObject *object, int linesBefore, int linesAfter)
{
    const UXmlReportBlock *block = parts_->data.block();
    if (block == nullptr || !block->IsLoaded() || object == nullptr) {
        return false;
    }
    return writeData(parts_->page, [&] {
        const kareport::FormatOptions options = parts_->data.formatOptions();
        kareport::DataWriter(parts_->page, options, parts_->data.results, parts_->hooks.cells)
            .writeBlock(*block, *object, linesBefore, linesAfter, parts_->data.remarks, parts_->data.blockName());
    });
}

bool UReportDoc::WriteDataBlock(const QString &blockName, const UDataObject *object, int linesBefore, int linesAfter)
{
    return LoadTemplateBlock(blockName) && WriteDataBlock(object, linesBefore, linesAfter);
}

bool UReportDoc::WriteDataTable(UDataObjectList *list, int linesBefore, int linesAfter, int headingLinesAfter)
{
    const UXmlReportTable *table = parts_->data.table();
    if (table == nullptr || !table->IsLoaded() || list == nullptr) {
        return false;
    }
    return writeData(parts_->page, [&] {
        const kareport::FormatOptions options = parts_->data.formatOptions();
        kareport::DataWriter(parts_->page, options, parts_->data.results, parts_->hooks.cells)
            .writeTable(*table, *list,
                        {linesBefore, linesAfter, headingLinesAfter, parts_->chainageLabel, parts_->writeTableName,
                         parts_->data.remarks});
    });
}

bool UReportDoc::WriteDataTable(const QString &tableName, UDataObjectList *list, int linesBefore, int linesAfter,
                                int headingLinesAfter)
{
    return LoadTemplateTable(tableName) && WriteDataTable(list, linesBefore, linesAfter, headingLinesAfter);
}

void UReportDoc::SetJobSettings(const UJobSettings &settings)
{
    parts_->data.settings = settings;
}

const UJobSettings &UReportDoc::GetJobSettings() const
{
    return parts_->data.settings;
}

void UReportDoc::SetChainageLabel(const QString &label)
{
    parts_->chainageLabel = label;
}

void UReportDoc::SetDataColumnSeparator(char16_t separator, bool raw)
{
    parts_->data.separator = raw ? u'\xFF' : separator;
}

char16_t UReportDoc::GetDataColumnSeparator() const
{
    return parts_->data.separator;
}

void UReportDoc::SetExcelFormat()
{
    SetHeaderFlag(false);
    parts_->data.separator = u'\t';
}

void UReportDoc::WriteTableName(bool on)
{
    parts_->writeTableName = on;
}

void UReportDoc::SetZeroBlank(bool on)
{
    parts_->data.zeroBlank = on;
}

bool UReportDoc::IsZeroBlank() const
{
    return parts_->data.zeroBlank;
}

bool UReportDoc::GetPageBreaks() const
{
    return parts_->data.pageBreaks;
}
