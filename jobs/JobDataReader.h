#pragma once

#include "Job.h"
#include "JsonNode.h"

#include <QDir>
#include <QHash>
#include <QString>

namespace kareport
{

/// Reads the data sets of a job by their names: each is of one of the kinds of `dataKinds`. What is wrong with one fails its
/// node.
/// @param folder        names of files are relative to it
/// @param isJobOnInput  standard input is the job, so that no data comes from there
QHash<QString, Job::DataSet> readDataSets(const JsonNode &node, const QDir &folder, bool isJobOnInput);

} // namespace kareport
