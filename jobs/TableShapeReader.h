#pragma once

#include "JsonNode.h"
#include "TableShape.h"

#include <QStringList>

namespace kareport
{

/// The keys of a table step that `readTableShape` reads.
QStringList tableShapeKeys();

/// Reads what a table step asks for. What is wrong fails the node.
TableShape readTableShape(const JsonNode &step);

} // namespace kareport
