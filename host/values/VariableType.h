#pragma once

/// The value type codes of dictionary variables. The keyword of a code is its name without "VARIABLE_"; codes 12 to 15 and 21
/// have none.
enum VARIABLE_TYPE
{
    VARIABLE_INTEGER = 0,    ///< a whole number
    VARIABLE_DOUBLE = 1,     ///< a number, shown with the decimals of numbers
    VARIABLE_TEXT = 2,       ///< a text
    VARIABLE_ANGLE = 3,      ///< an angle in radians, shown in the unit of angles
    VARIABLE_BEARING = 4,    ///< a direction in radians, clockwise from north
    VARIABLE_COORDINATE = 5, ///< a northing or an easting in metres
    VARIABLE_LENGTH = 6,     ///< a length in metres
    VARIABLE_DISTANCE = 7,   ///< a distance in metres, shown as a length is
    VARIABLE_ELEVATION = 8,  ///< a height in metres
    VARIABLE_STATION = 9,    ///< a chainage in metres, shown in the station format
    VARIABLE_OFFSET = 10,    ///< a distance from an alignment in metres: below 0 to its left, otherwise to its right
    VARIABLE_AREA = 11,      ///< an area in square metres
    VARIABLE_NAME = 16,      ///< the name of something, shown as a text is
    VARIABLE_NUMBER = 17,    ///< the number of a point: a text or a `UPointNumber`, as it may have letters
    VARIABLE_VANGLE = 18,    ///< an angle in radians that is shown as those of `VARIABLE_ANGLE` are
    VARIABLE_BOOLEAN = 19,   ///< true or false, shown as Y or N
    VARIABLE_FLAG = 20,      ///< true or false, shown as * or a blank
    VARIABLE_PLAIN = 21,     ///< a number that is also shown when it is 0 or not finite, whatever the settings
    VARIABLE_THICKNESS = 22  ///< a whole number of hundredths; one with bit 15 set shows "ByLayer"
};
