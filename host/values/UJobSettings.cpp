#include "UJobSettings.h"

#include "FixedNotation.h"
#include "MemoryLasts.h"
#include "UnitFactors.h"
#include "VariableType.h"

#include <algorithm>
#include <cmath>

using kareport::FixedNotation;
using kareport::LengthForm;
using kareport::StationForm;
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
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
    case VARIABLE_STATION:
    case VARIABLE_OFFSET: return value / kareport::metresIn(lengthUnit);
    case VARIABLE_AREA: return value / kareport::squareMetresIn(areaUnit);
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE: return value * kareport::perRadian(angleUnit);
    default: return value;
    }
}

void UJobSettings::appendUnit(TextBuffer &out) const
{
    out.append(u' ');
    out.append(kareport::symbolOf(lengthUnit));
}

void UJobSettings::appendUnitLength(TextBuffer &out, double value, const LengthForm &form) const
{
    if (form.fromInternal) {
        value /= kareport::metresIn(lengthUnit);
    }
    if (!std::isfinite(value)) {
        return;
    }
    const FixedNotation fixed(value, form.decimals == -1 ? lengthDecimals : form.decimals);
    if (form.blankZero && fixed.isZero()) {
        out.appendFill(static_cast<std::size_t>(std::max(form.width, 0)), u' ');
        return;
    }
    const bool negative = value < 0 && !fixed.isZero();
    std::size_t length = fixed.digits().size() + (negative ? 1U : 0U);
    if (form.withUnit) {
        length += 1 + static_cast<std::size_t>(kareport::symbolOf(lengthUnit).size());
    }
    if (form.width > 0 && static_cast<std::size_t>(form.width) > length) {
        out.appendFill(static_cast<std::size_t>(form.width) - length, u' ');
    }
    if (negative) {
        out.append(u'-');
    }
    out.appendAscii(fixed.digits());
    if (form.withUnit) {
        appendUnit(out);
    }
}

QString UJobSettings::UnitLengthToString(double value, bool fromInternal, bool withUnit, int decimals, int width,
                                         bool blankZero) const
{
    return kareport::whileMemoryLasts(QString(), [&] {
        TextBuffer out;
        appendUnitLength(out, value, {fromInternal, withUnit, decimals, width, blankZero});
        return out.view().toString();
    });
}

void UJobSettings::appendStation(TextBuffer &out, double value, const StationForm &form) const
{
    if (form.fromInternal) {
        value /= kareport::metresIn(lengthUnit);
    }
    if (!std::isfinite(value)) {
        return;
    }
    const FixedNotation fixed(value, form.decimals == -1 ? stationDecimals : form.decimals);
    const std::size_t start = out.size();
    if (!(form.blankZero && fixed.isZero())) {
        if (form.showSign && value < 0 && !fixed.isZero()) {
            out.append(u'-');
        }
        std::string_view digits = fixed.digits();
        if (form.trimZeros && digits.find('.') != std::string_view::npos) {
            digits = digits.substr(0, digits.find_last_not_of('0') + 1);
            if (digits.back() == '.') {
                digits.remove_suffix(1);
            }
        }
        if (form.plain || stationFormat == StationFormat::Plain) {
            out.appendAscii(digits);
        } else {
            appendWithPlus(out, digits, stationFormat == StationFormat::HundredsPlus ? 2 : 3);
        }
        if (form.withUnit) {
            appendUnit(out);
        }
    }
    if (form.width > 0) {
        out.pad(start, form.alignRight ? form.width : -form.width);
    }
}

QString UJobSettings::StationToString(double value, bool fromInternal, bool withUnit, bool plain, int decimals,
                                      int width, bool /*withZone*/, bool /*withEquation*/, bool blankZero,
                                      bool alignRight, bool trimZeros, bool showSign) const
{
    return kareport::whileMemoryLasts(QString(), [&] {
        TextBuffer out;
        appendStation(out, value,
                      {fromInternal, withUnit, plain, decimals, width, blankZero, alignRight, trimZeros, showSign});
        return out.view().toString();
    });
}
