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
    if (dialect.hasHeader && !dialect.isHeaderSaid) {
        lookAtHeader(dialect);
    }
    firstRow_ = dialect.hasHeader ? RowPlace{reader_.position(), reader_.nextLine()} : start;
    rewind();
}

void CsvRows::checkHeader()
{
    if (!error_) {
        error_ = headerIsData_;
    }
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
        } else if (!storeOver(
                       binding_.isShared(field), parser.id(), field.variable, object,
                       [&] { return parser.storeValue(cell, object); },
                       [&] { return std::optional(reader_.placeOfCell(field.column)); }))
        {
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
