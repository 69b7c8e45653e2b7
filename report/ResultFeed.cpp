#include "ResultFeed.h"

#include "DataWriter.h"
#include "PageMark.h"
#include "UPointNumber.h"
#include "UXmlReportBlock.h"
#include "UXmlReportTable.h"

namespace kareport
{

namespace
{

/// The fields of a table or a block without markers, each with the suffix that one before it says.
template <typename Record>
std::vector<ResultColumn> columnsOf(const Record &record)
{
    std::vector<ResultColumn> columns;
    QChar suffix;
    for (int i = 0; i < record.GetFieldsCount(); ++i) {
        ResultColumn column;
        column.field = record.GetField(i);
        switch (fieldMarker(column.field.VariableName)) {
        case FieldMarker::SuffixR: suffix = u'R'; continue;
        case FieldMarker::SuffixPlus: suffix = u'+'; continue;
        case FieldMarker::Filler: break;
        case FieldMarker::None:
            column.suffix = suffix;
            column.field.Label.remove(QChar(pageMark)); // there are no pages
            columns.push_back(std::move(column));
            break;
        }
        suffix = QChar();
    }
    return columns;
}

/// The text that is a value; empty for one that is none.
QStringView textOf(const UDictEntry *entry)
{
    if (entry == nullptr) {
        return {};
    }
    switch (entry->kind()) {
    case ValueKind::Text: return *static_cast<const QString *>(entry->GetData());
    case ValueKind::PointNumber: return static_cast<const UPointNumber *>(entry->GetData())->Convert();
    default: return {};
    }
}

} // namespace

void ResultFeed::begin(ResultTable &table)
{
    table.settings = options_.settings;
    isOpen_ = sink_->beginTable(table);
    row_.cells.resize(table.columns.size());
    texts_.clear();
    ends_.clear();
}

void ResultFeed::beginTable(const UXmlReportTable &table, const QString &chainageLabel, bool addsPrinted)
{
    if (sink_ == nullptr) {
        return;
    }
    ResultTable result;
    result.name = table.GetTableName();
    result.addsPrinted = addsPrinted;
    result.columns = columnsOf(table);
    const QString word = chainageWordOf(table.GetHeading());
    for (ResultColumn &column : result.columns) {
        column.field.Label.replace(word, chainageLabel);
    }
    begin(result);
}

void ResultFeed::beginBlock(const UXmlReportBlock &block)
{
    if (sink_ == nullptr) {
        return;
    }
    ResultTable result;
    result.isTable = false;
    result.columns = columnsOf(block);
    for (ResultColumn &column : result.columns) {
        column.suffix = QChar(); // a block has no markers
    }
    begin(result);
}

void ResultFeed::take(const FieldFormatter &field, const UDictEntry *entry, QStringView suffix, QStringView shown,
                      Shown how)
{
    if (field.showsText()) {
        texts_.append(textOf(entry)); // with the blanks that the data has around it
    } else if (options_.printHash && how == Shown::TooWide) {
        FormatOptions whole = options_;
        whole.printHash = false;
        whole.separator = u'\t'; // without blanks
        field.append(texts_, whole, entry != nullptr ? entry->kind() : ValueKind::None,
                     entry != nullptr ? entry->GetData() : nullptr, suffix);
    } else {
        texts_.append(shown.trimmed());
    }
    // A text that another variable of the same identifier has is not a number.
    row_.cells[ends_.size()].value = entry != nullptr && field.shows(entry->kind()) ? entry : nullptr;
    ends_.push_back(texts_.size());
}

void ResultFeed::skip()
{
    row_.cells[ends_.size()].value = nullptr;
    ends_.push_back(texts_.size());
}

void ResultFeed::endRow(const UDataObject &object, int level)
{
    std::size_t start = 0;
    for (std::size_t i = 0; i < ends_.size(); ++i) {
        row_.cells[i].text =
            texts_.view().sliced(static_cast<qsizetype>(start), static_cast<qsizetype>(ends_[i] - start));
        start = ends_[i];
    }
    row_.object = &object;
    row_.level = level;
    sink_->addRow(row_);
    dropRow();
}

void ResultFeed::dropRow()
{
    texts_.clear();
    ends_.clear();
}

void ResultFeed::addTotals(ResultRowKind kind, const std::vector<ResultTotal> &totals, int level)
{
    std::vector<UDictEntry> entries;
    entries.reserve(totals.size()); // the cells point into it
    ResultRow row;
    row.kind = kind;
    row.level = level;
    for (const ResultTotal &total : totals) {
        ResultCell &cell = row.cells.emplace_back();
        cell.text = total.text;
        cell.total = total.total;
        if (total.kind == ResultTotal::Kind::Number) {
            cell.value = &entries.emplace_back(0U, total.number);
        } else if (total.kind == ResultTotal::Kind::Whole) {
            cell.value = &entries.emplace_back(0U, static_cast<qint32>(total.number));
        }
    }
    sink_->addRow(row);
}

void ResultFeed::endTable()
{
    if (isOpen_) {
        sink_->endTable();
        isOpen_ = false;
    }
}

} // namespace kareport
