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

/// A delimiter that the first rows cannot be read with.
struct Failure
{
    CsvDialect dialect;
    InputError error;
    bool isSplit;    ///< the first row has several cells
    bool hasColumns; ///< the columns could be found, so that a row is wrong
};

/// What was tried.
struct Trials
{
    std::vector<Reading> possible;
    std::vector<Failure> failures;
    bool hasRow = false;
};

/// The only failure that a condition holds for; null when it holds for none, or for several.
template <typename Condition>
const Failure *onlyFailure(const std::vector<Failure> &failures, const Condition &condition)
{
    const auto found = std::find_if(failures.begin(), failures.end(), condition);
    const bool isOnly = found != failures.end() && std::none_of(found + 1, failures.end(), condition);
    return isOnly ? &*found : nullptr;
}

/// A dialect that says itself what is wrong with the file, where one cause is clear; null where none is.
const CsvDialect *clearlyWrong(const std::vector<Failure> &failures)
{
    if (const Failure *only = onlyFailure(failures, [](const Failure &one) { return one.hasColumns; })) {
        return &only->dialect;
    }
    if (std::any_of(failures.begin(), failures.end(), [](const Failure &one) { return one.hasColumns; })) {
        return nullptr;
    }
    if (const Failure *only = onlyFailure(failures, [](const Failure &one) { return one.isSplit; })) {
        return &only->dialect;
    }
    // What is wrong with any delimiter has nothing to do with it.
    const bool isSame = !failures.empty() && std::all_of(failures.begin(), failures.end(), [&](const Failure &one) {
        return one.error.message() == failures.front().error.message();
    });
    return isSame ? &failures.front().dialect : nullptr;
}

InputError noneIsPossible(const QString &path, const std::vector<Failure> &failures)
{
    QString text = Xlate(
        "the delimiter cannot be determined: with a comma, a semicolon, a tab, a vertical bar, or blanks and tabs, the first rows do not have the same number of cells that fit their variables. Specify the delimiter");
    for (const Failure &failure : failures) {
        if (failure.hasColumns) {
            const auto &place = failure.error.place;
            text += QStringLiteral("; ") +
                    Xlate("with %1, in line %2: %3")
                        .arg(nameOf(failure.dialect), QString::number(place ? place->line : 1), failure.error.text);
        }
    }
    return {path, std::nullopt, text};
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
    return InputError{path, std::nullopt,
                      Xlate("the delimiter cannot be determined: it may be %1. Specify the delimiter")
                          .arg(names.join(Xlate(" or @@between two delimiters")))};
}

/// Reads the first rows with a delimiter.
void tryDelimiter(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect, const Variables &variables,
                  Trials &trials)
{
    CsvRows rows(file, dialect, variables);
    Cells cells = firstCells(*file, dialect);
    trials.hasRow = trials.hasRow || !cells.empty();
    const bool isSplit = !cells.empty() && cells.front().size() > 1;
    const bool hasColumns = !rows.error() && isSplit;
    if (hasColumns && readFirstRows(rows)) {
        std::vector<unsigned> ids = rows.ids();
        std::sort(ids.begin(), ids.end());
        const bool isSame = std::any_of(trials.possible.begin(), trials.possible.end(),
                                        [&](const Reading &other) { return other.cells == cells; });
        if (!isSame) {
            trials.possible.push_back({dialect, std::move(ids), std::move(cells)});
        }
    } else if (rows.error()) {
        trials.failures.push_back({dialect, *rows.error(), isSplit, hasColumns});
    }
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
    Trials trials;
    for (const Candidate &candidate : candidates) {
        if (!isMark(candidate, dialect.numbers)) {
            known.kind = candidate.kind;
            known.delimiter = candidate.delimiter;
            tryDelimiter(file, known, variables, trials);
        }
    }
    if (!trials.possible.empty()) {
        return only(file->path(), trials.possible);
    }
    if (const CsvDialect *wrong = clearlyWrong(trials.failures)) {
        return *wrong; // it says itself what is wrong
    }
    if (!trials.hasRow && trials.failures.empty()) {
        return known; // without a row, any delimiter does
    }
    return noneIsPossible(file->path(), trials.failures);
}

} // namespace kareport
