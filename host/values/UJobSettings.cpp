#include "UJobSettings.h"

#include "FixedNotation.h"

#include <algorithm>
#include <cmath>

using kareport::FixedNotation;
using kareport::TextBuffer;

namespace
{

/// Writes digits with a plus before the last `grouped` of those before the point.
void appendWithPlus(TextBuffer &out, std::string_view digits, std::size_t grouped)
{
    const std::size_t whole = std::min(digits.find('.'), digits.size());
    if (whole > grouped) {
        out.appendAscii(digits.substr(0, whole - grouped));
        out.append(u'+');
        out.appendAscii(digits.substr(whole - grouped));
        return;
    }
    out.appendAscii("0+");
    out.appendFill(grouped - whole, u'0');
    out.appendAscii(digits);
}

} // namespace

double UJobSettings::ConvertToDisplay(double value, int unitKind, int /*reserved*/) const
{
    switch (unitKind) {
    case 5:
    case 6:
    case 7:
    case 8:
    case 9:
    case 10: return value / kareport::metresIn(lengthUnit);
    case 11: return value / kareport::squareMetresIn(areaUnit);
    case 3:
    case 18: return value * kareport::perRadian(angleUnit);
    default: return value;
    }
}

void UJobSettings::appendUnit(TextBuffer &out) const
{
    out.append(u' ');
    out.append(kareport::symbolOf(lengthUnit));
}

void UJobSettings::appendUnitLength(TextBuffer &out, double value, bool fromInternal, bool withUnit, int decimals,
                                    int width, bool blankZero) const
{
    if (fromInternal) {
        value /= kareport::metresIn(lengthUnit);
    }
    if (!std::isfinite(value)) {
        return;
    }
    const FixedNotation fixed(value, decimals == -1 ? lengthDecimals : decimals);
    if (blankZero && fixed.isZero()) {
        out.appendFill(static_cast<std::size_t>(std::max(width, 0)), u' ');
        return;
    }
    const bool negative = value < 0 && !fixed.isZero();
    std::size_t length = fixed.digits().size() + (negative ? 1U : 0U);
    if (withUnit) {
        length += 1 + static_cast<std::size_t>(kareport::symbolOf(lengthUnit).size());
    }
    if (width > 0 && static_cast<std::size_t>(width) > length) {
        out.appendFill(static_cast<std::size_t>(width) - length, u' ');
    }
    if (negative) {
        out.append(u'-');
    }
    out.appendAscii(fixed.digits());
    if (withUnit) {
        appendUnit(out);
    }
}

QString UJobSettings::UnitLengthToString(double value, bool fromInternal, bool withUnit, int decimals, int width,
                                         bool blankZero) const
{
    TextBuffer out;
    appendUnitLength(out, value, fromInternal, withUnit, decimals, width, blankZero);
    return out.view().toString();
}

void UJobSettings::appendStation(TextBuffer &out, double value, bool fromInternal, bool withUnit, bool plain,
                                 int decimals, int width, bool /*withZone*/, bool /*withEquation*/, bool blankZero,
                                 bool alignRight, bool trimZeros, bool showSign) const
{
    if (fromInternal) {
        value /= kareport::metresIn(lengthUnit);
    }
    if (!std::isfinite(value)) {
        return;
    }
    const FixedNotation fixed(value, decimals == -1 ? stationDecimals : decimals);
    const std::size_t start = out.size();
    if (!(blankZero && fixed.isZero())) {
        if (showSign && value < 0 && !fixed.isZero()) {
            out.append(u'-');
        }
        std::string_view digits = fixed.digits();
        if (trimZeros && digits.find('.') != std::string_view::npos) {
            digits = digits.substr(0, digits.find_last_not_of('0') + 1);
            if (digits.back() == '.') {
                digits.remove_suffix(1);
            }
        }
        if (plain || stationFormat == StationFormat::Plain) {
            out.appendAscii(digits);
        } else {
            appendWithPlus(out, digits, stationFormat == StationFormat::HundredsPlus ? 2 : 3);
        }
        if (withUnit) {
            appendUnit(out);
        }
    }
    if (width > 0) {
        out.pad(start, alignRight ? width : -width);
    }
}

QString UJobSettings::StationToString(double value, bool fromInternal, bool withUnit, bool plain, int decimals,
                                      int width, bool withZone, bool withEquation, bool blankZero, bool alignRight,
                                      bool trimZeros, bool showSign) const
{
    TextBuffer out;
    appendStation(out, value, fromInternal, withUnit, plain, decimals, width, withZone, withEquation, blankZero,
                  alignRight, trimZeros, showSign);
    return out.view().toString();
}
