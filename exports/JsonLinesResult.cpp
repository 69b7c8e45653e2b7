#include "JsonLinesResult.h"

#include "DataColumns.h"
#include "DataText.h"
#include "JsonText.h"
#include "ValueKind.h"

#include <cmath>

namespace kareport
{

bool JsonLinesResult::beginTable(const ResultTable &table)
{
    columns_.clear();
    for (const std::size_t place : dataColumns(table, values_)) {
        const ResultColumn &column = table.columns[place];
        std::string key = columns_.empty() ? "{" : ",";
        appendJsonText(key, column.field.VariableName);
        key += ':';
        columns_.push_back({place, std::move(key), column.dataFactor, isAngleType(column.field.Type)});
    }
    return !columns_.empty();
}

void JsonLinesResult::addRow(const ResultRow &row)
{
    if (row.kind != ResultRowKind::Row) {
        return;
    }
    for (const Column &column : columns_) {
        out() += column.key;
        const ResultCell &cell = row.cells[column.place];
        if (values_ == ResultValues::Printed) {
            appendJsonText(out(), cell.text);
        } else {
            appendValue(column, cell);
        }
    }
    out() += "}\n";
    flush();
}

/// A text of the data; an empty one is a missing value.
void JsonLinesResult::appendText(QStringView text)
{
    if (text.isEmpty()) {
        out() += "null";
    } else {
        appendJsonText(out(), text);
    }
}

void JsonLinesResult::appendValue(const Column &column, const ResultCell &cell)
{
    if (cell.value == nullptr) {
        out() += "null";
        return;
    }
    const void *value = cell.value->GetData();
    switch (cell.value->kind()) {
    case ValueKind::Boolean: out() += *static_cast<const quint8 *>(value) != 0 ? "true" : "false"; break;
    case ValueKind::Int16: out() += std::to_string(*static_cast<const qint16 *>(value)); break;
    case ValueKind::Int32: out() += std::to_string(*static_cast<const qint32 *>(value)); break;
    case ValueKind::Double: {
        const double number = inDataUnit(*static_cast<const double *>(value), column.dataFactor);
        if (number == 0 && std::signbit(number)) {
            out() += "-0.0"; // a whole number has no zero below zero
        } else if (std::isfinite(number)) {
            appendNumber(out(), number, column.isAngle);
        } else { // which JSON has no number for
            out() += std::isnan(number) ? "\"NAN\"" : number < 0 ? "\"-INF\"" : "\"INF\"";
        }
        break;
    }
    case ValueKind::Text: appendText(*static_cast<const QString *>(value)); break;
    case ValueKind::PointNumber: appendText(static_cast<const UPointNumber *>(value)->Convert()); break;
    case ValueKind::None: out() += "null"; break;
    }
}

} // namespace kareport
