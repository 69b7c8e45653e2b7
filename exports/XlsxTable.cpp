#include "XlsxResult.h"

#include "SheetNumber.h"
#include "ShownNumber.h"
#include "VariableType.h"

#include <algorithm>

// The tables of a workbook.

namespace kareport
{

namespace
{

constexpr const char *bearingFormat = "0.000000";

CellLook::Align alignOf(const sXmlReportField &field)
{
    return field.Align == u"R"   ? CellLook::Align::Right
           : field.Align == u"C" ? CellLook::Align::Centre
                                 : CellLook::Align::Left;
}

} // namespace

void XlsxResult::addColumn(const ResultColumn &column, std::size_t place)
{
    Column added;
    added.place = place;
    added.column = column;
    added.isNumber = showsNumbers(column);
    added.look.align =
        added.isNumber || column.field.Type == VARIABLE_BEARING ? CellLook::Align::Right : alignOf(column.field);
    added.look.numberFormat = added.isNumber ? sheetFormat(column, settings_) : std::string("@");
    added.width =
        std::max<double>(widthOfText(std::max<qsizetype>(column.field.Width, column.field.Label.trimmed().size())), 4);
    CellLook total = added.look;
    total.isBold = true;
    total.hasRule = true;
    added.format = book_->formatOf(added.look);
    added.totalFormat = book_->formatOf(total);
    columns_.push_back(added);
    if (isTable_ && column.field.Type == VARIABLE_BEARING && options_.bearingValues) {
        columns_.push_back(bearingValueOf(added));
    }
}

/// The column of the degrees of a bearing.
XlsxResult::Column XlsxResult::bearingValueOf(const Column &bearing) const
{
    constexpr double width = 13;
    Column value = bearing;
    value.isBearingValue = true;
    value.isNumber = true;
    value.look.numberFormat = bearingFormat;
    value.column.field.Label = bearing.column.field.Label.trimmed() + QStringLiteral(" (°)");
    value.width = width;
    value.format = book_->formatOf(value.look);
    value.totalFormat = value.format; // directions are not added up
    return value;
}

bool XlsxResult::beginTable(const ResultTable &table)
{
    if (!problem().isEmpty()) {
        return false;
    }
    settings_ = *table.settings;
    isSettingsKnown_ = true;
    isTable_ = table.isTable;
    addsPrinted_ = table.addsPrinted;
    tableName_ = table.name;
    columns_.clear();
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        if (!table.columns[i].isShown) {
            continue;
        }
        const bool hasValue = table.columns[i].field.Type == VARIABLE_BEARING && options_.bearingValues;
        if (isTable_ && columns_.size() + (hasValue ? 2 : 1) > LXW_COL_MAX) {
            ++columnsLeftOut_;
        } else {
            addColumn(table.columns[i], i);
        }
    }
    if (isTable_) {
        ranges_.beginTable(columns_.size());
        beginTableSheet();
    }
    return true;
}

/// Begins the table where it goes: in a sheet of its own, or after what is in the one sheet.
void XlsxResult::beginTableSheet()
{
    if (options_.isOneSheet) {
        table_ = textSheet();
        if (table_.nextRow > 0) {
            ++table_.nextRow;
        }
        if (table_.nextRow + 1 >= rowsOfSheet_) { // no heading is without a row under it
            endTextSheet();
            table_ = furtherSheet(title_.isEmpty() ? tableName_ : title_);
        }
    } else {
        table_ = furtherSheet(tableName_);
    }
    writeHead();
}

void XlsxResult::writeHead()
{
    table_.headRow = table_.nextRow++;
    lastRowOfData_ = table_.headRow;
    ++table_.tables;
    table_.widths.resize(std::max(table_.widths.size(), columns_.size()));
    for (std::size_t i = 0; i < columns_.size(); ++i) {
        const Column &column = columns_[i];
        book_->writeText(table_.sheet, table_.headRow, static_cast<lxw_col_t>(i), column.column.field.Label.trimmed(),
                         book_->formatOf({.align = column.look.align, .isHead = true}));
        table_.widths[i] = std::max(table_.widths[i], column.width);
    }
}

/// A sheet that is full goes on in a further one, under the same heading.
void XlsxResult::makeRoom()
{
    if (table_.nextRow < rowsOfSheet_) {
        return;
    }
    if (options_.isOneSheet) {
        text_ = table_;
        endTextSheet();
    } else {
        endSheetTable();
    }
    table_ = furtherSheet(options_.isOneSheet && !title_.isEmpty() ? title_ : tableName_);
    ranges_.beginSheet();
    writeHead();
}

/// Ends the sheet of one table. Its filter has the rows of data alone: a total that is sorted away is none.
void XlsxResult::endSheetTable()
{
    keepInView(table_);
    if (!columns_.empty()) {
        // The library takes no row before the one that is written.
        worksheet_autofilter(table_.sheet, table_.headRow, 0, table_.nextRow - 1,
                             static_cast<lxw_col_t>(columns_.size() - 1));
        table_.sheet->autofilter.last_row = lastRowOfData_;
    }
    setWidths(table_);
}

void XlsxResult::endTable()
{
    if (isTable_ && options_.isOneSheet) {
        text_ = table_;
        ++text_.nextRow;
    } else if (isTable_) {
        endSheetTable();
    }
    isTable_ = false;
}

void XlsxResult::addRow(const ResultRow &row)
{
    if (!isTable_) {
        writeBlock(row);
        return;
    }
    makeRoom();
    if (row.kind == ResultRowKind::Row) {
        writeRow(row);
    } else {
        writeTotals(row);
    }
    ++table_.nextRow;
}

} // namespace kareport
