#pragma once

#include "JsonNode.h"
#include "LandXmlQuery.h"

#include <QStringList>

namespace kareport
{

/// The keys that say what a data set wants of a LandXML file.
QStringList landXmlQueryKeys();

/// Those of them that a list has a use for, without "list" and "tolerance".
QStringList landXmlKeysOf(LandXmlListKind kind);

/// Reads these keys of a data set. What is wrong with one fails the node; one of another list is wrong. The unit of the
/// lengths is left open.
LandXmlQuery readLandXmlQuery(const JsonNode &set);

} // namespace kareport
