#include "DelimiterGuess.h"

#include "CsvRows.h"
#include "Xlate.h"

#include <algorithm>
#include <string>
#include <vector>

namespace kareport
{

namespace
{

constexpr int mostRows = 100;

struct Candidate
{
    DelimiterKind kind;
    char delimiter;
};

using Cells = std::vector<std::vector<std::string>>;

struct Reading
{
    CsvDialect dialect;
    std::vector<unsigned> ids; ///< what is read, ascending
    Cells cells;               ///< of the first rows
};

QString nameOf(const CsvDialect &dialect)
{
    if (dialect.kind == DelimiterKind::Whitespace) {
        return Xlate("blanks and tabs");
    }
    switch (dialect.delimiter) {
    case ',': return Xlate("the comma");
    case ';': return Xlate("the semicolon");
    case '\t': return Xlate("the tab");
    default: return Xlate("the vertical bar");
    }
}

/// Reads the first rows. @return whether they can be read so
bool readFirstRows(CsvRows &rows)
{
    UDataObject object;
    for (int i = 0; i < mostRows && rows.next(object, nullptr); ++i) {
    }
    return !rows.error();
}

/// The cells of the first rows, as far as they can be read.
Cells firstCells(const FileBytes &file, const CsvDialect &dialect)
{
    CsvReader reader(file.path(), file.view(), layoutOf(dialect));
    Cells cells;
    for (int i = 0; i < mostRows && reader.next(); ++i) {
        cells.emplace_back(reader.cells().begin(), reader.cells().end());
    }
    return cells;
}

/// Whether a mark of numbers is the delimiter.
bool isMark(const Candidate &candidate, const NumberStyle &numbers)
{
    return candidate.delimiter == numbers.decimal || numbers.thousands == std::string_view(&candidate.delimiter, 1);
}

bool areColumnsChosenWell(const CsvDialect &dialect, const Variables &variables)
{
    return (dialect.order.isEmpty() || namesOfOrder(dialect.order)) &&
           std::all_of(dialect.columns.begin(), dialect.columns.end(),
                       [&](const ColumnChoice &choice) { return variables.find(choice.variable).has_value(); });
}

bool knowsMore(const Reading &left, const Reading &right)
{
    return left.ids.size() > right.ids.size() &&
           std::includes(left.ids.begin(), left.ids.end(), right.ids.begin(), right.ids.end());
}

/// The only reading that is possible.
Expected<CsvDialect> only(const QString &path, const std::vector<Reading> &possible)
{
    std::vector<Reading> readings = possible;
    std::erase_if(readings, [&](const Reading &reading) {
        return std::any_of(possible.begin(), possible.end(),
                           [&](const Reading &other) { return knowsMore(other, reading); });
    });
    if (readings.size() == 1) {
        return readings.front().dialect;
    }
    QStringList names;
    for (const Reading &reading : readings) {
        names.append(nameOf(reading.dialect));
    }
    return InputError{
        path, std::nullopt,
        readings.empty()
            ? Xlate("the delimiter cannot be found out: with a comma, a semicolon, a tab, a vertical bar, or "
                    "blanks and tabs, the first rows do not have the same number of cells that fit their "
                    "variables. The delimiter itself was expected")
            : Xlate("the delimiter cannot be found out: it may be %1. The delimiter itself was expected")
                  .arg(names.join(Xlate(" or @@between two delimiters")))};
}

} // namespace

Expected<CsvDialect> guessDelimiter(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                                    const Variables &variables)
{
    constexpr Candidate candidates[] = {{DelimiterKind::Character, ','},
                                        {DelimiterKind::Character, ';'},
                                        {DelimiterKind::Character, '\t'},
                                        {DelimiterKind::Character, '|'},
                                        {DelimiterKind::Whitespace, ' '}};
    CsvDialect known = dialect;
    known.kind = DelimiterKind::Character;
    if (!areColumnsChosenWell(dialect, variables)) {
        return known; // no delimiter makes that right
    }
    std::vector<Reading> possible;
    std::vector<CsvDialect> withColumns;
    for (const Candidate &candidate : candidates) {
        if (isMark(candidate, dialect.numbers)) {
            continue;
        }
        known.kind = candidate.kind;
        known.delimiter = candidate.delimiter;
        CsvRows rows(file, known, variables);
        Cells cells = firstCells(*file, known);
        if (rows.error() || cells.empty() || cells.front().size() < 2) {
            continue;
        }
        withColumns.push_back(known);
        std::vector<unsigned> ids = rows.ids();
        std::sort(ids.begin(), ids.end());
        const bool isSame =
            std::any_of(possible.begin(), possible.end(), [&](const Reading &other) { return other.cells == cells; });
        if (readFirstRows(rows) && !isSame) {
            possible.push_back({known, std::move(ids), std::move(cells)});
        }
    }
    if (possible.empty() && withColumns.size() == 1) {
        return withColumns.front(); // it says itself what is wrong with a row
    }
    return only(file->path(), possible);
}

} // namespace kareport
