#pragma once

#include "ColumnBinding.h"
#include "DataPreview.h"
#include "DataUnits.h"

#include <QJsonObject>
#include <QString>

#include <functional>

namespace kareport
{

struct PostgresSample;

/// The first rows of a table of a SQLite database, as a job with these keys reads them.
/// @param options  keys of a "sqlite" data set, the table among them. What is wrong with them is the preview's error
DataPreview previewSqliteTable(const QString &file, const QJsonObject &options,
                               const std::function<Variables(const DataUnits &)> &variablesIn, int mostRows);

/// The first rows of a table of a PostgreSQL database, as a job with these keys reads them.
/// @param options  keys of a "postgresql" data set. What is wrong with them is the preview's error
DataPreview previewPostgresTable(const PostgresSample &sample, const QJsonObject &options,
                                 const std::function<Variables(const DataUnits &)> &variablesIn);

/// The parts of a geometry that coordinates are proposed to be read from, as an object of `columns`: of a table that has a
/// geometry and no columns of the names of coordinates. Empty for any other.
QJsonObject proposedGeometry(const DataPreview &own, const Variables &variables);

} // namespace kareport
