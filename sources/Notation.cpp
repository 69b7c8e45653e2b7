#include "Notation.h"

#include "NumberText.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <string>

namespace kareport
{

namespace
{

constexpr std::string_view digitsAndPoint = "0123456789.";

/// How many digits there are from a position on.
std::size_t digitsAt(std::string_view text, std::size_t at)
{
    const std::size_t end = std::min(text.find_first_not_of("0123456789", at), text.size());
    return end - at;
}

/// A number of digits and a point alone.
bool parseUnsigned(std::string_view text, double &number)
{
    return !text.empty() && text.find_first_not_of(digitsAndPoint) == std::string_view::npos &&
           parseNumber(text, number);
}

/// Takes a sign off the front. @return whether it is a minus
bool takeSign(std::string_view &text)
{
    const bool negative = !text.empty() && text.front() == '-';
    if (!text.empty() && (negative || text.front() == '+')) {
        text.remove_prefix(1);
    }
    return negative;
}

/// The mark of a part of an angle that a text begins with; empty when there is none.
std::string_view markOf(std::size_t part, std::string_view text)
{
    static constexpr std::array<std::array<std::string_view, 3>, 3> marks = {
        {{"°", "º", "d"}, {"'", "′", "’"}, {"\"", "″", "”"}}};
    const auto found = std::find_if(marks[part].begin(), marks[part].end(),
                                    [text](std::string_view mark) { return text.starts_with(mark); });
    return found != marks[part].end() ? *found : std::string_view();
}

enum class Between
{
    Marks,
    MarksOrHyphens
};

/// Reads degrees, minutes and seconds without a sign; what is smaller may be missing, and the mark of the last part.
/// @return how many marks there are; -1 when the text is not such an angle
int parseParts(std::string_view text, Between between, double &degrees)
{
    degrees = 0;
    int marks = 0;
    for (const double perDegree : {1.0, 60.0, 3600.0}) {
        const std::size_t part = perDegree == 1 ? 0 : perDegree == 60 ? 1 : 2;
        const std::size_t end = std::min(text.find_first_not_of(digitsAndPoint), text.size());
        const std::string_view mark = markOf(part, text.substr(end));
        double value = 0;
        const bool isLast = end + mark.size() == text.size();
        if (!parseUnsigned(text.substr(0, end), value) || (part > 0 && value >= 60) ||
            (!isLast && value != std::floor(value))) {
            return -1;
        }
        degrees += value / perDegree;
        marks += mark.empty() ? 0 : 1;
        if (isLast) {
            return marks;
        }
        text.remove_prefix(end);
        if (!mark.empty()) {
            text.remove_prefix(mark.size());
        } else if (between == Between::MarksOrHyphens && text.front() == '-') {
            text.remove_prefix(1);
        } else {
            return -1;
        }
    }
    return -1;
}

/// An angle in gon, without a sign.
bool parseGons(std::string_view text, double &gons)
{
    return text.ends_with('g') && parseUnsigned(text.substr(0, text.size() - 1), gons);
}

char upper(char character)
{
    return character >= 'a' && character <= 'z' ? static_cast<char>(character - ('a' - 'A')) : character;
}

} // namespace

/// The plus of a station such as 12+345.678 goes; one in front is a sign. After it there are as many digits as stations have
/// there: 1+5 would be 15 otherwise, where 1+005 may be meant.
bool parseStation(std::string_view text, double &number)
{
    text = trimmedBlanks(text);
    const std::size_t plus = text.find('+', 1);
    const std::size_t sign = !text.empty() && (text[0] == '-' || text[0] == '+') ? 1 : 0;
    const std::size_t digits = plus != std::string_view::npos ? digitsAt(text, plus + 1) : 0;
    const bool grouped = plus != std::string_view::npos && plus > sign && (digits == 2 || digits == 3) &&
                         std::all_of(text.begin() + static_cast<std::ptrdiff_t>(sign),
                                     text.begin() + static_cast<std::ptrdiff_t>(plus), isDigit) &&
                         text.find_first_of("eE") == std::string_view::npos;
    if (!grouped) {
        return parseNumber(text, number);
    }
    std::string joined(text.substr(0, plus));
    joined += text.substr(plus + 1);
    return parseNumber(joined, number);
}

bool parseOffset(std::string_view text, double &number)
{
    if (!text.empty() && isDigit(text.back())) { // most offsets, answered by their last character
        return parseNumber(text, number);
    }
    text = trimmedBlanks(text);
    const char side = text.empty() ? '\0' : upper(text.back());
    if (side != 'L' && side != 'R') {
        return parseNumber(text, number);
    }
    if (!parseUnsigned(trimmedBlanks(text.substr(0, text.size() - 1)), number)) {
        return false;
    }
    number = side == 'L' && number != 0 ? -number : number;
    return true;
}

bool parseSexagesimal(std::string_view text, double &degrees)
{
    text = trimmedBlanks(text);
    const bool negative = takeSign(text);
    if (parseParts(text, Between::MarksOrHyphens, degrees) < 0) {
        return false;
    }
    degrees = negative ? -degrees : degrees;
    return true;
}

std::optional<NotedAngle> parseMarkedAngle(std::string_view text)
{
    text = trimmedBlanks(text);
    const bool negative = takeSign(text);
    double value = 0;
    const bool isGon = parseGons(text, value);
    if (!isGon && parseParts(text, Between::Marks, value) <= 0) {
        return std::nullopt;
    }
    return NotedAngle{negative ? -value : value, isGon ? NotedAngle::Unit::Gon : NotedAngle::Unit::Degree};
}

std::optional<NotedAngle> parseBearing(std::string_view text, double quarterOfData)
{
    text = trimmedBlanks(text);
    const char first = text.size() > 2 ? upper(text.front()) : '\0';
    const char last = text.size() > 2 ? upper(text.back()) : '\0';
    if (first != 'N' && first != 'S') {
        return parseMarkedAngle(text);
    }
    text = trimmedBlanks(text.substr(1, text.size() - 2));
    NotedAngle angle = {0, NotedAngle::Unit::Data};
    double quarter = quarterOfData;
    if (parseGons(text, angle.value)) {
        angle.unit = NotedAngle::Unit::Gon;
        quarter = 100;
    } else if (!parseUnsigned(text, angle.value)) {
        angle.unit = NotedAngle::Unit::Degree;
        quarter = 90;
        if (parseParts(text, Between::MarksOrHyphens, angle.value) < 0) {
            return std::nullopt;
        }
    }
    if ((last != 'E' && last != 'W') || angle.value > quarter) {
        return std::nullopt;
    }
    if (first == 'S') {
        angle.value = 2 * quarter + (last == 'W' ? angle.value : -angle.value);
    } else if (last == 'W' && angle.value != 0) {
        angle.value = 4 * quarter - angle.value;
    }
    return angle;
}

} // namespace kareport
