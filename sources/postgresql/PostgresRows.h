#pragma once

#include "GeometryColumns.h"
#include "LibPq.h"
#include "PostgresConnection.h"
#include "PostgresObjectList.h"
#include "RowReader.h"

#include <QHash>

#include <memory>
#include <optional>
#include <string_view>
#include <vector>

namespace kareport
{

/// The rows of a query of a PostgreSQL database.
class PostgresRows : public RowReader
{
public:
    /// Finds the columns; no row is read. @param isToStop  asked meanwhile
    PostgresRows(std::shared_ptr<PostgresConnection> connection, const PostgresQuery &query, const Variables &variables,
                 const std::function<bool()> &isToStop);

    bool next(UDataObject &object, const std::vector<unsigned> *onlyIds) override;
    void rewind() override;
    std::size_t position() const override { return row_; }
    std::size_t rowBytes() const override { return rowBytes_; }
    QString name() const override { return connection_->name(); }
    bool mayWait() const override { return true; }
    void stop() override { connection_->stop(); }

private:
    bool prepare(const PostgresQuery &query);
    bool bindColumns(const PostgresQuery &query, const Variables &variables);
    void readSystems();
    bool storeRow(const PGresult *row, UDataObject &object);
    bool storeCell(const BoundField &field, const PGresult *row, int column, UDataObject &object);
    bool storePart(const BoundField &field, GeometryPart part, UDataObject &object);
    bool readGeometry(const PGresult *row);
    bool fail(const QString &text);
    bool failUnlessStopped();
    bool failInRow(const QString &text);

    const LibPq &pq_ = libPq();
    std::shared_ptr<PostgresConnection> connection_;
    std::vector<std::optional<QByteArray>> parameters_;
    std::size_t ownColumns_ = 0;        ///< columns of the data itself; those of a geometry follow
    std::optional<int> geometryColumn_; ///< of the answer
    bool needsGeometry_ = false;
    std::vector<FieldSource> sources_; ///< of the fields, with columns of the answer
    QHash<qint32, ReferenceSystem> systems_;
    std::optional<PointGeometry> point_; ///< of the row
    bool isSent_ = false;
    std::size_t row_ = 0;
    std::size_t rowBytes_ = 0;
};

} // namespace kareport
