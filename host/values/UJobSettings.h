#pragma once

#include "KaReportExport.h"
#include "TextBuffer.h"
#include "UnitFactors.h"

#include <QString>

#include <array>

/// The user's units and display formats. A value class: a report keeps its own copy.
///
/// The functions whose names begin with `append` write behind what a buffer holds, without an allocation; those that
/// return a text are the same with a buffer of their own.
class KAREPORT_EXPORT UJobSettings
{
public:
    enum class StationFormat
    {
        Plain,        ///< 12345.678
        HundredsPlus, ///< 123+45.678
        ThousandsPlus ///< 12+345.678
    };

    kareport::LengthUnit lengthUnit = kareport::LengthUnit::Metre;
    kareport::AreaUnit areaUnit = kareport::AreaUnit::SquareMetre;
    kareport::AngleUnit angleUnit = kareport::AngleUnit::Degree;
    int lengthDecimals = 3;  ///< of lengths, 0 to 15
    int stationDecimals = 3; ///< of stations, 0 to 15
    int numberDecimals = 3;  ///< of plain numbers and areas, 0 to 15
    StationFormat stationFormat = StationFormat::ThousandsPlus;
    qint16 northEastOrder = 1; ///< 1 northing before easting, 0 easting before northing

    // The five values that a `UFormatBearing` is made of; their codes are given there.
    unsigned bearingUnit = 0;
    qint16 bearingStyle = 1;
    qint32 bearingDecimals = 0;
    qint16 bearingPadding = 1;
    unsigned bearingReference = 0;

    /// Degree, minute and second mark, Latin-1; the character 0 shows no mark.
    std::array<char, 3> angleMarks = {'\xB0', '\'', '"'};

    /// Turns a value from its internal unit (metre, square metre, radian) into the unit it is shown in.
    /// @param unitKind  the value type code: 5 to 10 a length, 11 an area, 3 and 18 an angle; any other is returned as it is
    /// @param reserved  0
    double ConvertToDisplay(double value, int unitKind, int reserved) const;

    /// A length in fixed notation, never with a minus sign before zeros only; "" when it is not finite.
    /// @param fromInternal  the value is in metres and is converted first; otherwise it is in the shown unit already
    /// @param withUnit      a blank and the unit's symbol follow
    /// @param decimals      -1 takes `lengthDecimals`
    /// @param width         blanks are put before a shorter text; -1 for none
    /// @param blankZero     a text whose digits are all 0 becomes ""
    QString UnitLengthToString(double value, bool fromInternal, bool withUnit, int decimals, int width,
                               bool blankZero) const;
    void appendUnitLength(kareport::TextBuffer &out, double value, bool fromInternal, bool withUnit, int decimals,
                          int width, bool blankZero) const;

    /// A station (chainage), such as 12+345.678; "" when it is not finite.
    /// @param fromInternal  the value is in metres and is converted first
    /// @param withUnit      a blank and the unit's symbol follow
    /// @param plain         without the plus, whatever the station format
    /// @param decimals      -1 takes `stationDecimals`
    /// @param width         the text is filled with blanks to this width
    /// @param withZone, withEquation  add nothing: the job has no zones and no station equations
    /// @param blankZero     a text without a digit other than 0 becomes ""
    /// @param alignRight    blanks go before the text, otherwise behind it
    /// @param trimZeros     trailing zeros of the fraction go, and the point with the last of them
    /// @param showSign      a value below zero gets "-" in front, unless only zeros are shown
    QString StationToString(double value, bool fromInternal, bool withUnit, bool plain, int decimals, int width,
                            bool withZone, bool withEquation, bool blankZero, bool alignRight, bool trimZeros,
                            bool showSign) const;
    void appendStation(kareport::TextBuffer &out, double value, bool fromInternal, bool withUnit, bool plain,
                       int decimals, int width, bool withZone, bool withEquation, bool blankZero, bool alignRight,
                       bool trimZeros, bool showSign) const;

private:
    void appendUnit(kareport::TextBuffer &out) const;
};
