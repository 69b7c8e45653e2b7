#include "LandXmlTexts.h"

#include "VariableType.h"

#include <cmath>

namespace kareport
{

std::optional<QString> landXmlText(double metres, int type, const UJobSettings &settings)
{
    const bool isStation = type == VARIABLE_STATION;
    const bool isLength = type == VARIABLE_LENGTH || type == VARIABLE_DISTANCE || type == VARIABLE_COORDINATE ||
                          type == VARIABLE_ELEVATION;
    if (!isLength && !isStation) {
        return std::nullopt;
    }
    if (std::isinf(metres)) {
        return metres < 0 ? QStringLiteral("-INF") : QStringLiteral("INF");
    }
    const double shown = settings.ConvertToDisplay(metres, type, 0);
    return isStation
               ? settings.StationToString(shown, false, false, false, -1, -1, false, false, false, true, false, true)
               : settings.UnitLengthToString(shown, false, false, -1, -1, false);
}

} // namespace kareport
