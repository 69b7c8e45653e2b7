#include "Measures.h"

#include "VariableType.h"

namespace kareport
{

Measure measureOf(int type)
{
    switch (type) {
    case VARIABLE_INTEGER:
    case VARIABLE_DOUBLE:
    case VARIABLE_PLAIN: return Measure::Number;
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
    case VARIABLE_STATION:
    case VARIABLE_OFFSET: return Measure::Length;
    case VARIABLE_AREA: return Measure::Area;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_BEARING: return Measure::Angle;
    case VARIABLE_THICKNESS: return Measure::Thickness;
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: return Measure::Truth;
    default: return Measure::Text;
    }
}

bool isNumeric(int type)
{
    const Measure measure = measureOf(type);
    return measure != Measure::Truth && measure != Measure::Text;
}

bool isAdded(int type)
{
    return isNumeric(type) && type != VARIABLE_THICKNESS && type != VARIABLE_BEARING;
}

} // namespace kareport
