#include "DataText.h"

#include "VariableType.h"

#include <QByteArray>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>

namespace kareport
{

namespace
{

constexpr double fewestWithExponent = 1e16;
constexpr double mostWithExponent = 1e-6;

/// How many characters the shortest text of a number has.
std::ptrdiff_t lengthOf(double number)
{
    char text[32];
    return std::to_chars(std::begin(text), std::end(text), number, std::chars_format::scientific).ptr - text;
}

/// A text with U+FFFD in place of each half of a surrogate pair.
QString withoutHalves(QStringView text)
{
    QString whole = text.toString();
    for (qsizetype i = 0; i < whole.size(); ++i) {
        const bool isPair = whole[i].isHighSurrogate() && i + 1 < whole.size() && whole[i + 1].isLowSurrogate();
        if (isPair) {
            ++i;
        } else if (whole[i].isSurrogate()) {
            whole[i] = QChar::ReplacementCharacter;
        }
    }
    return whole;
}

} // namespace

void appendUtf8(std::string &out, QStringView text)
{
    const bool isAscii = std::all_of(text.begin(), text.end(), [](QChar character) { return character < u'\x80'; });
    if (!isAscii) {
        const QByteArray bytes = text.isValidUtf16() ? text.toUtf8() : withoutHalves(text).toUtf8();
        out.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
        return;
    }
    const std::size_t start = out.size();
    out.resize(start + static_cast<std::size_t>(text.size()));
    std::transform(text.begin(), text.end(), out.begin() + static_cast<std::ptrdiff_t>(start),
                   [](QChar character) { return character.toLatin1(); });
}

// A product is rounded, and so is the quotient: the number that was read is at most two steps away from it.
double inDataUnit(double internal, double factor)
{
    if (factor == 1 || !std::isfinite(internal)) {
        return internal;
    }
    const double quotient = internal / factor;
    constexpr std::ptrdiff_t surelyRead = 20; // -1.12345678901234e+12: a number of 15 digits, which no other is near
    if (quotient * factor == internal && lengthOf(quotient) <= surelyRead) {
        return quotient;
    }
    double best = quotient;
    bool hasBest = false;
    constexpr double infinity = std::numeric_limits<double>::infinity();
    const double below = std::nextafter(quotient, -infinity);
    const double above = std::nextafter(quotient, infinity);
    for (const double candidate :
         {quotient, below, above, std::nextafter(below, -infinity), std::nextafter(above, infinity)})
    {
        if (candidate * factor == internal && (!hasBest || lengthOf(candidate) < lengthOf(best))) {
            best = candidate;
            hasBest = true;
        }
    }
    return best;
}

void appendNumber(std::string &out, double number, bool isAngle)
{
    const double magnitude = std::fabs(number);
    const bool isFixed = isAngle || magnitude == 0 || (magnitude >= mostWithExponent && magnitude < fewestWithExponent);
    char text[1100]; // the smallest double has 1074 decimals
    const auto result = isFixed ? std::to_chars(std::begin(text), std::end(text), number, std::chars_format::fixed)
                                : std::to_chars(std::begin(text), std::end(text), number);
    out.append(text, result.ptr);
}

bool isAngleType(int type)
{
    return type == VARIABLE_ANGLE || type == VARIABLE_VANGLE || type == VARIABLE_BEARING;
}

} // namespace kareport
