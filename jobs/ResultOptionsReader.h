#pragma once

#include "JsonNode.h"
#include "OutputKind.h"
#include "ResultOptions.h"

#include <QDir>
#include <QStringList>

namespace kareport
{

/// The keys that an output of a kind may have.
QStringList outputKeys(OutputKind kind);
/// The keys of outputs of all kinds.
QStringList allOutputKeys();

/// Reads what an output that is an object says of its results. What is wrong with a key fails its node; keys that the kind does
/// not have are not looked for here.
/// @param folder  of the job file
ResultOptions readResultOptions(const JsonNode &node, OutputKind kind, const QDir &folder);

} // namespace kareport
