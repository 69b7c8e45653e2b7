#pragma once

#include "CsvDialect.h"
#include "JsonNode.h"

namespace kareport
{

/// Reads the delimiter of a text file: one ASCII character, "whitespace" or "auto". What is wrong with it fails the node.
void readDelimiter(const JsonNode &node, CsvDialect &dialect);

/// Reads what a data set says about how its text file is written. What is wrong with a key fails its node.
CsvDialect readCsvDialect(const JsonNode &set);

/// The keys that `readCsvDialect` reads.
QStringList csvDialectKeys();

} // namespace kareport
