#pragma once

#include "CsvObjectList.h"
#include "JsonNode.h"

namespace kareport
{

/// Stores the members of a JSON object that the dictionary knows; null stores no value. What does not fit fails the
/// node's source.
void storeJsonObject(const JsonNode &node, const FindVariable &findVariable, UDataObject &object);

} // namespace kareport
