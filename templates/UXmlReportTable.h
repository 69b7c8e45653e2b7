#pragma once

#include "KaReportExport.h"
#include "UXmlReportTpl.h"

#include <QString>

#include <vector>

/// A handle to a table of a template, with the table's heading line. It points into the template that loaded it, which
/// must outlive it; copies point to the same records.
class KAREPORT_EXPORT UXmlReportTable
{
public:
    /// Points to the table of a name and its dictionary, sort keys and options, and builds the heading.
    /// @return false, and points to nothing, for a null template, an unknown table or one whose dictionary is missing; the
    ///         heading then stays as it was, as it does for a table without fields
    bool LoadTable(const QString &tableName, const UXmlReportTpl *reportTemplate);

    /// Whether the handle points to a table.
    bool IsLoaded() const { return table_ != nullptr; }

    /// A copy of the field at an index from 0; outside, a field with empty texts and zeros.
    sXmlReportField GetField(int index) const;
    /// 0 when no table is loaded.
    int GetFieldsCount() const;

    /// The labels, each filled with up to 98 blanks to its column's width, with the separator between them; joined by
    /// tabs alone where the separator is a tab. No separator follows a marker field.
    QString GetHeading() const { return Heading; }
    /// Builds the heading again, after the template's columns were put into another order.
    void ReorderingHeading();

    /// Replaces `ids` by the dictionary identifiers of the sort keys, none when the table is not sorted.
    /// @return false, with none, when memory runs out
    bool GetSortList(std::vector<quint32> &ids) const;

    /// The column separator as a text of one character.
    QString GetColumnSeparator() const;
    /// Sets the separator of headings built from now on (Latin-1).
    void SetColumnSeparator(char separator) { ColumnSeparator = separator; }

    /// The table's name. Only for a loaded table.
    QString GetTableName() const { return table_->Name; }

private:
    void CreateHeading();

    const sXmlReportDictionary *dictionary_ = nullptr;
    const sXmlReportTable *table_ = nullptr;
    const sXmlReportOption *option_ = nullptr;
    const sXmlSortTableReport *sortList_ = nullptr;
    char ColumnSeparator = '\xFF';
    QString Heading;
};
