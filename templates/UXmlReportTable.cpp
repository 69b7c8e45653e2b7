#include "UXmlReportTable.h"

#include "FieldMarker.h"
#include "MemoryLasts.h"
#include "TextFolding.h"

#include <algorithm>

namespace
{

/// The blanks that fill one column of a heading are never more than this.
constexpr qsizetype mostHeadingBlanks = 98;

} // namespace

bool UXmlReportTable::LoadTable(const QString &tableName, const UXmlReportTpl *reportTemplate)
{
    dictionary_ = nullptr;
    table_ = nullptr;
    sortList_ = nullptr;
    if (reportTemplate == nullptr) {
        return false;
    }
    table_ = reportTemplate->GetTable(tableName);
    if (table_ == nullptr) {
        return false;
    }
    dictionary_ = reportTemplate->GetDictionary(table_->Use);
    if (dictionary_ == nullptr) {
        table_ = nullptr;
        return false;
    }
    option_ = reportTemplate->GetOption();
    sortList_ = reportTemplate->GetSortList(tableName);
    ReorderingHeading();
    return IsLoaded();
}

sXmlReportField UXmlReportTable::GetField(int index) const
{
    return index >= 0 && index < GetFieldsCount() ? table_->Fields[static_cast<std::size_t>(index)] : sXmlReportField();
}

int UXmlReportTable::GetFieldsCount() const
{
    return table_ != nullptr ? static_cast<int>(table_->Fields.size()) : 0;
}

void UXmlReportTable::ReorderingHeading()
{
    if (!kareport::doneWhileMemoryLasts([this] { CreateHeading(); })) {
        table_ = nullptr; // a table without its heading, or with one of other columns, is of no use
    }
}

void UXmlReportTable::CreateHeading()
{
    const QString separator(option_ != nullptr ? QLatin1Char(ColumnSeparator) : QLatin1Char(' '));
    const bool fill = separator != u"\t";
    QString heading;
    for (int i = 0; i < GetFieldsCount(); ++i) {
        const sXmlReportField &field = table_->Fields[static_cast<std::size_t>(i)];
        const qsizetype missing = fill ? field.Width - field.Label.size() : 0;
        const QString blanks(std::clamp<qsizetype>(missing, 0, mostHeadingBlanks), u' ');
        const bool right = kareport::equalFolded(field.Align, u"R");
        heading += right ? blanks + field.Label : field.Label + blanks;
        // A marker joins the column that follows it.
        if (i + 1 < GetFieldsCount() && kareport::fieldMarker(field.VariableName) == kareport::FieldMarker::None) {
            heading += separator;
        }
    }
    if (!heading.isEmpty()) {
        Heading = heading;
    }
}

bool UXmlReportTable::GetSortList(std::vector<quint32> &ids) const
{
    ids.clear();
    return sortList_ == nullptr || kareport::doneWhileMemoryLasts([&] {
               ids.reserve(sortList_->Entries.size());
               for (const sXmlSortVariable &entry : sortList_->Entries) {
                   ids.push_back(entry.ID);
               }
           });
}

QString UXmlReportTable::GetColumnSeparator() const
{
    return kareport::whileMemoryLasts(QString(), [this] { return QString(QLatin1Char(ColumnSeparator)); });
}
