#pragma once

#include "UJobSettings.h"

#include <QJsonObject>

namespace kareport
{

/// The settings by their keys, as `readSettings` reads them: all of them, so that they come back whatever the defaults are.
QJsonObject settingsToJson(const UJobSettings &settings);

} // namespace kareport
