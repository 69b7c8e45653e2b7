#include "SheetNumber.h"
#include "ShownNumber.h"
#include "VariableType.h"
#include "XlsxResult.h"

#include <algorithm>
#include <cmath>

// The cells of tables and blocks in a workbook.

namespace kareport
{

/// The width of a column for so many characters.
double XlsxResult::widthOfText(qsizetype characters)
{
    constexpr double widest = 60;
    return std::min<double>(static_cast<double>(characters) + 2, widest);
}

void XlsxResult::writeRow(const ResultRow &row)
{
    for (std::size_t i = 0; i < columns_.size(); ++i) {
        writeCell(columns_[i], static_cast<lxw_col_t>(i), row.cells[columns_[i].place]);
    }
    lastRowOfData_ = table_.nextRow;
    if (options_.formulas) {
        ranges_.addRow(table_.nextRow, row.level);
    }
}

void XlsxResult::writeCell(const Column &column, lxw_col_t at, const ResultCell &cell)
{
    if (cell.value == nullptr) { // the report may show a zero for what is missing; a calculation must not
        return;
    }
    const bool isWritten =
        column.isBearingValue ? writeBearingValue(column, at, cell) : column.isNumber && writeNumber(column, at, cell);
    if (!isWritten && !column.isBearingValue && !cell.text.isEmpty()) {
        book_->writeText(table_.sheet, table_.nextRow, at, cell.text, column.format);
    }
}

bool XlsxResult::writeBearingValue(const Column &column, lxw_col_t at, const ResultCell &cell)
{
    const auto degrees = shownNumber(column.column, cell, settings_);
    if (degrees) {
        const double circle = std::fmod(*degrees, 360);
        XlsxBook::writeNumber(table_.sheet, table_.nextRow, at, circle < 0 ? circle + 360 : circle, column.format);
    }
    return degrees.has_value();
}

bool XlsxResult::writeNumber(const Column &column, lxw_col_t at, const ResultCell &cell)
{
    auto number = sheetNumber(column.column, cell, settings_, options_.values);
    const bool isBlankZero = !number && cell.text.isEmpty();
    if (isBlankZero && (options_.values == ResultValues::Exact || options_.formulas)) {
        number = blankNumber(column.column, cell, settings_);
    }
    if (!number) {
        return isBlankZero;
    }
    lxw_format *format = column.format;
    if (!number->format.empty()) {
        CellLook look = column.look;
        look.numberFormat = number->format;
        format = book_->formatOf(look);
    }
    XlsxBook::writeNumber(table_.sheet, table_.nextRow, at, number->value, format);
    return true;
}

void XlsxResult::writeBlock(const ResultRow &row)
{
    for (const Column &column : columns_) {
        const ResultCell &cell = row.cells[column.place];
        if (cell.value == nullptr && cell.text.isEmpty()) {
            continue; // the report has no line for it
        }
        table_ = textSheet();
        table_.widths.resize(std::max<std::size_t>(table_.widths.size(), 2));
        const QString label = column.column.field.Label.trimmed();
        book_->writeText(table_.sheet, table_.nextRow, 0, label, nullptr);
        writeCell(column, 1, cell);
        if (column.column.field.Type == VARIABLE_BEARING && options_.bearingValues && cell.value != nullptr) {
            writeBearingValue(bearingValueOf(column), 2, cell);
        }
        table_.widths[0] = std::max(table_.widths[0], widthOfText(label.size()));
        table_.widths[1] = std::max(table_.widths[1], widthOfText(cell.text.size()));
        ++table_.nextRow;
        text_ = table_;
    }
}

} // namespace kareport
