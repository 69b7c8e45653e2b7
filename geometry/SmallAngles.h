#pragma once

#include <cmath>

namespace kareport
{

// Differences that lose their digits near 0 when they are computed as written.

/// sin x / x
inline double sineRatio(double x)
{
    return std::fabs(x) < 1e-4 ? 1 - x * x / 6 : std::sin(x) / x;
}

/// 1 - cos x
inline double oneMinusCosine(double x)
{
    const double sine = std::sin(x / 2);
    return 2 * sine * sine;
}

/// x - sin x
inline double withoutSine(double x)
{
    if (std::fabs(x) > 1) {
        return x - std::sin(x);
    }
    double term = x * x * x / 6;
    double sum = term;
    for (int i = 4; i < 22; i += 2) {
        term *= -x * x / (i * (i + 1));
        sum += term;
    }
    return sum;
}

/// x² / 2 - (1 - cos x)
inline double squareWithoutCosine(double x)
{
    if (std::fabs(x) > 1) {
        return x * x / 2 - oneMinusCosine(x);
    }
    double term = x * x * x * x / 24;
    double sum = term;
    for (int i = 5; i < 23; i += 2) {
        term *= -x * x / (i * (i + 1));
        sum += term;
    }
    return sum;
}

} // namespace kareport
