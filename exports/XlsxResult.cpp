#include "XlsxResult.h"

#include "ResultReport.h"
#include "SheetNumber.h"
#include "ShownNumber.h"
#include "UnitFactors.h"
#include "VariableType.h"
#include "Xlate.h"

#include <QFile>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

constexpr lxw_row_t mostRows = LXW_ROW_MAX;
constexpr double widest = 60; ///< characters of a column
constexpr const char *bearingFormat = "0.000000";

CellLook::Align alignOf(const sXmlReportField &field)
{
    return field.Align == u"R"   ? CellLook::Align::Right
           : field.Align == u"C" ? CellLook::Align::Centre
                                 : CellLook::Align::Left;
}

} // namespace

XlsxResult::XlsxResult(const ResultOptions &options) : options_(options), book_(std::make_unique<XlsxBook>())
{
    setProblem(book_->problem());
}

void XlsxResult::beginReport(const ResultReport &report)
{
    title_ = report.title;
    properties_[0] = report.title.toUtf8();
    properties_[1] = report.application.toUtf8();
    created_ = report.time.isValid() ? report.time.toSecsSinceEpoch() : 0;
}

/// The sheet of lines, headings and blocks.
XlsxResult::Sheet &XlsxResult::textSheet()
{
    if (text_.sheet == nullptr) {
        text_.sheet = book_->addSheet(title_.isEmpty() ? Xlate("Report") : title_);
        if (!title_.isEmpty()) {
            book_->writeText(text_.sheet, text_.nextRow, 0, title_, book_->formatOf({.isBold = true}));
            text_.nextRow += 2;
        }
    }
    return text_;
}

void XlsxResult::addColumn(const ResultColumn &column, std::size_t place)
{
    Column added;
    added.place = place;
    added.column = column;
    added.isNumber = showsNumbers(column);
    added.look.align =
        added.isNumber || column.field.Type == VARIABLE_BEARING ? CellLook::Align::Right : alignOf(column.field);
    added.look.numberFormat = added.isNumber ? sheetFormat(column, settings_) : std::string("@");
    added.width = std::clamp<double>(
        std::max(static_cast<double>(column.field.Width), static_cast<double>(column.field.Label.trimmed().size())) + 2,
        4, widest);
    columns_.push_back(added);
    if (isTable_ && column.field.Type == VARIABLE_BEARING && options_.bearingValues) {
        added.isBearingValue = true;
        added.isNumber = true;
        added.look.numberFormat = bearingFormat;
        added.column.field.Label = column.field.Label.trimmed() + QStringLiteral(" (°)");
        added.width = 13;
        columns_.push_back(added);
    }
    for (Column &each : columns_) {
        each.format = book_->formatOf(each.look);
        CellLook total = each.look;
        total.isBold = true;
        total.hasRule = true;
        each.totalFormat = book_->formatOf(total);
    }
}

bool XlsxResult::beginTable(const ResultTable &table)
{
    if (!problem().isEmpty()) {
        return false;
    }
    settings_ = *table.settings;
    isSettingsKnown_ = true;
    isTable_ = table.isTable;
    tableName_ = table.name;
    columns_.clear();
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        if (table.columns[i].isShown && columns_.size() + 2 < LXW_COL_MAX) {
            addColumn(table.columns[i], i);
        }
    }
    if (isTable_) {
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
    } else {
        table_ = Sheet();
        table_.sheet = book_->addSheet(tableName_);
    }
    writeHead();
}

void XlsxResult::writeHead()
{
    headRow_ = table_.nextRow++;
    ++table_.tables;
    table_.widths.resize(std::max(table_.widths.size(), columns_.size()));
    for (std::size_t i = 0; i < columns_.size(); ++i) {
        const Column &column = columns_[i];
        book_->writeText(table_.sheet, headRow_, static_cast<lxw_col_t>(i), column.column.field.Label.trimmed(),
                         book_->formatOf({.align = column.look.align, .isHead = true}));
        table_.widths[i] = std::max(table_.widths[i], column.width);
    }
}

/// A sheet that is full goes on in a further one, under the same heading.
void XlsxResult::makeRoom()
{
    if (table_.nextRow < mostRows) {
        return;
    }
    endSheetTable();
    table_ = Sheet();
    table_.sheet = book_->addSheet(options_.isOneSheet && !title_.isEmpty() ? title_ : tableName_);
    writeHead();
}

void XlsxResult::endSheetTable()
{
    const bool isAlone = table_.tables == 1 && !columns_.empty();
    const auto lastColumn = static_cast<lxw_col_t>(columns_.empty() ? 0 : columns_.size() - 1);
    if (!options_.isOneSheet && isAlone) {
        worksheet_freeze_panes(table_.sheet, headRow_ + 1, 0);
        worksheet_repeat_rows(table_.sheet, headRow_, headRow_);
        worksheet_autofilter(table_.sheet, headRow_, 0, std::max(table_.nextRow - 1, headRow_), lastColumn);
    }
    setWidths(table_);
}

void XlsxResult::setWidths(Sheet &sheet)
{
    for (std::size_t i = 0; i < sheet.widths.size(); ++i) {
        if (sheet.widths[i] > 0) {
            const auto at = static_cast<lxw_col_t>(i);
            worksheet_set_column(sheet.sheet, at, at, sheet.widths[i], nullptr);
        }
    }
}

void XlsxResult::addRow(const ResultRow &row)
{
    if (!isTable_) {
        writeBlock(row);
        return;
    }
    makeRoom();
    for (std::size_t i = 0; i < columns_.size(); ++i) {
        writeCell(columns_[i], static_cast<lxw_col_t>(i), row.cells[columns_[i].place], row.kind != ResultRowKind::Row);
    }
    ++table_.nextRow;
}

void XlsxResult::writeCell(const Column &column, lxw_col_t at, const ResultCell &cell, bool isTotal)
{
    lxw_format *format = isTotal ? column.totalFormat : column.format;
    if (column.isBearingValue) {
        if (const auto degrees = shownNumber(column.column, cell, settings_)) {
            const double circle = std::fmod(*degrees, 360);
            XlsxBook::writeNumber(table_.sheet, table_.nextRow, at, circle < 0 ? circle + 360 : circle, format);
        }
        return;
    }
    if (column.isNumber) {
        if (const auto number = sheetNumber(column.column, cell, settings_, options_.values)) {
            if (!number->format.empty()) {
                CellLook look = column.look;
                look.numberFormat = number->format;
                look.isBold = isTotal;
                look.hasRule = isTotal;
                format = book_->formatOf(look);
            }
            XlsxBook::writeNumber(table_.sheet, table_.nextRow, at, number->value, format);
            return;
        }
        if (cell.value == nullptr) { // the report may show a zero for what is missing; a calculation must not
            bool isCount = false;
            const qlonglong count = cell.text.toLongLong(&isCount);
            if (isTotal && isCount) {
                CellLook look = column.look;
                look.numberFormat.assign(1,
                                         '0'); // GCC 12 takes the assignment of a literal here for an overlapping copy
                look.isBold = true;
                look.hasRule = true;
                XlsxBook::writeNumber(table_.sheet, table_.nextRow, at, static_cast<double>(count),
                                      book_->formatOf(look));
            }
            return;
        }
    }
    if (!cell.text.isEmpty()) {
        book_->writeText(table_.sheet, table_.nextRow, at, cell.text, format);
    }
}

void XlsxResult::writeBlock(const ResultRow &row)
{
    Sheet &sheet = textSheet();
    table_ = sheet;
    table_.widths.resize(std::max<std::size_t>(table_.widths.size(), 2));
    for (const Column &column : columns_) {
        const ResultCell &cell = row.cells[column.place];
        if (cell.value == nullptr && cell.text.isEmpty()) {
            continue; // the report has no line for it
        }
        const QString label = column.column.field.Label.trimmed();
        book_->writeText(table_.sheet, table_.nextRow, 0, label, nullptr);
        writeCell(column, 1, cell, false);
        table_.widths[0] = std::max(table_.widths[0], std::min<double>(static_cast<double>(label.size()) + 2, widest));
        table_.widths[1] =
            std::max(table_.widths[1], std::min<double>(static_cast<double>(cell.text.size()) + 2, widest));
        ++table_.nextRow;
    }
    text_ = table_;
}

void XlsxResult::endTable()
{
    if (isTable_) {
        endSheetTable();
        if (options_.isOneSheet) {
            text_ = table_;
            ++text_.nextRow;
        }
    }
    isTable_ = false;
}

void XlsxResult::addText(ResultText kind, QStringView text, int style)
{
    if (!problem().isEmpty()) {
        return;
    }
    if (isTable_) {
        makeRoom();
        book_->writeText(table_.sheet, table_.nextRow++, 0, text, book_->formatOf({.isBold = true}));
        return;
    }
    Sheet &sheet = textSheet();
    if (sheet.nextRow < mostRows) {
        const bool isBold = kind == ResultText::Heading || style == 1 || style == 3;
        book_->writeText(sheet.sheet, sheet.nextRow++, 0, text, isBold ? book_->formatOf({.isBold = true}) : nullptr);
    }
}

QStringList XlsxResult::warnings() const
{
    QStringList warnings;
    if (book_ && book_->cutTexts() > 0) {
        warnings.append(
            Xlate("%1 texts are longer than a cell of a workbook holds, and are cut").arg(book_->cutTexts()));
    }
    return warnings;
}

void XlsxResult::writeEnd()
{
    if (!problem().isEmpty()) {
        return;
    }
    if (text_.sheet == nullptr && table_.sheet == nullptr) {
        textSheet(); // a workbook has one sheet at least
    }
    if (text_.sheet != nullptr && !options_.isOneSheet) {
        setWidths(text_);
    }
    if (isSettingsKnown_) {
        properties_[2] = Xlate("Lengths in %1, areas in %2, angles in %3")
                             .arg(nameOf(settings_.lengthUnit), nameOf(settings_.areaUnit), nameOf(settings_.angleUnit))
                             .toUtf8();
    }
    lxw_doc_properties properties = {};
    properties.title = properties_[0].data();
    properties.author = properties_[1].data();
    properties.comments = properties_[2].data();
    properties.created = static_cast<time_t>(created_);
    book_->setProperties(properties);
    const QString wrong = book_->close();
    if (!wrong.isEmpty()) {
        setProblem(wrong);
        return;
    }
    QFile file(book_->path());
    if (!file.open(QIODevice::ReadOnly)) {
        setProblem(file.errorString());
        return;
    }
    constexpr qint64 piece = qint64(1) << 20;
    for (QByteArray bytes = file.read(piece); !bytes.isEmpty(); bytes = file.read(piece)) {
        out().append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
        flush();
    }
}

} // namespace kareport
