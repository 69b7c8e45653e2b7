#include "CsvRows.h"

#include "Xlate.h"

#include <algorithm>

// How the columns of a file are found, and whether its first row names them.

namespace kareport
{

namespace
{

/// Blanks of any kind, and marks that cannot be seen: programs leave them around the names of columns.
bool isUnseen(QChar character)
{
    constexpr char16_t byteOrderMark = 0xFEFF;
    constexpr char16_t zeroWidthSpace = 0x200B;
    constexpr char16_t wordJoiner = 0x2060;
    return character.isSpace() || character == byteOrderMark || character == zeroWidthSpace || character == wordJoiner;
}

/// The name of a column without what is around it.
QString nameIn(std::string_view cell)
{
    const QString text = QString::fromUtf8(cell.data(), static_cast<qsizetype>(cell.size()));
    QStringView name = text;
    while (!name.isEmpty() && isUnseen(name.front())) {
        name = name.sliced(1);
    }
    while (!name.isEmpty() && isUnseen(name.back())) {
        name.chop(1);
    }
    return name.toString();
}

} // namespace

/// Reads the first row, which names the columns or tells how many there are. @return false when something is wrong with it
bool CsvRows::readColumns(const CsvDialect &dialect)
{
    const auto names = dialect.names.isEmpty() ? namesOfOrder(dialect.order) : std::optional(dialect.names);
    if (!names && !dialect.order.isEmpty()) {
        wrongChoice_ =
            ColumnFault{std::nullopt, QString(),
                        Xlate("\"%1\" is not an order of columns: each of the letters P, N, E, Z and D at most "
                              "once, and - for a column that is skipped, was expected, such as PNEZD")
                            .arg(dialect.order)};
        error_ = InputError{file_->path(), std::nullopt, wrongChoice_->text};
        return false;
    }
    const bool hasRow = reader_.next();
    if (reader_.error() || (!hasRow && dialect.hasHeader)) {
        error_ = reader_.error()
                     ? *reader_.error()
                     : reader_.errorAt(TextPlace(), isNamed_ ? Xlate("a header row of variable names was expected")
                                                             : Xlate("a header row was expected"));
        return false;
    }
    width_ = names ? static_cast<std::size_t>(names->size()) : reader_.cells().size();
    const std::vector<TextPlace> places = isNamed_ ? reader_.placesOfCells() : std::vector<TextPlace>();
    for (std::size_t i = 0; i < width_; ++i) {
        SourceColumn &column = columns_.emplace_back();
        if (isNamed_) {
            column.name = nameIn(reader_.cells()[i]);
            column.place = places[i];
        } else if (names) {
            column.name = (*names)[static_cast<qsizetype>(i)];
            column.namer = dialect.names.isEmpty() ? ColumnNamer::Order : ColumnNamer::List;
        }
    }
    // A file without a row has as many columns as are asked for.
    for (const ColumnChoice &choice : dialect.columns) {
        const int *number = std::get_if<int>(&choice.column);
        if (!hasRow && !names && number != nullptr && *number > static_cast<int>(columns_.size())) {
            columns_.resize(static_cast<std::size_t>(std::min(*number, 10000)));
            width_ = columns_.size();
        }
    }
    return true;
}

bool CsvRows::bindColumns(const CsvDialect &dialect, const Variables &variables)
{
    if (const auto fault = binding_.bind(columns_, dialect.columns, variables)) {
        if (!fault->choice.isEmpty()) {
            wrongChoice_ = fault;
        }
        std::optional<TextPlace> place;
        if (isNamed_) {
            place = reader_.placeOfCell(fault->column.value_or(0));
        }
        error_ = InputError{file_->path(), place, fault->text};
        return false;
    }
    if (binding_.fields().empty()) {
        failWithoutVariable();
        return false;
    }
    for (BoundField &field : binding_.fields()) {
        if (field.name.isEmpty()) {
            field.name = QString::number(field.column + 1);
        }
        field.parser.setNumberStyle(dialect.numbers);
    }
    return true;
}

void CsvRows::failWithoutVariable()
{
    error_ =
        isNamed_
            ? reader_.errorAt(
                  reader_.placeOfCell(0),
                  Xlate(
                      "no column of the header row is a variable of the dictionary: variable names separated by the delimiter were expected"))
            : InputError{
                  file_->path(), std::nullopt,
                  Xlate(
                      "no column is a variable of the dictionary: without a header row, column numbers or an order such as PNEZD were expected")};
}

/// Looks whether the row that was read last has values of the variables instead of their names. Half of those cells at least
/// that are not of texts make it a row of data, which would be lost; fewer are noted. A name may look like a number, and a row of
/// data may have a cell that is wrong, or too few of them. A row of texts alone may be either.
void CsvRows::lookAtHeader(const CsvDialect &dialect)
{
    // A column that is read by the name in the row tells that there are names. A number beyond the columns is a name.
    const auto chosenByNumber =
        std::count_if(dialect.columns.begin(), dialect.columns.end(), [this](const ColumnChoice &choice) {
            const int *number = std::get_if<int>(&choice.column);
            return number != nullptr && static_cast<std::size_t>(*number) <= columns_.size();
        });
    if (isNamed_ && chosenByNumber != std::ssize(binding_.fields())) {
        return;
    }
    const auto &cells = reader_.cells();
    UDataObject object;
    std::vector<std::size_t> values;
    std::size_t others = 0;
    for (const BoundField &field : binding_.fields()) {
        const std::string_view cell = field.column < cells.size() ? cells[field.column] : std::string_view();
        if (field.parser.takesAnyText() || field.parser.isNone(cell)) {
            continue;
        }
        if (field.parser.storeValue(cell, object)) {
            values.push_back(field.column);
        } else {
            ++others;
        }
    }
    if (values.empty()) {
        return;
    }
    if (values.size() >= others) {
        headerIsData_ = reader_.errorAt(
            reader_.placeOfCell(0),
            Xlate(
                "the header row holds values that fit the columns, and may be data. If it is data, set \"header\" to false (--no-header), and use \"skip\" for lines that are not data; otherwise set \"header\" to true"));
        return;
    }
    const QString sentence =
        values.size() == 1
            ? Xlate(
                  "the header row holds %1 value that fits its column, and may be data: set \"header\" to true if it is a header row, or to false if it is data")
            : Xlate(
                  "the header row holds %1 values that fit their columns, and may be data: set \"header\" to true if it is a header row, or to false if it is data");
    notes_.push_back(reader_.errorAt(reader_.placeOfCell(values.front()), sentence.arg(values.size())));
}

} // namespace kareport
