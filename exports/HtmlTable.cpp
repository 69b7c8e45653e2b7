#include "HtmlResult.h"

#include "DataText.h"
#include "HtmlText.h"
#include "ShownNumber.h"
#include "VariableType.h"

#include <algorithm>
#include <cmath>
#include <utility>
#include <variant>

// The tables and blocks of a web page.

namespace kareport
{

namespace
{

// The parts of a table: rows with the headings of their groups, and totals.
constexpr char dataRows = 'd';
constexpr char totals = 't';

/// The characters of a number from its decimal sign on, or from the letters after it on.
qsizetype tailOf(QStringView text)
{
    const qsizetype point = text.indexOf(u'.');
    if (point >= 0) {
        return text.size() - point;
    }
    qsizetype letters = 0;
    while (letters < text.size() && !text[text.size() - 1 - letters].isDigit()) {
        ++letters;
    }
    return letters;
}

/// What a number that the report does not show is sorted by, where it is infinite.
const char *sortValueOfBlank(const ResultCell &cell)
{
    const double *const number = cell.value != nullptr ? std::get_if<double>(&cell.value->value()) : nullptr;
    return number == nullptr || !std::isinf(*number) ? "" : *number < 0 ? " data-v=\"-inf\"" : " data-v=\"inf\"";
}

} // namespace

void HtmlResult::addColumn(const ResultColumn &column, std::size_t place, const UJobSettings &settings)
{
    Column added;
    added.place = place;
    added.column = column;
    added.isNumber = showsNumbers(column);
    const int type = column.field.Type;
    added.hasSortValue = type == VARIABLE_STATION || type == VARIABLE_OFFSET || type == VARIABLE_BEARING;
    if (added.isNumber) {
        const int decimals = shownDecimals(column, settings);
        added.tail = (decimals > 0 ? decimals + 1 : 0) + (hasSideLetter(column) ? 1 : 0);
    }
    const bool isRight = column.field.Align == u"R" || type == VARIABLE_BEARING;
    added.opening = added.isNumber               ? " class=\"n\""
                    : isRight                    ? " class=\"r\""
                    : column.field.Align == u"C" ? " class=\"c\""
                                                 : "";
    columns_.push_back(std::move(added));
}

bool HtmlResult::beginTable(const ResultTable &table)
{
    beginPage();
    settings_ = *table.settings;
    isTable_ = table.isTable;
    label_.clear();
    appendHtmlText(label_, table.name);
    columns_.clear();
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        if (table.columns[i].isShown) {
            addColumn(table.columns[i], i, settings_);
        }
    }
    isHeadPending_ = isTable_;
    headings_.clear();
    return true;
}

/// Writes the heading of the table, which waits for what comes under it: no page ends with it.
void HtmlResult::openTable()
{
    if (!isHeadPending_) {
        return;
    }
    isHeadPending_ = false;
    out() += "<table class=\"data\">\n<caption>" + label_ + "</caption>\n<thead>\n<tr>";
    for (const Column &column : columns_) {
        out() += "<th scope=\"col\"" + column.opening;
        out() += column.hasSortValue && !column.isNumber ? " data-v><span>" : "><span>";
        appendHtmlText(out(), column.column.field.Label.trimmed());
        out() += "</span></th>";
    }
    out() += "</tr>\n</thead>\n";
}

/// Begins a part of the table, unless it is the open one.
void HtmlResult::beginBody(char kind)
{
    if (body_ == kind) {
        return;
    }
    endBody();
    body_ = kind;
    bodyHasRows_ = false;
    out() += "<tbody class=\"";
    out() += kind;
    out() += "\">\n";
}

void HtmlResult::endBody()
{
    out() += body_ != 0 ? "</tbody>\n" : "";
    body_ = 0;
}

/// Goes on in a further page, under the headings of the table and of its groups again, where the page has all the rows that it
/// may have.
void HtmlResult::turnFullPage()
{
    if (rowsOnPage_ < options_.rowsPerPage || fileName_.isEmpty()) {
        return;
    }
    if (!isHeadPending_) {
        endBody();
        out() += "</table>\n";
    }
    endPage(false);
    beginPage();
    isHeadPending_ = true;
    openTable();
    for (const std::string &heading : headings_) {
        if (!heading.empty()) {
            writeHeading(heading);
        }
    }
}

void HtmlResult::addRow(const ResultRow &row)
{
    if (!isTable_) {
        writeBlock(row);
        return;
    }
    const bool isData = row.kind == ResultRowKind::Row;
    if (isData) {
        turnFullPage();
        ++rowsOnPage_;
    }
    openTable();
    beginBody(isData ? dataRows : totals);
    bodyHasRows_ = true;
    writeCells(row);
    flush();
}

/// Adds a line of text in a table. @param level  of the group that it heads
void HtmlResult::addTableText(ResultText kind, QStringView text, int level)
{
    std::string escaped;
    appendHtmlText(escaped, text);
    const bool isHeading = kind == ResultText::GroupHeading;
    if (isHeading) {
        headings_.resize(std::min(headings_.size(), static_cast<std::size_t>(level)));
        turnFullPage(); // no heading is without a row under it
    }
    openTable();
    if (isHeading) {
        writeHeading(escaped);
        headings_.resize(static_cast<std::size_t>(level));
        headings_.push_back(std::move(escaped));
    } else {
        beginBody(totals);
        writeAcross("<tr><th scope=\"row\"", escaped);
    }
    flush();
}

/// Writes the heading of a group, which is that of all rows of its part of the table.
void HtmlResult::writeHeading(const std::string &escaped)
{
    if (bodyHasRows_) {
        endBody();
    }
    beginBody(dataRows);
    writeAcross("<tr class=\"g\"><th scope=\"rowgroup\"", escaped);
}

/// Writes a row of one cell over all columns. @param opening  the tags before it @param escaped  its text
void HtmlResult::writeAcross(const char *opening, const std::string &escaped)
{
    out() += opening;
    out() += " colspan=\"" + std::to_string(columns_.size()) + "\">" + escaped + "</th></tr>\n";
}

void HtmlResult::writeCells(const ResultRow &row)
{
    out() += "<tr>";
    for (const Column &column : columns_) {
        const ResultCell &cell = row.cells[column.place];
        out() += "<td" + column.opening;
        if (column.hasSortValue) {
            if (const auto number = shownNumber(column.column, cell, settings_)) {
                out() += " data-v=\"";
                appendNumber(out(), *number, false);
                out() += '"';
            }
        } else if (column.isNumber && cell.text.isEmpty()) {
            out() += sortValueOfBlank(cell);
        }
        out() += '>';
        appendHtmlText(out(), cell.text);
        if (column.isNumber && !cell.text.isEmpty()) {
            for (qsizetype tail = tailOf(cell.text); tail < column.tail; ++tail) {
                out() += "\xC2\xA0"; // no digit follows here, and the decimal signs are below each other
            }
        }
        out() += "</td>";
    }
    out() += "</tr>\n";
}

void HtmlResult::writeBlock(const ResultRow &row)
{
    out() += "<table class=\"block\" aria-label=\"" + label_ + "\">\n<tbody>\n";
    for (const Column &column : columns_) {
        const ResultCell &cell = row.cells[column.place];
        if (cell.value == nullptr && cell.text.isEmpty()) {
            continue; // the report has no line for it
        }
        out() += "<tr><th scope=\"row\">";
        appendHtmlText(out(), column.column.field.Label.trimmed());
        out() += "</th><td>";
        appendHtmlText(out(), cell.text);
        out() += "</td></tr>\n";
    }
    out() += "</tbody>\n</table>\n";
    flush();
}

void HtmlResult::endTable()
{
    if (isTable_) {
        openTable(); // also of a table without rows
        endBody();
        out() += "</table>\n";
    }
    isTable_ = false;
    flush();
}

} // namespace kareport
