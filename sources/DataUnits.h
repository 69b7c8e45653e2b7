#pragma once

#include "UnitFactors.h"

#include <QString>

namespace kareport
{

/// The units that the numbers of a data set are in.
struct DataUnits
{
    LengthUnit length = LengthUnit::Metre;
    AreaUnit area = AreaUnit::SquareMetre;
    AngleUnit angle = AngleUnit::Degree;
    bool sexagesimal = false; ///< angles are texts in degrees, minutes and seconds
    // Whether the job says them.
    bool isLengthSaid = false;
    bool isAreaSaid = false;
    bool isAngleSaid = false;

    /// What a number of a value type is multiplied by to become internal (metre, square metre, radian).
    double factorOf(int type) const;
    /// The key of the unit that numbers of a value type are in where the job does not say it; empty for a type without a unit, and
    /// for a unit that was said.
    QString assumedKey(int type) const;
};

} // namespace kareport
