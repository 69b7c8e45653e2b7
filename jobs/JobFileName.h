#pragma once

#include "JsonNode.h"

#include <QDir>
#include <QString>

namespace kareport
{

/// Reads the name of a file. One with a character 0 fails the node: the system takes a name for ended there, and would
/// open another file.
QString readFileName(const JsonNode &node);

/// Reads the name of a file with data. @return its complete name, or "-" for standard input
QString readDataFileName(const JsonNode &node, const QDir &folder);

} // namespace kareport
