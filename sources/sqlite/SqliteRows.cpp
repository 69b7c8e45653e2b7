#include "SqliteRows.h"

#include "NearestName.h"
#include "NumberText.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qsizetype longestQuote = 40;

/// A name in a query.
QString quoted(const QString &name)
{
    return u'"' + QString(name).replace(u'"', QStringLiteral("\"\"")) + u'"';
}

QString withTables(const QString &table, const QStringList &tables)
{
    const QString sentence = Xlate("the database has no table \"%1\"").arg(table);
    const QString question = didYouMean(table, tables);
    return sentence + QStringLiteral(": ") +
           (!question.isEmpty() ? question
                                : Xlate("one of %1 was expected")
                                      .arg(tables.isEmpty() ? Xlate("none") : tables.join(QStringLiteral(", "))));
}

} // namespace

SqliteRows::SqliteRows(const SqliteQuery &query, const Variables &variables) : file_(query.file), geometry_(file_)
{
    error_ = file_.error();
    if (!error_ && prepareAll(query) && findColumns(query) && bindColumns(query, variables)) {
        prepareNeeded(query);
    }
}

/// Prepares what all columns are known by.
bool SqliteRows::prepareAll(const SqliteQuery &query)
{
    if (!query.table.isEmpty()) {
        const QStringList tables = file_.tables();
        const bool isThere = file_.prepare(QStringLiteral("SELECT * FROM ") + quoted(query.table)) != nullptr;
        if (!isThere && !tables.contains(query.table, Qt::CaseInsensitive)) {
            error_ = InputError{query.file, std::nullopt, withTables(query.table, tables)};
            return false;
        }
    }
    auto statement = file_.prepareQuery(query.table.isEmpty() ? query.query
                                                              : QStringLiteral("SELECT * FROM ") + quoted(query.table));
    if (const InputError *wrong = errorOf(statement)) {
        error_ = *wrong;
        return false;
    }
    statement_ = std::move(std::get<SqliteStatement>(statement));
    return true;
}

bool SqliteRows::findColumns(const SqliteQuery &query)
{
    for (int i = 0; i < sqlite3_column_count(statement_.get()); ++i) {
        columns_.push_back({QString::fromUtf8(sqlite3_column_name(statement_.get(), i)), std::nullopt, false});
        const QString table = QString::fromUtf8(sqlite3_column_table_name(statement_.get(), i));
        const QString origin = QString::fromUtf8(sqlite3_column_origin_name(statement_.get(), i));
        // A view is registered by its own name, though its columns come from a table.
        const bool isGeometry = geometry_.isGeometry(table, origin) ||
                                (!query.table.isEmpty() && geometry_.isGeometry(query.table, columns_.back().name));
        if (isGeometry && geometryColumn_) {
            error_ =
                InputError{query.file, std::nullopt,
                           Xlate("the columns \"%1\" and \"%2\" both have geometries: a query with one of them was "
                                 "expected")
                               .arg(columns_[static_cast<std::size_t>(*geometryColumn_)].name, columns_.back().name)};
            return false;
        }
        geometryColumn_ = isGeometry ? std::optional(i) : geometryColumn_;
    }
    ownColumns_ = columns_.size();
    if (geometryColumn_) {
        columns_[static_cast<std::size_t>(*geometryColumn_)].isOffered = true; // its parts are what is read
        offerGeometryParts(columns_);
    }
    return true;
}

bool SqliteRows::bindColumns(const SqliteQuery &query, const Variables &variables)
{
    if (const auto fault = binding_.bind(columns_, query.columns, variables)) {
        if (!fault->choice.isEmpty()) {
            wrongChoice_ = fault;
        }
        error_ = InputError{query.file, std::nullopt, fault->text};
        return false;
    }
    if (binding_.fields().empty()) {
        error_ = InputError{query.file, std::nullopt,
                            Xlate("no column is a variable of the dictionary: there are %1")
                                .arg(namesOf(columns_).join(QStringLiteral(", ")))};
        return false;
    }
    for (const BoundField &field : binding_.fields()) {
        Source &source = sources_.emplace_back();
        if (field.column < ownColumns_) {
            source.column = static_cast<int>(field.column);
        } else {
            source.part = geometryParts[field.column - ownColumns_].first;
            needsGeometry_ = true;
        }
    }
    return true;
}

/// Prepares a table anew with the columns alone that are read: a polygon nobody asks for is not fetched.
bool SqliteRows::prepareNeeded(const SqliteQuery &query)
{
    if (query.table.isEmpty()) {
        return true;
    }
    std::vector<int> needed;
    for (const Source &source : sources_) {
        needed.push_back(source.part ? *geometryColumn_ : source.column);
    }
    std::sort(needed.begin(), needed.end());
    needed.erase(std::unique(needed.begin(), needed.end()), needed.end());
    const auto indexOf = [&needed](int column) {
        return static_cast<int>(std::lower_bound(needed.begin(), needed.end(), column) - needed.begin());
    };
    QStringList names;
    for (const int column : needed) {
        names.append(quoted(columns_[static_cast<std::size_t>(column)].name));
    }
    for (Source &source : sources_) {
        source.column = source.part ? -1 : indexOf(source.column);
    }
    geometryColumn_ = needsGeometry_ ? std::optional(indexOf(*geometryColumn_)) : std::nullopt;
    auto statement = file_.prepareQuery(
        QStringLiteral("SELECT %1 FROM %2").arg(names.join(QStringLiteral(", ")), quoted(query.table)));
    if (const InputError *wrong = errorOf(statement)) {
        error_ = *wrong;
        return false;
    }
    statement_ = std::move(std::get<SqliteStatement>(statement));
    return true;
}

void SqliteRows::rewind()
{
    sqlite3_reset(statement_.get());
    row_ = 0;
    error_.reset();
}

bool SqliteRows::next(UDataObject &object, const std::vector<unsigned> * /*onlyIds*/)
{
    const int code = file_.isStopped() ? SQLITE_INTERRUPT : sqlite3_step(statement_.get());
    if (code != SQLITE_ROW) {
        if (code != SQLITE_DONE && (code & 0xFF) != SQLITE_INTERRUPT) {
            error_ = file_.failure(code);
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
        const Source &source = sources_[i];
        if (source.part ? !storePart(fields[i], *source.part, object) : !storeCell(fields[i], source.column, object)) {
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
    const auto *bytes = reinterpret_cast<const char *>(sqlite3_column_text(statement_.get(), column));
    const auto size = static_cast<std::size_t>(sqlite3_column_bytes(statement_.get(), column));
    const std::string_view text(bytes, bytes != nullptr ? size : 0);
    rowBytes_ += size;
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
    rowBytes_ += static_cast<std::size_t>(size);
    const PointOrFault read = parseGeoPackagePoint({bytes, bytes != nullptr ? static_cast<std::size_t>(size) : 0});
    if (const QString *instead = std::get_if<QString>(&read)) {
        return failInRow(Xlate("there is %1: a point was expected").arg(*instead));
    }
    point_ = std::get<PointGeometry>(read);
    return true;
}

bool SqliteRows::failInRow(const QString &text)
{
    error_ = InputError{file_.path(), std::nullopt, Xlate("row %1: ").arg(row_) + text};
    return false;
}

bool SqliteRows::failInCell(const BoundField &field, int column)
{
    sqlite3_stmt *statement = statement_.get();
    const bool isBlob = sqlite3_column_type(statement, column) == SQLITE_BLOB;
    QString shown =
        isBlob ? Xlate("%1 bytes").arg(sqlite3_column_bytes(statement, column)) : textOfColumn(statement, column);
    shown = shown.size() > longestQuote ? shown.left(longestQuote) + u'…' : shown;
    return failInRow(Xlate("the value \"%1\" of the column \"%2\" does not fit: %3 was expected")
                         .arg(shown, field.name, field.parser.expected()));
}

} // namespace kareport
