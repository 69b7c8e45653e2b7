#include "SqliteRows.h"

#include "NearestName.h"
#include "NumberText.h"
#include "Xlate.h"

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

constexpr qsizetype longestQuote = 40;

} // namespace

SqliteRows::SqliteRows(std::shared_ptr<SqliteFile> file, const SqliteQuery &query, const Variables &variables)
    : file_(std::move(file)), geometry_(*file_)
{
    error_ = file_->error() ? file_->error() : geometry_.error();
    if (!error_ && prepareAll(query) && findColumns(query) && bindColumns(query, variables)) {
        prepareNeeded(query);
    }
}

void SqliteRows::rewind()
{
    sqlite3_reset(statement_.get());
    row_ = 0;
    error_.reset();
}

bool SqliteRows::next(UDataObject &object, const std::vector<unsigned> * /*onlyIds*/)
{
    const int code = file_->isStopped() ? SQLITE_INTERRUPT : sqlite3_step(statement_.get());
    if (code != SQLITE_ROW) {
        if (code != SQLITE_DONE && (code & 0xFF) != SQLITE_INTERRUPT) {
            error_ = file_->failure(code);
        }
        return false;
    }
    ++row_;
    rowBytes_ = 0;
    if (needsGeometry_ && !readGeometry()) {
        return false;
    }
    binding_.begin(object);
    const auto &fields = binding_.fields();
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const FieldSource &source = sources_[i];
        const auto store = [&] {
            return source.part ? storePart(fields[i], *source.part, object)
                               : storeCell(fields[i], source.column, object);
        };
        if (!storeOver(binding_.isShared(fields[i]), fields[i].parser.id(), fields[i].variable, object, store, noPlace))
        {
            return false;
        }
    }
    return true;
}

bool SqliteRows::storeCell(const BoundField &field, int column, UDataObject &object)
{
    sqlite3_stmt *statement = statement_.get();
    bool fits = false;
    switch (sqlite3_column_type(statement, column)) {
    case SQLITE_NULL: binding_.storeNone(field, object); return true;
    case SQLITE_INTEGER: fits = field.parser.storeInteger(sqlite3_column_int64(statement, column), object); break;
    case SQLITE_FLOAT: fits = field.parser.storeNumber(sqlite3_column_double(statement, column), object); break;
    case SQLITE_TEXT: return storeText(field, column, object);
    default: break;
    }
    rowBytes_ += sizeof(double);
    return fits || failInCell(field, column);
}

bool SqliteRows::storeText(const BoundField &field, int column, UDataObject &object)
{
    const std::string_view text = bytesOfText(statement_.get(), column);
    rowBytes_ += text.size();
    if (field.parser.isNone(text)) {
        binding_.storeNone(field, object);
        return true;
    }
    return (isPlainText(text) && field.parser.storeValue(text, object)) || failInCell(field, column);
}

bool SqliteRows::storePart(const BoundField &field, GeometryPart part, UDataObject &object)
{
    const auto *system = point_ ? geometry_.referenceSystem(point_->referenceSystem) : nullptr;
    const auto wrong = storeGeometryPart(binding_, field, part, point_, system, object);
    return !wrong || failInRow(*wrong);
}

/// Reads the point of the row. @return whether there is one, or no geometry at all
bool SqliteRows::readGeometry()
{
    point_.reset();
    const int column = *geometryColumn_;
    if (sqlite3_column_type(statement_.get(), column) == SQLITE_NULL) {
        return true;
    }
    const auto *bytes = static_cast<const char *>(sqlite3_column_blob(statement_.get(), column));
    const int size = sqlite3_column_bytes(statement_.get(), column);
    if (bytes == nullptr && size > 0) {
        throw std::bad_alloc();
    }
    rowBytes_ += static_cast<std::size_t>(size);
    const PointOrFault read = parseGeoPackagePoint({bytes, bytes != nullptr ? static_cast<std::size_t>(size) : 0});
    if (const QString *instead = std::get_if<QString>(&read)) {
        return failInRow(Xlate("a point was expected instead of %1").arg(*instead));
    }
    point_ = std::get<PointGeometry>(read);
    return true;
}

bool SqliteRows::failInRow(const QString &text)
{
    error_ = InputError{file_->path(), std::nullopt, Xlate("row %1: ").arg(row_) + text};
    return false;
}

bool SqliteRows::failInCell(const BoundField &field, int column)
{
    sqlite3_stmt *statement = statement_.get();
    const bool isBlob = sqlite3_column_type(statement, column) == SQLITE_BLOB;
    const QString shown = isBlob ? Xlate("%1 bytes").arg(sqlite3_column_bytes(statement, column))
                                 : shortened(textOfColumn(statement, column), longestQuote);
    return failInRow(Xlate("the value \"%1\" of the column \"%2\" does not fit: %3 was expected")
                         .arg(shown, field.name, field.parser.expected()));
}

} // namespace kareport
