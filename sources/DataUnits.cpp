#include "DataUnits.h"

#include "VariableType.h"

#include <numbers>

namespace kareport
{

double DataUnits::factorOf(int type) const
{
    switch (type) {
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
    case VARIABLE_STATION:
    case VARIABLE_OFFSET: return metresIn(length);
    case VARIABLE_AREA: return squareMetresIn(area);
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_BEARING:
        switch (angle) {
        case AngleUnit::Degree: return std::numbers::pi / 180;
        case AngleUnit::Gon: return std::numbers::pi / 200;
        case AngleUnit::Radian: return 1;
        }
        return 1;
    default: return 1;
    }
}

QString DataUnits::assumedKey(int type) const
{
    switch (type) {
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
    case VARIABLE_STATION:
    case VARIABLE_OFFSET: return isLengthSaid ? QString() : keyOf(length).toString();
    case VARIABLE_AREA: return isAreaSaid ? QString() : keyOf(area).toString();
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_BEARING: return isAngleSaid ? QString() : keyOf(angle).toString();
    default: return {};
    }
}

} // namespace kareport
