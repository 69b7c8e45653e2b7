#pragma once

#include "DataKind.h"

#include <vector>

namespace kareport
{

/// The kinds of data sets that a job may have. This is the only list of them: the reader of jobs, the messages about keys
/// and the opening of data all ask here.
const std::vector<DataKind> &dataKinds();

// What makes the kinds, each in a file of its own (CsvData.cpp and so on).

/// Data sets with the key "csv": text files of rows and cells.
DataKind csvDataKind();
/// Data sets with the key "values": their rows are in the job.
DataKind valuesDataKind();
/// Data sets with the key "sqlite": a table or a query of a SQLite database, a GeoPackage among them.
DataKind sqliteDataKind();
/// Data sets with the key "postgresql": a query of a PostgreSQL database.
DataKind postgresDataKind();
/// Data sets with the key "json": JSON files with a list of objects, or an object a line.
DataKind jsonDataKind();
/// Data sets with the key "landxml": lists that are read of a LandXML file.
DataKind landXmlDataKind();

} // namespace kareport
