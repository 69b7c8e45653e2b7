#pragma once

#include "DataUnits.h"
#include "ResultSink.h"
#include "sXmlReportDictionary.h"

#include <QString>

#include <optional>

namespace kareport
{

/// Says of a column what its numbers stand for in the data. @param units  of the data
void describeColumn(ResultColumn &column, const sXmlReportDictionary &dictionary, const DataUnits &units);

/// A column of a variable that the report does not show; nothing for a name that the dictionary does not have.
std::optional<ResultColumn> hiddenColumn(const QString &variable, const sXmlReportDictionary &dictionary);

} // namespace kareport
