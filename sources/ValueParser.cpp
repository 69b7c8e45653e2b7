#include "ValueParser.h"

#include "VariableType.h"
#include "Xlate.h"

#include <QLocale>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <string>

namespace kareport
{

namespace
{

bool isBlank(char character)
{
    return character == ' ' || character == '\t';
}

std::string_view trimmed(std::string_view text)
{
    while (!text.empty() && isBlank(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isBlank(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

bool isDigit(char character)
{
    return character >= '0' && character <= '9';
}

/// A number too small for a double is 0; one too large is no number.
bool parseOutOfRange(std::string_view text, double &number)
{
    long double wide = 0;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), wide);
    number = static_cast<double>(wide);
    return result.ec == std::errc() && std::isfinite(number);
}

bool parseWhole(std::string_view text, qint32 &number)
{
    text = trimmed(text);
    if (text.size() > 1 && text.front() == '+' && isDigit(text[1])) {
        text.remove_prefix(1);
    }
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    return result.ec == std::errc() && result.ptr == text.data() + text.size();
}

bool equalsIgnoringCase(std::string_view text, std::string_view lower)
{
    return std::equal(text.begin(), text.end(), lower.begin(), lower.end(), [](char left, char right) {
        return (left >= 'A' && left <= 'Z' ? static_cast<char>(left + ('a' - 'A')) : left) == right;
    });
}

bool parseBoolean(std::string_view text, bool &value)
{
    text = trimmed(text);
    for (const auto *yes : {"true", "yes", "y", "t", "1", "*"}) {
        if (equalsIgnoringCase(text, yes)) {
            value = true;
            return true;
        }
    }
    for (const auto *no : {"false", "no", "n", "f", "0"}) {
        if (equalsIgnoringCase(text, no)) {
            value = false;
            return true;
        }
    }
    return false;
}

/// The plus of a station such as 12+345.678 goes; one in front is a sign.
bool parseStation(std::string_view text, double &number)
{
    text = trimmed(text);
    const std::size_t plus = text.find('+', 1);
    const std::size_t sign = !text.empty() && (text[0] == '-' || text[0] == '+') ? 1 : 0;
    const bool grouped = plus != std::string_view::npos && plus > sign && plus + 1 < text.size() &&
                         std::all_of(text.begin() + static_cast<std::ptrdiff_t>(sign),
                                     text.begin() + static_cast<std::ptrdiff_t>(plus), isDigit) &&
                         isDigit(text[plus + 1]) && text.find_first_of("eE") == std::string_view::npos;
    if (!grouped) {
        return parseNumber(text, number);
    }
    std::string joined(text.substr(0, plus));
    joined += text.substr(plus + 1);
    return parseNumber(joined, number);
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

bool parseNumber(std::string_view text, double &number)
{
    text = trimmed(text);
    if (text.size() > 1 && text.front() == '+' && text[1] != '-' && text[1] != '+') {
        text.remove_prefix(1);
    }
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    if (result.ptr != text.data() + text.size() || text.empty() || text.back() == ')') {
        return false;
    }
    return result.ec == std::errc() || (result.ec == std::errc::result_out_of_range && parseOutOfRange(text, number));
}

bool parseSexagesimal(std::string_view text, double &degrees)
{
    text = trimmed(text);
    const bool negative = !text.empty() && text.front() == '-';
    if (!text.empty() && (negative || text.front() == '+')) {
        text.remove_prefix(1);
    }
    constexpr std::string_view marks[] = {"°", "'", "\""};
    constexpr double partsPerDegree[] = {1, 60, 3600};
    degrees = 0;
    for (std::size_t part = 0; part < 3; ++part) {
        const std::size_t end = std::min(text.find_first_not_of("0123456789."), text.size());
        double value = 0;
        const bool isLast = end == text.size() || text.substr(end) == marks[part];
        if (end == 0 || !parseNumber(text.substr(0, end), value) || (part > 0 && value >= 60) ||
            (!isLast && value != std::floor(value)))
        {
            return false;
        }
        degrees += value / partsPerDegree[part];
        text.remove_prefix(end);
        if (text.empty() || text == marks[part]) {
            degrees = negative ? -degrees : degrees;
            return true;
        }
        if (text.starts_with(marks[part])) {
            text.remove_prefix(marks[part].size());
        } else if (text.front() == '-') {
            text.remove_prefix(1);
        } else {
            return false;
        }
    }
    return false;
}

ValueParser::ValueParser(int type, unsigned id, const DataUnits &units)
    : form_(Form::Number), id_(id), factor_(units.factorOf(type))
{
    switch (type) {
    case VARIABLE_INTEGER: form_ = Form::Whole; break;
    case VARIABLE_TEXT:
    case VARIABLE_NAME: form_ = Form::Text; break;
    case VARIABLE_NUMBER: form_ = Form::PointNumber; break;
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: form_ = Form::Boolean; break;
    case VARIABLE_STATION: form_ = Form::Station; break;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_BEARING: form_ = units.sexagesimal ? Form::Angle : Form::Number; break;
    default: break;
    }
}

/// Whether a text holds blanks alone where a text is not what is wanted.
bool ValueParser::isBlankNumber(std::string_view text) const
{
    return form_ != Form::Text && form_ != Form::PointNumber && trimmed(text).empty();
}

bool ValueParser::storeValue(std::string_view text, UDictionary &object) const
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
    case Form::Angle: fits = parseSexagesimal(text, number); break;
    }
    object.Refill<double>(id_) = number * factor_;
    return fits;
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
    case Form::Angle: return Xlate("an angle such as 45-30-15");
    case Form::Number: break;
    }
    return Xlate("a number");
}

} // namespace kareport
