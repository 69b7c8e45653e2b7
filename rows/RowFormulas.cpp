#include "RowFormulas.h"

#include "DecimalSum.h"
#include "EntryOrder.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <numbers>
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

/// The sum of the numbers in the data's unit, of which those after the first are subtracted where the sign is -1.
double sumOf(Operands &operands, const std::vector<double> &numbers, int sign)
{
    DecimalSum sum;
    for (std::size_t i = 0; i < numbers.size(); ++i) {
        CellDecimal number = operands[i].reader.read(numbers[i]);
        number.digits = i > 0 ? number.digits * sign : number.digits;
        sum.add(number);
    }
    return sum.toDouble();
}

double plainSum(const std::vector<double> &numbers, int sign)
{
    double sum = numbers.front();
    for (std::size_t i = 1; i < numbers.size(); ++i) {
        sum += sign * numbers[i];
    }
    return sum;
}

double distance(const std::vector<double> &numbers)
{
    const std::size_t half = numbers.size() / 2;
    return half == 2 ? std::hypot(numbers[2] - numbers[0], numbers[3] - numbers[1])
                     : std::hypot(numbers[3] - numbers[0], numbers[4] - numbers[1], numbers[5] - numbers[2]);
}

/// Clockwise from north, from 0 to below a whole circle.
double bearing(const std::vector<double> &numbers)
{
    const double angle = std::atan2(numbers[3] - numbers[1], numbers[2] - numbers[0]);
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
    const int sign = kind == Kind::Difference ? -1 : 1;
    double value = 0;
    switch (kind) {
    case Kind::Sum:
    case Kind::Difference:
        value = isExact ? sumOf(operands, *numbers, sign) * result.factor() : plainSum(*numbers, sign);
        break;
    case Kind::Product:
        value = isExact ? product(operands[0].reader.read((*numbers)[0]), operands[1].reader.read((*numbers)[1])) *
                              productFactor
                        : (*numbers)[0] * (*numbers)[1];
        break;
    case Kind::Distance: value = distance(*numbers); break;
    case Kind::Bearing: value = bearing(*numbers); break;
    }
    storeNumber(object, target, value, isWhole);
}

} // namespace kareport
