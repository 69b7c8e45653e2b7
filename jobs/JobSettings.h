#pragma once

#include "DataUnits.h"
#include "JsonNode.h"
#include "UJobSettings.h"

#include <QJsonObject>

namespace kareport
{

/// Reads the host's settings by their keys. What is wrong with one fails the node. @param settings  those whose keys are
/// not given
UJobSettings readSettings(const JsonNode &node, UJobSettings settings = {});
/// The settings by their keys, as `readSettings` reads them: all of them, so that they come back whatever the defaults are.
QJsonObject settingsToJson(const UJobSettings &settings);

/// Reads the units of a data set. What is wrong with one fails the node.
DataUnits readDataUnits(const JsonNode &node);

} // namespace kareport
