#pragma once

#include "JsonNode.h"
#include "UDataObject.h"
#include "ValueParser.h"

namespace kareport
{

/// Stores the members of a JSON object that the dictionary knows; null stores no value. What does not fit fails the
/// node's source.
void storeJsonObject(const JsonNode &node, const FindVariable &findVariable, UDataObject &object);

} // namespace kareport
