#include "XlsxResult.h"

#include "SheetNumber.h"
#include "ShownNumber.h"
#include "VariableType.h"

#include <algorithm>
#include <array>
#include <cmath>

// The totals of tables in a workbook, as numbers or as formulas.

namespace kareport
{

namespace
{

constexpr qsizetype mostDigits = 15; ///< that a number of a spreadsheet shows

/// The function of SUBTOTAL that makes a total. It skips totals that are made by it as well.
int functionOf(ResultTotalKind kind)
{
    switch (kind) {
    case ResultTotalKind::Mean: return 1;
    case ResultTotalKind::Count: return 2;
    case ResultTotalKind::Greatest: return 4;
    case ResultTotalKind::Least: return 5;
    default: return 9;
    }
}

/// Whether a number is so near the middle between two of its decimals that adding binary numbers may round it to the other one.
bool isNearHalf(double number, int decimals)
{
    constexpr double near = 1e-3;
    constexpr double mostTold = 1e11;
    const double scaled = std::fabs(number) * std::pow(10.0, decimals);
    return !(scaled < mostTold) || std::fabs(scaled - std::floor(scaled) - 0.5) < near;
}

} // namespace

void XlsxResult::writeTotals(const ResultRow &row)
{
    for (std::size_t i = 0; i < columns_.size(); ++i) {
        writeTotal(columns_[i], static_cast<lxw_col_t>(i), row, row.cells[columns_[i].place]);
    }
}

void XlsxResult::writeTotal(const Column &column, lxw_col_t at, const ResultRow &row, const ResultCell &cell)
{
    if (column.isBearingValue || cell.text.isEmpty()) {
        return;
    }
    const bool isCount = cell.total == ResultTotalKind::Count;
    auto number =
        column.isNumber && !isCount ? sheetNumber(column.column, cell, settings_, options_.values) : std::nullopt;
    bool isWhole = false;
    const qlonglong whole = cell.text.toLongLong(&isWhole);
    if (!number && isWhole && cell.total != ResultTotalKind::None) { // a count, or more than a whole number of 32 bits
        number = SheetNumber{static_cast<double>(whole), std::string(1, '0')};
    }
    if (!number) {
        book_->writeText(table_.sheet, table_.nextRow, at, cell.text, column.totalFormat);
        return;
    }
    lxw_format *format = column.totalFormat;
    if (!number->format.empty()) {
        CellLook look = column.look;
        look.numberFormat = number->format;
        look.align = CellLook::Align::Right;
        look.isBold = true;
        look.hasRule = true;
        format = book_->formatOf(look);
    }
    const std::string formula = options_.formulas ? formulaOf(column, at, row, cell) : std::string();
    if (!formula.empty()) {
        XlsxBook::writeFormula(table_.sheet, table_.nextRow, at, formula, number->value, format);
        return;
    }
    XlsxBook::writeNumber(table_.sheet, table_.nextRow, at, number->value, format);
    if (options_.formulas) {
        ranges_.addValue(at, table_.nextRow);
        ++totalsAsValues_;
    }
}

/// The formula of a total; empty where it must be a value.
std::string XlsxResult::formulaOf(const Column &column, lxw_col_t at, const ResultRow &row,
                                  const ResultCell &cell) const
{
    const auto range = ranges_.of(row.kind == ResultRowKind::Total ? ResultRow::noLevel : row.level, at);
    if (!range || !givesFormula(column, cell)) {
        return {};
    }
    std::array<char, LXW_MAX_CELL_RANGE_LENGTH> name{};
    lxw_rowcol_to_range(name.data(), range->first, at, range->last, at);
    return "=SUBTOTAL(" + std::to_string(functionOf(cell.total)) + ',' + name.data() + ')';
}

/// Whether a formula over the cells of a column shows the digits of a total.
bool XlsxResult::givesFormula(const Column &column, const ResultCell &cell) const
{
    const bool isPrinted = options_.values == ResultValues::Printed;
    switch (cell.total) {
    case ResultTotalKind::None: return false;
    case ResultTotalKind::Count: return column.isNumber && column.column.field.Type != VARIABLE_THICKNESS;
    case ResultTotalKind::Least:
    case ResultTotalKind::Greatest: return column.isNumber;
    case ResultTotalKind::Sum:
    case ResultTotalKind::Mean: break;
    }
    const auto digits =
        std::count_if(cell.text.begin(), cell.text.end(), [](QChar character) { return character.isDigit(); });
    const auto number = shownNumber(column.column, cell, settings_);
    if (isPrinted != addsPrinted_ || digits > mostDigits || !number) {
        return false;
    }
    const bool isRounded = !isPrinted || cell.total == ResultTotalKind::Mean;
    return !isRounded || !isNearHalf(*number, shownDecimals(column.column, settings_));
}

} // namespace kareport
