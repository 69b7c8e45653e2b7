#include "CsvResult.h"

#include "DataColumns.h"
#include "DataText.h"
#include "ValueKind.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

bool CsvResult::beginTable(const ResultTable &table)
{
    places_ = dataColumns(table, options_.values);
    columns_.clear();
    for (const std::size_t place : places_) {
        out().append(columns_.empty() ? 0U : 1U, options_.delimiter);
        columns_.push_back(table.columns[place]);
        appendText(columns_.back().field.VariableName);
    }
    out() += '\n';
    flush();
    return !places_.empty();
}

void CsvResult::addRow(const ResultRow &row)
{
    if (row.kind != ResultRowKind::Row) {
        return;
    }
    const std::size_t start = out().size();
    for (std::size_t i = 0; i < places_.size(); ++i) {
        out().append(i == 0 ? 0U : 1U, options_.delimiter);
        const ResultCell &cell = row.cells[places_[i]];
        if (options_.values == ResultValues::Printed) {
            appendDataText(cell.text);
        } else {
            appendValue(columns_[i], cell);
        }
    }
    if (out().size() == start) {
        out() += "\"\""; // many readers skip an empty line
    }
    out() += '\n';
    flush();
}

void CsvResult::appendValue(const ResultColumn &column, const ResultCell &cell)
{
    if (cell.value == nullptr) {
        return;
    }
    const auto appendWhole = [this](auto number) { out() += std::to_string(number); };
    const void *value = cell.value->GetData();
    switch (cell.value->kind()) {
    case ValueKind::Boolean: out() += *static_cast<const quint8 *>(value) != 0 ? "true" : "false"; break;
    case ValueKind::Int16: appendWhole(*static_cast<const qint16 *>(value)); break;
    case ValueKind::Int32: appendWhole(*static_cast<const qint32 *>(value)); break;
    case ValueKind::Double: {
        const double number = inDataUnit(*static_cast<const double *>(value), column.dataFactor);
        if (std::isfinite(number)) {
            appendNumber(out(), number, isAngleType(column.field.Type));
        } else {
            out() += std::isnan(number) ? "NAN" : number < 0 ? "-INF" : "INF";
        }
        break;
    }
    case ValueKind::Text: appendDataText(*static_cast<const QString *>(value)); break;
    case ValueKind::PointNumber: appendDataText(static_cast<const UPointNumber *>(value)->Convert()); break;
    case ValueKind::None: break;
    }
}

/// Appends a text of the data, and counts those that a spreadsheet program takes for formulas.
void CsvResult::appendDataText(QStringView text)
{
    formulas_ += text.startsWith(u'=') || text.startsWith(u'@') ? 1U : 0U;
    appendText(text);
}

QStringList CsvResult::warnings() const
{
    QStringList warnings;
    if (formulas_ > 0) {
        warnings.append(Xlate("%1 texts begin with = or @: a spreadsheet program that opens the file takes them for "
                              "formulas")
                            .arg(formulas_));
    }
    return warnings;
}

/// A text in quotes where it needs them. Each of the quotes that it has is then doubled.
void CsvResult::appendText(QStringView text)
{
    const QChar delimiter = QLatin1Char(options_.delimiter);
    const bool isPlain = std::none_of(text.begin(), text.end(), [delimiter](QChar character) {
        return character == delimiter || character == u'"' || character == u'\n' || character == u'\r';
    });
    // Blanks around a cell are its own, though some readers take them off one without quotes. So may a byte-order mark.
    const bool hasBlanks = !text.isEmpty() && (text.front().isSpace() || text.back().isSpace());
    const bool hasMark = text.startsWith(QChar(QChar::ByteOrderMark));
    if (isPlain && !hasBlanks && !hasMark) {
        appendUtf8(out(), text);
        return;
    }
    out() += '"';
    for (qsizetype at = 0; at < text.size();) {
        const qsizetype quote = text.indexOf(u'"', at);
        const qsizetype end = quote < 0 ? text.size() : quote + 1;
        appendUtf8(out(), text.sliced(at, end - at));
        out().append(quote < 0 ? 0U : 1U, '"');
        at = end;
    }
    out() += '"';
}

} // namespace kareport
