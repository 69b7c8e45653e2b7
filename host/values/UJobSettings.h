#pragma once

#include "KaReportExport.h"
#include "TextBuffer.h"
#include "Units.h"

#include <QString>

#include <array>

namespace kareport
{

/// How a length becomes a text.
struct LengthForm
{
    /// The value is in metres and is converted first; otherwise it is in the shown unit already.
    bool fromInternal = false;
    bool withUnit = false;  ///< a blank and the unit's symbol follow
    int decimals = -1;      ///< -1 takes `UJobSettings::lengthDecimals`
    int width = -1;         ///< blanks are put before a shorter text; -1 for none
    bool blankZero = false; ///< a text whose digits are all 0 becomes ""
};

/// How a station becomes a text.
struct StationForm
{
    bool fromInternal = false; ///< the value is in metres and is converted first
    bool withUnit = false;     ///< a blank and the unit's symbol follow
    bool plain = false;        ///< without the plus, whatever the station format
    int decimals = -1;         ///< -1 takes `UJobSettings::stationDecimals`
    int width = -1;            ///< the text is filled with blanks to this width
    bool blankZero = false;    ///< a text without a digit other than 0 becomes ""
    bool alignRight = false;   ///< blanks are put before the text, otherwise after it
    bool trimZeros = false;    ///< trailing zeros of the fraction are dropped, and the point with the last of them
    bool showSign = false;     ///< a value below zero gets "-" in front, unless only zeros are shown
};

} // namespace kareport

/// The user's units and display formats. A value class: a report keeps its own copy.
///
/// The functions whose names begin with `append` write after what a buffer holds, without an allocation, and throw
/// std::bad_alloc where it cannot grow; those that return a text are the same, and return "" without memory.
class KAREPORT_EXPORT UJobSettings
{
public:
    /// Where a station has its plus sign.
    enum class StationFormat
    {
        Plain,        ///< 12345.678
        HundredsPlus, ///< 123+45.678
        ThousandsPlus ///< 12+345.678
    };

    kareport::LengthUnit lengthUnit = kareport::LengthUnit::Metre; ///< that lengths are shown in
    kareport::AreaUnit areaUnit = kareport::AreaUnit::SquareMetre; ///< that areas are shown in
    kareport::AngleUnit angleUnit = kareport::AngleUnit::Degree;   ///< that angles are shown in, but not bearings
    int lengthDecimals = 3;                                        ///< of lengths, 0 to 15
    int stationDecimals = 3;                                       ///< of stations, 0 to 15
    int numberDecimals = 3;                                        ///< of plain numbers and areas, 0 to 15
    StationFormat stationFormat = StationFormat::ThousandsPlus;    ///< where stations have their plus sign
    qint16 northEastOrder = 1; ///< 1 northing before easting, 0 easting before northing

    // The five values that a `UFormatBearing` is made of; their codes are given there.
    unsigned bearingUnit = 0;      ///< degrees, minutes and seconds; decimal degrees; or gon
    qint16 bearingStyle = 1;       ///< whole circle or quadrant
    qint32 bearingDecimals = 0;    ///< of the smallest unit shown
    qint16 bearingPadding = 1;     ///< whether whole degrees or gon are padded with zeros
    unsigned bearingReference = 0; ///< counted from north or from south

    /// Degree, minute and second mark, Latin-1; the character 0 shows no mark.
    std::array<char, 3> angleMarks = {'\xB0', '\'', '"'};

    /// Converts a value from its internal unit (metre, square metre, radian) to the unit it is shown in.
    /// @param unitKind  the value type code (`VARIABLE_TYPE`): a length, an area or an angle is converted, any other value
    ///                  is returned as it is
    /// @param reserved  0
    double ConvertToDisplay(double value, int unitKind, int reserved) const;

    /// A length in fixed notation, never with a minus sign before zeros only; "" when it is not finite. The arguments are
    /// those of `kareport::LengthForm`.
    QString UnitLengthToString(double value, bool fromInternal, bool withUnit, int decimals, int width,
                               bool blankZero) const;
    /// Appends the same text to a buffer. @throws std::bad_alloc when the buffer cannot grow
    void appendUnitLength(kareport::TextBuffer &out, double value, const kareport::LengthForm &form) const;

    /// A station (chainage), such as 12+345.678; "" when it is not finite. The arguments are those of
    /// `kareport::StationForm`.
    /// @param withZone, withEquation  add nothing: the job has no zones and no station equations
    QString StationToString(double value, bool fromInternal, bool withUnit, bool plain, int decimals, int width,
                            bool withZone, bool withEquation, bool blankZero, bool alignRight, bool trimZeros,
                            bool showSign) const;
    /// Appends the same text to a buffer. @throws std::bad_alloc when the buffer cannot grow
    void appendStation(kareport::TextBuffer &out, double value, const kareport::StationForm &form) const;

private:
    void appendUnit(kareport::TextBuffer &out) const;
};
