#pragma once

#include "DataRemarks.h"
#include "FieldFormatter.h"
#include "UJobSettings.h"
#include "UXmlReportBlock.h"
#include "UXmlReportTable.h"
#include "UXmlReportTpl.h"

#include <QString>
#include <QStringList>

#include <memory>
#include <optional>

namespace kareport
{

class ResultSink;

/// The template that a report's data is written through, with one table and one block of it, and what the texts of the
/// values depend on besides their fields.
///
/// The functions throw `std::bad_alloc` when memory runs out. What a failed load was to replace is lost.
class ReportTemplate
{
public:
    UJobSettings settings;
    char16_t separator = u' ';            ///< between columns; a template that is loaded brings its own
    bool pageBreaks = true;               ///< the option of the template that was loaded last
    bool zeroBlank = false;               ///< values of zero show as blanks
    static inline bool printHash = false; ///< values wider than their column show as "#": one setting for all reports
    std::optional<bool> ownPrintHash;     ///< instead of that; nothing for none
    DataRemarks *remarks = nullptr;     ///< receives what a table does not show as it is; null when they are not wanted
    ResultSink *results = nullptr;      ///< receives the values that are written; null when they are not wanted
    UXmlReportTpl::LabelText labelText; ///< what is shown of the labels of templates that are loaded; null for all

    /// Loads a template from the first of the files that has it, and then the table and the block unless their names are
    /// empty. @return false when one of them cannot be loaded
    bool load(const QStringList &paths, const QString &templateName, const QString &tableName,
              const QString &blockName);
    /// Loads a table, or a block, of the template. @return false without a template, or when it has none of the name
    bool loadTable(const QString &name);
    bool loadBlock(const QString &name);

    // Null where none is loaded.
    const UXmlReportTpl *loaded() const { return template_.get(); }
    const UXmlReportTable *table() const { return table_.get(); }
    const UXmlReportBlock *block() const { return block_.get(); }
    /// The name that the block was loaded by.
    const QString &blockName() const { return blockName_; }

    /// How values become texts. It points into this object.
    FormatOptions formatOptions() const { return {&settings, separator, zeroBlank, ownPrintHash.value_or(printHash)}; }

private:
    std::unique_ptr<UXmlReportTpl> template_;
    std::unique_ptr<UXmlReportTable> table_; ///< a handle into the template, as the block is
    std::unique_ptr<UXmlReportBlock> block_;
    QString blockName_;
};

/// Where a template file of a name may be, in the order that counts: in the library folder and in the start folder.
QStringList templatePaths(const QString &fileName);

} // namespace kareport
