#include "NumberText.h"

#include <QUtf8StringView>

#include <algorithm>
#include <charconv>

namespace kareport
{

namespace
{

bool isBlank(char character)
{
    return character == ' ' || character == '\t';
}

/// The power of ten of a number's first digit that is not 0. @param text  digits, perhaps a sign, a point and an exponent
qint64 powerOfTen(std::string_view text)
{
    constexpr qint64 farAway = qint64(1) << 60; ///< beyond what the digits of a text can make up for
    const std::size_t mark = std::min(text.find_first_of("eE"), text.size());
    const std::string_view digits = text.substr(0, mark);
    std::string_view power = text.substr(std::min(mark + 1, text.size()));
    const bool isNegative = power.starts_with('-');
    power.remove_prefix(isNegative || power.starts_with('+') ? 1 : 0);
    qint64 exponent = 0;
    if (std::from_chars(power.data(), power.data() + power.size(), exponent).ec == std::errc::result_out_of_range) {
        exponent = farAway;
    }
    const auto point = static_cast<qint64>(std::min(digits.find('.'), digits.size()));
    const auto first = static_cast<qint64>(std::min(digits.find_first_of("123456789"), digits.size()));
    return (isNegative ? -exponent : exponent) + (first < point ? point - first - 1 : point - first);
}

/// A number too small for a double is 0; one too large is refused. Not every system has a wider type to ask.
bool parseOutOfRange(std::string_view text, double &number)
{
    number = text.starts_with('-') ? -0.0 : 0.0;
    return powerOfTen(text) < 0;
}

/// Takes the digits at a position, with groups of three after a mark of thousands where there are such. @return whether they are groups
bool takeDigits(std::string_view text, const NumberStyle &style, bool isFraction, std::size_t &at, std::string &result)
{
    const std::string_view mark = isFraction ? std::string_view() : style.thousands;
    const std::size_t start = at;
    for (; at < text.size() && isDigit(text[at]); ++at) {
        result += text[at];
    }
    const bool mayHaveGroups = !mark.empty() && at - start <= 3;
    std::size_t groups = 0;
    for (; mayHaveGroups && text.substr(at).starts_with(mark) && at + mark.size() < text.size() &&
           isDigit(text[at + mark.size()]);
         ++groups)
    {
        const std::string_view group = text.substr(at + mark.size());
        const std::size_t digits = std::min(group.find_first_not_of("0123456789"), group.size());
        if (digits != 3) {
            return false;
        }
        result += group.substr(0, digits);
        at += mark.size() + digits;
    }
    // 0.123 is not a number in thousands, but one with another decimal sign.
    const bool isEnded = at == text.size() || text[at] != style.decimal;
    return groups != 1 || text[start] != '0' || !isEnded || (mark != "." && mark != ",");
}

} // namespace

std::string_view trimmedBlanks(std::string_view text)
{
    while (!text.empty() && isBlank(text.front())) {
        text.remove_prefix(1);
    }
    while (!text.empty() && isBlank(text.back())) {
        text.remove_suffix(1);
    }
    return text;
}

bool equalsIgnoringCase(std::string_view text, std::string_view lower)
{
    return std::equal(text.begin(), text.end(), lower.begin(), lower.end(), [](char left, char right) {
        return (left >= 'A' && left <= 'Z' ? static_cast<char>(left + ('a' - 'A')) : left) == right;
    });
}

bool parseNumber(std::string_view text, double &number)
{
    text = trimmedBlanks(text);
    if (text.size() > 1 && text.front() == '+' && text[1] != '-' && text[1] != '+') {
        text.remove_prefix(1);
    }
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    if (result.ptr != text.data() + text.size() || text.empty() || text.back() == ')') {
        return false;
    }
    return result.ec == std::errc() || (result.ec == std::errc::result_out_of_range && parseOutOfRange(text, number));
}

bool parseWhole(std::string_view text, qint32 &number)
{
    text = trimmedBlanks(text);
    if (text.size() > 1 && text.front() == '+' && isDigit(text[1])) {
        text.remove_prefix(1);
    }
    const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
    return result.ec == std::errc() && result.ptr == text.data() + text.size();
}

bool parseBoolean(std::string_view text, bool &value)
{
    text = trimmedBlanks(text);
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

bool isPlainText(std::string_view text)
{
    return text.find('\0') == std::string_view::npos &&
           QUtf8StringView(text.data(), static_cast<qsizetype>(text.size())).isValidUtf8();
}

bool toPlainNumbers(std::string_view text, const NumberStyle &style, std::string &result)
{
    if (style.thousands.empty()) { // most files: one sign for another
        result = text;
        for (char &character : result) {
            if (character == style.decimal) {
                character = '.';
            } else if (character == '.') {
                return false;
            }
        }
        return true;
    }
    result.clear();
    bool isFraction = false;
    for (std::size_t at = 0; at < text.size();) {
        if (isDigit(text[at])) {
            if (!takeDigits(text, style, isFraction, at, result)) {
                return false;
            }
            continue;
        }
        const bool isMark = !style.thousands.empty() && text.substr(at).starts_with(style.thousands);
        const bool isBeforeDigit =
            isMark && at + style.thousands.size() < text.size() && isDigit(text[at + style.thousands.size()]);
        isFraction = text[at] == style.decimal;
        if ((text[at] == '.' && !isFraction) || isBeforeDigit) {
            return false;
        }
        result += isFraction ? '.' : text[at];
        ++at;
    }
    return true;
}

} // namespace kareport
