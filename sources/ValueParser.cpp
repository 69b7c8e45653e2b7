#include "ValueParser.h"

#include "Notation.h"
#include "NumberText.h"
#include "VariableType.h"
#include "Xlate.h"

#include <QLocale>

#include <algorithm>
#include <cmath>
#include <limits>
#include <numbers>
#include <string>

namespace kareport
{

namespace
{

double quarterOf(AngleUnit unit)
{
    return unit == AngleUnit::Degree ? 90 : unit == AngleUnit::Gon ? 100 : std::numbers::pi / 2;
}

/// A thickness as a number in hundredths. What a layer gives is the first of the numbers that are shown so.
bool parseThickness(std::string_view text, double &number)
{
    if (equalsIgnoringCase(trimmedBlanks(text), "bylayer")) {
        number = -1;
        return true;
    }
    return parseNumber(text, number);
}

/// A number as a text: whole numbers without an exponent, others with the fewest digits that say them.
QString textOf(double number)
{
    constexpr double exactlyWhole = 9007199254740992.0; // 2^53
    if (number == std::floor(number) && std::fabs(number) <= exactlyWhole) {
        return QString::number(static_cast<qint64>(number));
    }
    return QString::number(number, 'g', QLocale::FloatingPointShortest);
}

void assignUtf8(QString &target, std::string_view text)
{
    const bool ascii =
        std::all_of(text.begin(), text.end(), [](char character) { return static_cast<signed char>(character) >= 0; });
    if (!ascii) {
        target = QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
        return;
    }
    // The text's memory is kept from row to row.
    target.resize(static_cast<qsizetype>(text.size()));
    std::transform(text.begin(), text.end(), target.data(), [](char character) { return QLatin1Char(character); });
}

} // namespace

ValueParser::ValueParser(int type, unsigned id, const DataUnits &units)
    : form_(Form::Number), type_(type), id_(id), factor_(units.factorOf(type)), quarter_(quarterOf(units.angle))
{
    switch (type) {
    case VARIABLE_INTEGER: form_ = Form::Whole; break;
    case VARIABLE_TEXT:
    case VARIABLE_NAME: form_ = Form::Text; break;
    case VARIABLE_NUMBER: form_ = Form::PointNumber; break;
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: form_ = Form::Boolean; break;
    case VARIABLE_STATION: form_ = Form::Station; break;
    case VARIABLE_OFFSET: form_ = Form::Offset; break;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE: form_ = units.sexagesimal ? Form::SexagesimalAngle : Form::Angle; break;
    case VARIABLE_BEARING: form_ = units.sexagesimal ? Form::SexagesimalBearing : Form::Bearing; break;
    case VARIABLE_THICKNESS: form_ = Form::Thickness; break;
    default: break;
    }
}

void ValueParser::setNumberStyle(const NumberStyle &style)
{
    style_ = style;
    if (isAngle()) {
        // The marks of minutes may be those of thousands.
        style_.thousands.clear();
    }
    isPlain_ = style_.isPlain() || form_ == Form::Text || form_ == Form::PointNumber || form_ == Form::Boolean;
}

/// Whether a text holds blanks alone where a text is not what is wanted.
bool ValueParser::isBlankNumber(std::string_view text) const
{
    return form_ != Form::Text && form_ != Form::PointNumber && trimmedBlanks(text).empty();
}

bool ValueParser::storeValue(std::string_view text, UDictionary &object) const
{
    if (isPlain_) {
        return storePlain(text, object);
    }
    std::string plain;
    return toPlainNumbers(trimmedBlanks(text), style_, plain) && storePlain(plain, object);
}

/// Stores the value of a text whose numbers have a decimal point and no thousands.
bool ValueParser::storePlain(std::string_view text, UDictionary &object) const
{
    double number = 0;
    bool fits = false;
    switch (form_) {
    case Form::Whole: {
        qint32 whole = 0;
        fits = parseWhole(text, whole);
        object.Refill<qint32>(id_) = whole;
        return fits;
    }
    case Form::Text: assignUtf8(object.Refill<QString>(id_), text); return true;
    case Form::PointNumber: assignUtf8(object.Refill<UPointNumber>(id_).text(), text); return true;
    case Form::Boolean: {
        bool value = false;
        fits = parseBoolean(text, value);
        object.Refill<bool>(id_) = value;
        return fits;
    }
    case Form::Number: fits = parseNumber(text, number); break;
    case Form::Station: fits = parseStation(text, number); break;
    case Form::Offset: fits = parseOffset(text, number); break;
    case Form::Thickness: fits = parseThickness(text, number); break;
    default: return storeAngle(text, object);
    }
    object.Refill<double>(id_) = number * factor_;
    return fits;
}

bool ValueParser::storeAngle(std::string_view text, UDictionary &object) const
{
    double number = 0;
    const bool sexagesimal = form_ == Form::SexagesimalAngle || form_ == Form::SexagesimalBearing;
    if (sexagesimal ? parseSexagesimal(text, number) : parseNumber(text, number)) {
        object.Refill<double>(id_) = number * factor_;
        return true;
    }
    const bool isBearing = form_ == Form::Bearing || form_ == Form::SexagesimalBearing;
    const auto angle = isBearing ? parseBearing(text, quarter_) : parseMarkedAngle(text);
    if (!angle) {
        return false;
    }
    double factor = factor_;
    if (angle->unit != NotedAngle::Unit::Data) {
        factor = std::numbers::pi / (angle->unit == NotedAngle::Unit::Degree ? 180 : 200);
    }
    object.Refill<double>(id_) = angle->value * factor;
    return true;
}

bool ValueParser::storeNumber(double number, UDictionary &object) const
{
    switch (form_) {
    case Form::Whole: {
        const bool fits = number == std::floor(number) && number >= std::numeric_limits<qint32>::min() &&
                          number <= std::numeric_limits<qint32>::max();
        object.Refill<qint32>(id_) = fits ? static_cast<qint32>(number) : 0;
        return fits;
    }
    case Form::Text: object.Refill<QString>(id_) = textOf(number); return true;
    case Form::PointNumber: object.Refill<UPointNumber>(id_).text() = textOf(number); return true;
    case Form::Boolean: object.Refill<bool>(id_) = number != 0; return number == 0 || number == 1;
    default: object.Refill<double>(id_) = number * factor_; return true;
    }
}

bool ValueParser::storeInteger(qint64 number, UDictionary &object) const
{
    return storeDigits(number, object);
}

bool ValueParser::storeInteger(quint64 number, UDictionary &object) const
{
    return storeDigits(number, object);
}

template <typename Integer>
bool ValueParser::storeDigits(Integer number, UDictionary &object) const
{
    switch (form_) {
    case Form::Text: object.Refill<QString>(id_) = QString::number(number); return true;
    case Form::PointNumber: object.Refill<UPointNumber>(id_).text() = QString::number(number); return true;
    default: return storeNumber(static_cast<double>(number), object);
    }
}

bool ValueParser::storeBoolean(bool value, UDictionary &object) const
{
    object.Refill<bool>(id_) = value;
    return form_ == Form::Boolean;
}

QString ValueParser::expected() const
{
    switch (form_) {
    case Form::Whole: return Xlate("a whole number");
    case Form::Text:
    case Form::PointNumber: return Xlate("a text");
    case Form::Boolean: return Xlate("yes or no");
    case Form::Station: return Xlate("a station such as 12+345.678");
    case Form::Offset: return Xlate("a number, or an offset such as 12.5R");
    case Form::Thickness: return Xlate("a number, or ByLayer");
    case Form::Angle: return Xlate("a number, or an angle such as 45°30'15\"");
    case Form::Bearing: return Xlate("a number, or a bearing such as N45-30-15E");
    case Form::SexagesimalAngle: return Xlate("an angle such as 45-30-15");
    case Form::SexagesimalBearing: return Xlate("a bearing such as 45-30-15 or N45-30-15E");
    case Form::Number: break;
    }
    return Xlate("a number");
}

} // namespace kareport
