#include "Differences.h"

#include "DecimalSum.h"

#include <cmath>

namespace kareport
{

namespace
{

CellDecimal negated(CellDecimal number)
{
    number.digits = -number.digits;
    return number;
}

} // namespace

double countedDifference(CellReader &reader, double left, double right, const std::optional<Turn> &turn)
{
    if (!std::isfinite(left) || !std::isfinite(right)) {
        return left - right;
    }
    if (turn && turn->counted.digits == 0) {
        return std::remainder(left - right, turn->internal) / reader.internal(1);
    }
    DecimalSum sum;
    sum.add(reader.read(left));
    sum.add(negated(reader.read(right)));
    if (!turn) {
        return sum.toDouble();
    }
    constexpr double mostTurns = 1e6;
    const double whole = turn->counted.toDouble();
    const double turns = std::round(sum.toDouble() / whole);
    if (!(std::fabs(turns) <= mostTurns)) {
        return std::remainder(sum.toDouble(), whole);
    }
    if (std::fabs(sum.toDouble()) > whole / 2) {
        sum.add(CellDecimal{-turn->counted.digits * static_cast<qint64>(turns), turn->counted.exponent});
    }
    return sum.toDouble();
}

double wrapped(double internal, const Turn &turn)
{
    if (!std::isfinite(internal)) {
        return internal;
    }
    const double rest = std::fmod(internal, turn.internal);
    const double positive = rest < 0 ? rest + turn.internal : rest;
    return positive < turn.internal ? positive : 0;
}

} // namespace kareport
