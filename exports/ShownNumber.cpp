#include "ShownNumber.h"

#include "UJobSettings.h"
#include "ValueKind.h"
#include "VariableType.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace kareport
{

bool showsNumbers(const ResultColumn &column)
{
    switch (column.field.Type) {
    case VARIABLE_INTEGER:
    case VARIABLE_DOUBLE:
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
    case VARIABLE_STATION:
    case VARIABLE_OFFSET:
    case VARIABLE_AREA:
    case VARIABLE_PLAIN:
    case VARIABLE_THICKNESS: return true;
    default: return false;
    }
}

bool hasSideLetter(const ResultColumn &column)
{
    return column.field.Type == VARIABLE_OFFSET && column.suffix != u'+';
}

int shownDecimals(const ResultColumn &column, const UJobSettings &settings)
{
    switch (column.field.Type) {
    case VARIABLE_DOUBLE:
    case VARIABLE_AREA:
    case VARIABLE_PLAIN: return settings.numberDecimals;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_THICKNESS: return std::max(column.field.Decimals, 0);
    // The decimals of a length are those of the settings where the field says -1.
    case VARIABLE_OFFSET:
        return column.field.Decimals == -1 ? settings.lengthDecimals : std::max(column.field.Decimals, 0);
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION: return settings.lengthDecimals;
    case VARIABLE_STATION: return settings.stationDecimals;
    default: return 0;
    }
}

std::optional<double> shownNumber(const ResultColumn &column, const ResultCell &cell, const UJobSettings &settings)
{
    if (cell.value == nullptr) {
        return std::nullopt;
    }
    const void *value = cell.value->GetData();
    switch (cell.value->kind()) {
    case ValueKind::Int16: return *static_cast<const qint16 *>(value);
    case ValueKind::Int32: return *static_cast<const qint32 *>(value);
    case ValueKind::Double: break;
    default: return std::nullopt;
    }
    const double internal = *static_cast<const double *>(value);
    if (!std::isfinite(internal)) {
        return std::nullopt;
    }
    switch (column.field.Type) {
    case VARIABLE_THICKNESS: return internal / 100;
    case VARIABLE_BEARING: return internal * 180 / std::numbers::pi;
    default: return settings.ConvertToDisplay(internal, column.field.Type, 0);
    }
}

} // namespace kareport
