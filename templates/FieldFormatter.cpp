#include "FieldFormatter.h"

#include "BearingText.h"
#include "FixedNotation.h"
#include "Is_Zero.h"
#include "TextFolding.h"
#include "UPointNumber.h"
#include "VariableType.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>

namespace kareport
{

/// A value as it was read by its kind.
struct FieldFormatter::Input
{
    bool flag = false;
    qint32 integer = 0;
    double number = 0;
    QStringView text;

    Input(ValueKind kind, const void *value)
    {
        switch (value != nullptr ? kind : ValueKind::None) {
        case ValueKind::Boolean: flag = *static_cast<const quint8 *>(value) != 0; break;
        case ValueKind::Int16: integer = *static_cast<const qint16 *>(value); break;
        case ValueKind::Int32: integer = *static_cast<const qint32 *>(value); break;
        case ValueKind::Double: number = *static_cast<const double *>(value); break;
        case ValueKind::Text: text = *static_cast<const QString *>(value); break;
        case ValueKind::PointNumber: text = static_cast<const UPointNumber *>(value)->Convert(); break;
        case ValueKind::None: break;
        }
    }
};

namespace
{

/// The characters that a width asks for; a width below 0 asks for none.
std::size_t columnOf(qint32 width)
{
    return width > 0 ? static_cast<std::size_t>(width) : 0;
}

void appendInteger(TextBuffer &out, qint32 value, qint32 width)
{
    char digits[12];
    const auto end = std::to_chars(std::begin(digits), std::end(digits), value).ptr;
    const std::size_t start = out.size();
    out.appendAscii({digits, static_cast<std::size_t>(end - digits)});
    out.pad(start, width);
}

} // namespace

FieldFormatter::FieldFormatter(const sXmlReportField &field)
    : marker_(fieldMarker(field.VariableName)),
      align_(equalFolded(field.Align, u"C")   ? Align::Centre
             : equalFolded(field.Align, u"L") ? Align::Left
                                              : Align::Right),
      width_(field.Width),
      decimals_(field.Decimals),
      type_(field.Type),
      id_(static_cast<quint32>(field.ID)),
      kinds_(kindsOf(field.Type))
{}

int FieldFormatter::kindsOf(qint32 type)
{
    switch (type) {
    case VARIABLE_INTEGER: return static_cast<int>(ValueKind::Int16) | static_cast<int>(ValueKind::Int32);
    case VARIABLE_TEXT:
    case VARIABLE_NAME:
    case VARIABLE_NUMBER: return static_cast<int>(ValueKind::Text) | static_cast<int>(ValueKind::PointNumber);
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: return static_cast<int>(ValueKind::Boolean);
    default: return static_cast<int>(ValueKind::Double);
    }
}

Shown FieldFormatter::append(TextBuffer &out, const FormatOptions &options, ValueKind kind, const void *value,
                             QStringView suffix, WidestText *widest) const
{
    if (marker_ == FieldMarker::Filler) {
        out.appendFill(columnOf(width_), u' ');
        return Shown::Whole;
    }
    Input input(kind, value);
    const bool isFinite = kind != ValueKind::Double || std::isfinite(input.number);
    if (kind == ValueKind::Double && isFinite) {
        input.number = options.settings->ConvertToDisplay(input.number, type_, 0);
    }
    const std::size_t start = out.size();
    appendValue(out, options, input, suffix);
    const std::size_t length = out.size() - start;
    if (widest != nullptr) {
        widest->take(ownText(out.from(start)));
    }
    if (options.printHash && length > columnOf(width_)) {
        out.truncate(start);
        out.appendFill(columnOf(width_), u'#');
    }
    fit(out, start, options.separator);
    const bool isWhole = length <= columnOf(width_) || width_ <= 0 || options.separator == u'\t';
    return !isFinite ? Shown::NotFinite : isWhole ? Shown::Whole : Shown::TooWide;
}

bool FieldFormatter::showsZeroForNone(const FormatOptions &options) const
{
    switch (type_) {
    case VARIABLE_INTEGER:
    case VARIABLE_DOUBLE:
    case VARIABLE_AREA:
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
    case VARIABLE_BEARING:
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION: return !options.zeroBlank;
    case VARIABLE_STATION:
    case VARIABLE_OFFSET:
    case VARIABLE_PLAIN:
    case VARIABLE_THICKNESS: return true;
    default: return false;
    }
}

bool FieldFormatter::showsText() const
{
    return type_ == VARIABLE_TEXT || type_ == VARIABLE_NAME || type_ == VARIABLE_NUMBER;
}

void FieldFormatter::appendValue(TextBuffer &out, const FormatOptions &options, const Input &input,
                                 QStringView suffix) const
{
    const UJobSettings &settings = *options.settings;
    const bool finite = std::isfinite(input.number);
    const auto blankForZero = [&](bool isZero) { return options.zeroBlank && isZero && appendBlanks(out); };

    switch (type_) {
    case VARIABLE_INTEGER:
        if (!blankForZero(input.integer == 0)) {
            appendInteger(out, input.integer, width_);
        }
        break;
    case VARIABLE_DOUBLE:
    case VARIABLE_AREA:
        if (finite && !blankForZero(input.number == 0)) {
            appendNumber(out, input.number, settings.numberDecimals);
        }
        break;
    case VARIABLE_TEXT:
    case VARIABLE_NAME:
    case VARIABLE_NUMBER: out.append(input.text); break;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE:
        if (finite && !blankForZero(input.number == 0)) {
            appendNumber(out, input.number, decimals_);
        }
        break;
    case VARIABLE_BEARING:
        if (finite && !blankForZero(input.number == 0)) {
            out.append(bearingText(input.number, settings));
        }
        break;
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
        if (finite && !blankForZero(input.number == 0)) {
            settings.appendUnitLength(out, input.number, {.width = width_});
        }
        break;
    case VARIABLE_STATION:
        settings.appendStation(out, input.number, {.width = width_, .alignRight = true, .showSign = true});
        break;
    case VARIABLE_OFFSET:
        if (finite) {
            appendOffset(out, settings, input.number, suffix == u"+");
        }
        break;
    case VARIABLE_BOOLEAN: out.append(input.flag ? u'Y' : u'N'); break;
    case VARIABLE_FLAG: out.append(input.flag ? u'*' : u' '); break;
    case VARIABLE_PLAIN: appendNumber(out, input.number, settings.numberDecimals); break;
    case VARIABLE_THICKNESS: appendThickness(out, input.number); break;
    default: out.appendFill(columnOf(width_), u'?'); break;
    }
}

/// Fills the column. @return true
bool FieldFormatter::appendBlanks(TextBuffer &out) const
{
    const std::size_t start = out.size();
    out.append(u' ');
    out.pad(start, width_);
    return true;
}

/// Writes a number as C's printf does with "%*.*f": a zero keeps its minus sign.
void FieldFormatter::appendNumber(TextBuffer &out, double value, int decimals) const
{
    const std::size_t start = out.size();
    if (std::isnan(value)) {
        out.append(u"nan");
    } else {
        if (std::signbit(value)) {
            out.append(u'-');
        }
        if (std::isinf(value)) {
            out.append(u"inf");
        } else {
            out.appendAscii(FixedNotation(value, decimals).digits());
        }
    }
    out.pad(start, width_);
}

void FieldFormatter::appendOffset(TextBuffer &out, const UJobSettings &settings, double value, bool withSign) const
{
    const double magnitude = std::fabs(value);
    if (withSign) {
        const std::size_t start = out.size();
        out.append(value < 0 ? u'-' : u'+');
        settings.appendUnitLength(out, magnitude, {.decimals = decimals_});
        out.pad(start, width_);
        return;
    }
    if (Is_Zero(value)) {
        settings.appendUnitLength(out, magnitude, {.decimals = decimals_, .width = width_});
        return;
    }
    settings.appendUnitLength(out, magnitude, {.decimals = decimals_, .width = std::max(width_, 0) - 1});
    out.append(value < 0 ? u'L' : u'R');
}

/// A thickness is held in hundredths. Those with bit 15 set mean "the layer's own", the small negative ones among
/// them.
void FieldFormatter::appendThickness(TextBuffer &out, double value) const
{
    constexpr double lowest = std::numeric_limits<qint32>::min();
    constexpr double highest = std::numeric_limits<qint32>::max();
    const double whole = std::trunc(value);
    if (whole >= lowest && whole <= highest && (static_cast<qint32>(whole) & 0x8000) != 0) {
        out.append(u"ByLayer");
        return;
    }
    appendNumber(out, value / 100, decimals_);
}

/// The text of a value without the blanks that fill its column. Those of a text from the data are its own.
QStringView FieldFormatter::ownText(QStringView text) const
{
    return showsText() ? text : text.trimmed();
}

/// Fills the column. A text wider than its column stays whole: no digit is ever cut off.
void FieldFormatter::fit(TextBuffer &out, std::size_t start, char16_t separator) const
{
    if (separator == u'\t') {
        out.trim(start);
        return;
    }
    const bool shorter = static_cast<qint64>(out.size() - start) < width_;
    if (align_ == Align::Centre && shorter) {
        centre(out, start);
    } else {
        // A negative width pads on the right as well, which is what "%*s" does with it.
        out.pad(start, align_ == Align::Right || width_ < 0 ? width_ : -width_);
    }
}

/// Half of the missing blanks go to each side, at least one each: a single missing blank gives one on either side and a
/// column one character too wide, which templates in use rely on to keep centred marks off their neighbours.
void FieldFormatter::centre(TextBuffer &out, std::size_t start) const
{
    const std::size_t missing = columnOf(width_) - (out.size() - start);
    const std::size_t half = missing / 2;
    const std::size_t before = std::max<std::size_t>(half, 1);
    out.insertFill(start, before, u' ');
    out.appendFill(half == 0 ? missing : half, u' ');
    if (out.size() - start < columnOf(width_)) {
        out.append(u' ');
    }
}

} // namespace kareport
