#include "CsvRows.h"

#include "NearestName.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qsizetype longestQuote = 40;

/// A cell for a message, cut short.
QString quoteOf(std::string_view cell)
{
    constexpr std::size_t longestBytes = 4 * std::size_t(longestQuote) + 4; // what is cut off is not shown
    const auto bytes = static_cast<qsizetype>(std::min(cell.size(), longestBytes));
    return shortened(QString::fromUtf8(cell.data(), bytes), longestQuote);
}

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

CsvReader::Layout layoutOf(const CsvDialect &dialect)
{
    return {dialect.delimiter, dialect.kind == DelimiterKind::Whitespace, dialect.skip, dialect.comment,
            dialect.passesBlankLines};
}

CsvRows::CsvRows(std::shared_ptr<const FileBytes> file, const CsvDialect &dialect, const Variables &variables)
    : file_(std::move(file)),
      reader_(file_->path(), file_->view(), layoutOf(dialect)),
      isNamed_(dialect.hasHeader && dialect.order.isEmpty() && dialect.names.isEmpty())
{
    const RowPlace start = {reader_.position(), reader_.nextLine()};
    if (!readColumns(dialect) || !bindColumns(dialect, variables)) {
        return;
    }
    if (dialect.hasHeader && holdsValues(dialect)) {
        headerIsData_ = reader_.errorAt(
            reader_.placeOfCell(0),
            Xlate(
                "the header row holds values that fit the columns, and would be lost if it is data: \"header\": false "
                "(--no-header) was expected, with \"skip\" for lines that are not data"));
    }
    firstRow_ = dialect.hasHeader ? RowPlace{reader_.position(), reader_.nextLine()} : start;
    rewind();
}

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

/// Whether the row that was read last has values of the variables instead of their names: half of those cells at least that
/// are not of texts. A name may look like a number, and a row of data may have a cell that is wrong, or too few of them. A row
/// of texts alone may be either.
bool CsvRows::holdsValues(const CsvDialect &dialect) const
{
    const auto &cells = reader_.cells();
    // A column that is read by the name in the row tells that there are names.
    const auto chosenByNumber =
        std::count_if(dialect.columns.begin(), dialect.columns.end(),
                      [](const ColumnChoice &choice) { return std::holds_alternative<int>(choice.column); });
    if (isNamed_ && chosenByNumber != std::ssize(binding_.fields())) {
        return false;
    }
    UDataObject object;
    std::size_t values = 0;
    std::size_t others = 0;
    for (const BoundField &field : binding_.fields()) {
        const std::string_view cell = field.column < cells.size() ? cells[field.column] : std::string_view();
        if (!field.parser.takesAnyText() && !field.parser.isNone(cell)) {
            ++(field.parser.storeValue(cell, object) ? values : others);
        }
    }
    return values > 0 && values >= others;
}

void CsvRows::checkHeader()
{
    if (!error_) {
        error_ = headerIsData_;
    }
}

void CsvRows::failWithoutVariable()
{
    error_ = isNamed_
                 ? reader_.errorAt(reader_.placeOfCell(0),
                                   Xlate("no column of the header row is a variable of the dictionary: a header row of "
                                         "variable names, with the data's delimiter between them, was expected"))
                 : InputError{file_->path(), std::nullopt,
                              Xlate("no column is a variable of the dictionary: without a header row, columns with "
                                    "their numbers were expected, or an order such as PNEZD")};
}

void CsvRows::seek(const RowPlace &place)
{
    reader_.seek(place.start, place.line);
    error_.reset();
    released_ = file_->view().size(); // rows in another order come back to what was read
}

std::optional<TextPlace> CsvRows::placeOfNext(const QString &variable)
{
    if (!reader_.next()) {
        return std::nullopt;
    }
    const auto &fields = binding_.fields();
    const auto field = std::find_if(fields.begin(), fields.end(),
                                    [&](const BoundField &other) { return equalFolded(other.variable, variable); });
    return field != fields.end() ? reader_.placeOfCell(field->column) : TextPlace{reader_.rowLine(), 1};
}

void CsvRows::rewind()
{
    seek(firstRow_);
    released_ = 0;
}

bool CsvRows::next(UDataObject &object, const std::vector<unsigned> *onlyIds)
{
    if (!reader_.next()) {
        error_ = reader_.error();
        return false;
    }
    const auto &cells = reader_.cells();
    if (cells.size() != width_) {
        return failWithCells();
    }
    binding_.begin(object);
    for (const BoundField &field : binding_.fields()) {
        const ValueParser &parser = field.parser;
        if (onlyIds != nullptr && std::find(onlyIds->begin(), onlyIds->end(), parser.id()) == onlyIds->end()) {
            continue;
        }
        const std::string_view cell = cells[field.column];
        if (parser.isNone(cell)) {
            binding_.storeNone(field, object);
        } else if (!parser.storeValue(cell, object)) {
            return failInCell(field);
        }
    }
    file_->releaseBefore(reader_.rowStart(), released_);
    return true;
}

bool CsvRows::failWithCells()
{
    const QString sentence = isNamed_ ? Xlate("the row has %1 cells: %2 were expected, as in the header row")
                                      : Xlate("the row has %1 cells: %2 were expected, as in all rows");
    error_ = reader_.errorAt(reader_.placeOfCell(std::min(reader_.cells().size(), width_)),
                             sentence.arg(reader_.cells().size()).arg(width_));
    return false;
}

bool CsvRows::failInCell(const BoundField &field)
{
    error_ = reader_.errorAt(reader_.placeOfCell(field.column),
                             Xlate("the cell \"%1\" of the column \"%2\" does not fit: %3 was expected")
                                 .arg(quoteOf(reader_.cells()[field.column]), field.name, field.parser.expected()));
    return false;
}

} // namespace kareport
