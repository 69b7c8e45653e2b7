#pragma once

#include "RowReader.h"
#include "SqliteGeometry.h"
#include "SqliteObjectList.h"

#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// The rows of a table, a view or a query of a SQLite database.
class SqliteRows : public RowReader
{
public:
    /// Finds the columns; no row is read.
    /// @param file  the database of the query
    SqliteRows(std::shared_ptr<SqliteFile> file, const SqliteQuery &query, const Variables &variables);

    bool next(UDataObject &object, const std::vector<unsigned> *onlyIds) override;
    void rewind() override;
    std::size_t position() const override { return row_; }
    std::size_t rowBytes() const override { return rowBytes_; }
    std::optional<InputError> lostBytes() const override { return file_->changed(); }
    QString name() const override { return file_->path(); }
    bool mayWait() const override { return true; }
    void stop() override { file_->stop(); }

private:
    bool prepareAll(const SqliteQuery &query);
    bool findColumns(const SqliteQuery &query);
    bool bindColumns(const SqliteQuery &query, const Variables &variables);
    bool prepareNeeded(const SqliteQuery &query);
    bool storeCell(const BoundField &field, int column, UDataObject &object);
    bool storeText(const BoundField &field, int column, UDataObject &object);
    bool storePart(const BoundField &field, GeometryPart part, UDataObject &object);
    bool readGeometry();
    bool failInRow(const QString &text);
    bool failInCell(const BoundField &field, int column);

    std::shared_ptr<SqliteFile> file_;
    SqliteGeometry geometry_;
    SqliteStatement statement_{nullptr, sqlite3_finalize};
    std::size_t ownColumns_ = 0;        ///< columns of the data itself; those of a geometry follow
    std::optional<int> geometryColumn_; ///< of the statement
    std::vector<FieldSource> sources_;  ///< of the fields, with columns of the statement
    bool needsGeometry_ = false;
    std::optional<PointGeometry> point_; ///< of the row
    std::size_t row_ = 0;
    std::size_t rowBytes_ = 0;
};

} // namespace kareport
