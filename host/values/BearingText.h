#pragma once

#include "UFormatAngle.h"
#include "UFormatBearing.h"
#include "UJobSettings.h"

#include <QString>

namespace kareport
{

/// A bearing as the settings have it shown, with the user's angle marks; empty for a value that is not finite.
/// @param value  in radians, clockwise from north
/// @throws std::bad_alloc without memory
inline QString bearingText(double value, const UJobSettings &settings)
{
    // What memory it takes is asked for here: the conversion answers with an empty text where there is none.
    constexpr qsizetype longestBearing = 64;
    QString text;
    text.reserve(longestBearing);
    UFormatBearing(settings.bearingUnit, settings.bearingStyle, settings.bearingDecimals, settings.bearingPadding,
                   settings.bearingReference)
        .ConvertToDisplayString(value, text);
    UFormatAngle::ConvertToDMSformatString(settings.angleMarks[0], settings.angleMarks[1], settings.angleMarks[2],
                                           text);
    return text;
}

} // namespace kareport
