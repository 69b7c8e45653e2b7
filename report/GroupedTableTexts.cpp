#include "GroupedTable.h"

#include "FieldMarker.h"
#include "VariableType.h"

#include <algorithm>
#include <cmath>
#include <limits>

// The texts of headings and totals.

namespace kareport
{

namespace
{

bool hasCells(const std::vector<TotalLine> &lines)
{
    return std::any_of(lines.begin(), lines.end(), [](const TotalLine &line) { return !line.cells.empty(); });
}

ResultTotalKind resultKind(TotalKind kind)
{
    switch (kind) {
    case TotalKind::Sum: return ResultTotalKind::Sum;
    case TotalKind::Mean: return ResultTotalKind::Mean;
    case TotalKind::Least: return ResultTotalKind::Least;
    case TotalKind::Greatest: return ResultTotalKind::Greatest;
    case TotalKind::Count: return ResultTotalKind::Count;
    }
    return ResultTotalKind::None;
}

} // namespace

/// A text with the values of a group. @param object  a row of the group; null where the text has no values
QString GroupedTable::textOf(const GroupText &text, const Totals &totals, quint64 rows, const UDataObject *object) const
{
    QString done;
    for (const GroupText::Piece &piece : text.pieces) {
        switch (piece.kind) {
        case GroupText::Piece::Kind::Text: done += piece.text; break;
        case GroupText::Piece::Kind::Rows: done += QString::number(rows); break;
        case GroupText::Piece::Kind::Total: done += totalText(piece.total, totals); break;
        case GroupText::Piece::Kind::Value: {
            const UDictEntry *entry = object != nullptr ? object->Find(static_cast<quint32>(piece.field.ID)) : nullptr;
            TextBuffer out;
            if (entry != nullptr) {
                FieldFormatter(piece.field).append(out, textOptions_, entry->kind(), entry->GetData(), piece.suffix);
            }
            done += out.view().trimmed();
            break;
        }
        }
    }
    return done;
}

QString GroupedTable::totalText(const TotalCell &cell, const Totals &totals) const
{
    TextBuffer out;
    texts_[cell.variable].append(out, totals[cell.variable], cell.kind, groups_.variables[cell.variable].suffix);
    return out.view().trimmed().toString();
}

/// How many lines the totals of a page take.
qint64 GroupedTable::pageEndHeight() const
{
    const std::vector<TotalLine> &lines = groups_.pageTotals;
    qint64 height = 0;
    for (const QString &line : linesOf(lines, pageTotals_, 0, nullptr)) {
        height += KeptLines::heightOf(line);
    }
    // A label with a number in it may find no room beside the totals later on.
    return height + std::count_if(lines.begin(), lines.end(),
                                  [](const TotalLine &line) { return !line.cells.empty() && line.label.needsRows(); });
}

/// The lines of totals: a rule, and under it each line, with its label before it where that has no room in it.
std::vector<QString> GroupedTable::linesOf(const std::vector<TotalLine> &lines, const Totals &totals, quint64 rows,
                                           const UDataObject *object) const
{
    std::vector<QString> done;
    if (hasCells(lines) && options_.separator != u'\t') {
        done.push_back(ruleOf(lines));
    }
    for (const TotalLine &line : lines) {
        const QString label = textOf(line.label, totals, rows, object);
        if (line.cells.empty()) {
            done.push_back(label);
            continue;
        }
        bool hasLabel = label.isEmpty();
        QString text = lineOf(line, totals, label, hasLabel);
        if (!hasLabel) {
            done.push_back(label);
        }
        done.push_back(std::move(text));
    }
    return done;
}

const TotalCell *GroupedTable::cellOf(const TotalLine &line, std::size_t field) const
{
    const auto found = std::find_if(line.cells.begin(), line.cells.end(),
                                    [&](const TotalCell &cell) { return variableOf_[field] == cell.variable; });
    return found != line.cells.end() ? &*found : nullptr;
}

/// Appends a cell for each field, as a row has them.
/// @param appendCell  is given the index of a field and the suffix for it
template <typename Cell>
void GroupedTable::appendCells(TextBuffer &out, Cell appendCell) const
{
    QStringView suffix;
    for (std::size_t i = 0; i < fields_.size(); ++i) {
        switch (fieldFormatters_[i].marker()) {
        case FieldMarker::SuffixR: suffix = u"R"; continue;
        case FieldMarker::SuffixPlus: suffix = u"+"; continue;
        case FieldMarker::Filler: fieldFormatters_[i].append(out, options_, ValueKind::None, nullptr, suffix); break;
        case FieldMarker::None:
            appendCell(i, suffix);
            out.append(options_.separator);
            break;
        }
        suffix = QStringView();
    }
    if (out.size() > 0 && out.view().back() == QChar(options_.separator)) {
        out.truncate(out.size() - 1);
    }
}

QString GroupedTable::ruleOf(const std::vector<TotalLine> &lines) const
{
    TextBuffer out;
    appendCells(out, [&](std::size_t field, QStringView) {
        const bool isTotalled = std::any_of(lines.begin(), lines.end(),
                                            [&](const TotalLine &line) { return cellOf(line, field) != nullptr; });
        if (isTotalled) {
            columns_[field].appendRule(out);
        } else {
            columns_[field].appendBlank(out);
        }
    });
    return out.view().toString();
}

/// A line of totals with its label in front of the first of them, where that has room.
/// @param hasLabel  becomes true where the label is in it
QString GroupedTable::lineOf(const TotalLine &line, const Totals &totals, const QString &label, bool &hasLabel) const
{
    TextBuffer out;
    std::optional<std::size_t> room;
    appendCells(out, [&](std::size_t field, QStringView suffix) {
        const TotalCell *cell = cellOf(line, field);
        if (cell == nullptr) {
            if (options_.separator == u'\t' && field == 0) {
                out.append(label);
                hasLabel = true;
            } else {
                columns_[field].appendBlank(out);
            }
            return;
        }
        room = room ? room : std::optional(out.size());
        const Shown shown = columns_[field].append(out, totals[cell->variable], cell->kind, suffix);
        if (shown == Shown::TooWide && remarks_.rows != 0) {
            wideTotalRow_ = remarks_.rows;
            remarks_.add(remarks_.columns[field].wideTotals, wideTotalRow_ - 1);
            remarks_.takeNew();
        }
    });
    QString text = out.view().toString();
    const qsizetype blanks = room && *room > 0 ? static_cast<qsizetype>(*room) - 1 : 0; // one stays before the total
    if (options_.separator != u'\t' && !label.isEmpty() && label.size() <= blanks) {
        text.replace(0, label.size(), label);
        hasLabel = true;
    }
    return text;
}

/// A line of totals as values, one for each column.
std::vector<ResultTotal> GroupedTable::resultsOf(const TotalLine &line, const Totals &totals) const
{
    std::vector<ResultTotal> results;
    TextBuffer unused; // there are no columns to fill
    appendCells(unused, [&](std::size_t field, QStringView suffix) {
        ResultTotal result;
        if (const TotalCell *cell = cellOf(line, field)) {
            TextBuffer text;
            texts_[cell->variable].append(text, totals[cell->variable], cell->kind, suffix);
            result.text = text.view().trimmed().toString();
            result.total = resultKind(cell->kind);
            const auto number = cells_[cell->variable].internal(totals[cell->variable], cell->kind);
            const bool isWhole = fields_[field].Type == VARIABLE_INTEGER;
            constexpr double mostWhole = std::numeric_limits<qint32>::max();
            if (number && (!isWhole || (*number == std::floor(*number) && std::fabs(*number) <= mostWhole))) {
                result.kind = isWhole ? ResultTotal::Kind::Whole : ResultTotal::Kind::Number;
                result.number = *number;
            }
        }
        results.push_back(std::move(result));
    });
    return results;
}

/// Hands lines of totals on. A label is in the first column where that shows texts, else on a line of its own.
void GroupedTable::giveTotals(const TotalsOf &of, const std::vector<TotalLine> &lines, const Totals &totals,
                              quint64 rows, const UDataObject *object)
{
    if (!givesResults()) {
        return;
    }
    const auto first = std::find_if(fieldFormatters_.begin(), fieldFormatters_.end(),
                                    [](const FieldFormatter &field) { return field.marker() == FieldMarker::None; });
    for (const TotalLine &line : lines) {
        const QString label = textOf(line.label, totals, rows, object);
        std::vector<ResultTotal> results = resultsOf(line, totals);
        const bool hasRoom = first != fieldFormatters_.end() && first->showsText() && results.front().text.isEmpty();
        if (hasRoom && !line.cells.empty()) {
            results.front().text = label;
        } else if (!label.isEmpty()) {
            results_->addText(ResultText::GroupFooter, label, of.level);
        }
        if (!line.cells.empty()) {
            results_->addTotals(of.kind, std::move(results), of.level);
        }
    }
}

} // namespace kareport
