#pragma once

#include "UnitFactors.h"

#include <QStringView>

namespace kareport
{

/// The units that the numbers of a data set are in.
struct DataUnits
{
    LengthUnit length = LengthUnit::Metre;
    AreaUnit area = AreaUnit::SquareMetre;
    AngleUnit angle = AngleUnit::Degree;
    bool sexagesimal = false; ///< angles are texts in degrees, minutes and seconds

    /// What a number of a value type is multiplied by to become internal (metre, square metre, radian).
    double factorOf(int type) const;
};

} // namespace kareport
