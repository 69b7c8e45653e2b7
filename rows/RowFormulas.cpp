#include "RowFormulas.h"

#include "DecimalSum.h"
#include "EntryOrder.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <numbers>
#include <numeric>
#include <optional>

namespace kareport
{

namespace
{

using Operands = std::vector<RowFormula::Operand>;

/// The exact product of two decimal numbers, rounded to the nearest double.
double product(const CellDecimal &left, const CellDecimal &right)
{
    constexpr double mostQuick = 9e18;
    const int exponent = left.exponent + right.exponent;
    if (std::fabs(static_cast<double>(left.digits) * static_cast<double>(right.digits)) < mostQuick) {
        return CellDecimal{left.digits * right.digits, exponent}.toDouble();
    }
    Natural digits(static_cast<quint64>(std::llabs(left.digits)));
    digits.multiply(Natural(static_cast<quint64>(std::llabs(right.digits))));
    if (exponent > 0) {
        digits.multiplyByPowerOfTen(exponent);
    }
    return ExactDecimal((left.digits < 0) != (right.digits < 0), std::move(digits), std::max(-exponent, 0)).toDouble();
}

/// The numbers of a row; nothing where one is missing.
std::optional<std::vector<double>> numbersOf(const Operands &operands, const UDataObject &object)
{
    std::vector<double> numbers;
    numbers.reserve(operands.size());
    for (const RowFormula::Operand &operand : operands) {
        const auto number = numberOf(object.Find(operand.id));
        if (!number) {
            return std::nullopt;
        }
        numbers.push_back(*number);
    }
    return numbers;
}

bool areFinite(const std::vector<double> &numbers)
{
    return std::all_of(numbers.begin(), numbers.end(), [](double number) { return std::isfinite(number); });
}

/// The sum of the numbers, as they are counted.
double sumOf(Operands &operands, const std::vector<double> &numbers)
{
    DecimalSum sum;
    for (std::size_t i = 0; i < numbers.size(); ++i) {
        sum.add(operands[i].reader.read(numbers[i]));
    }
    return sum.toDouble();
}

/// How far the second point is from the first one in each direction, as it is counted.
std::vector<double> stepsOf(Operands &operands, const std::vector<double> &numbers)
{
    std::vector<double> steps;
    const std::size_t half = numbers.size() / 2;
    steps.reserve(half);
    for (std::size_t i = 0; i < half; ++i) {
        steps.push_back(countedDifference(operands[i].reader, numbers[half + i], numbers[i]));
    }
    return steps;
}

double lengthOf(const std::vector<double> &steps)
{
    return steps.size() == 2 ? std::hypot(steps[0], steps[1]) : std::hypot(steps[0], steps[1], steps[2]);
}

/// Clockwise from north, from 0 to below a whole circle. @param steps  northwards and eastwards
double bearing(const std::vector<double> &steps)
{
    const double angle = std::atan2(steps[1], steps[0]);
    return angle < 0 ? angle + 2 * std::numbers::pi : angle;
}

} // namespace

void storeNumber(UDataObject &object, quint32 id, double number, bool isWhole)
{
    if (!isWhole) {
        object.Refill<double>(id) = number;
        return;
    }
    if (number != std::floor(number) || number < std::numeric_limits<qint32>::min() ||
        number > std::numeric_limits<qint32>::max())
    {
        object.Remove(id);
        return;
    }
    object.Refill<qint32>(id) = static_cast<qint32>(number);
}

void RowFormula::setValue(UDataObject &object)
{
    const auto numbers = numbersOf(operands, object);
    if (!numbers) {
        object.Remove(target);
        return;
    }
    const bool isExact = areFinite(*numbers);
    double value = 0;
    switch (kind) {
    case Kind::Sum:
        value = isExact ? result.internal(sumOf(operands, *numbers))
                        : std::accumulate(numbers->begin(), numbers->end(), 0.0);
        break;
    case Kind::Difference:
        value = result.internal(countedDifference(operands[0].reader, (*numbers)[0], (*numbers)[1], turn));
        break;
    case Kind::Product:
        value = isExact ? product(operands[0].reader.read((*numbers)[0]), operands[1].reader.read((*numbers)[1])) /
                              productPerUnit * productFactor
                        : (*numbers)[0] * (*numbers)[1];
        break;
    case Kind::Distance: value = result.internal(lengthOf(stepsOf(operands, *numbers))); break;
    case Kind::Bearing: value = bearing(stepsOf(operands, *numbers)); break;
    }
    storeNumber(object, target, direction ? wrapped(value, *direction) : value, isWhole);
}

} // namespace kareport
