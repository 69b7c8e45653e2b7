#pragma once

#include <cmath>

/// Whether a value counts as zero: |value| below 1e-9, in whatever unit it is.
inline bool Is_Zero(double value)
{
    return std::fabs(value) < 1e-9;
}
