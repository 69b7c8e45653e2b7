#include "TotalFormatter.h"

#include "FixedNotation.h"
#include "VariableType.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <limits>
#include <string>

namespace kareport
{

namespace
{

sXmlReportField withType(sXmlReportField field, int type)
{
    field.Type = type;
    return field;
}

/// Settings whose units are the internal ones, so that a number stays as it is.
UJobSettings withoutConversion(UJobSettings settings)
{
    settings.lengthUnit = LengthUnit::Metre;
    settings.areaUnit = AreaUnit::SquareMetre;
    settings.angleUnit = AngleUnit::Radian;
    return settings;
}

constexpr std::size_t mostQuickDigits = 18;

} // namespace

int shownDecimals(const sXmlReportField &field, const UJobSettings &settings)
{
    switch (field.Type) {
    case VARIABLE_INTEGER: return 0;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE: return std::max(field.Decimals, 0);
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION: return settings.lengthDecimals;
    case VARIABLE_STATION: return settings.stationDecimals;
    case VARIABLE_OFFSET: return field.Decimals == -1 ? settings.lengthDecimals : std::max(field.Decimals, 0);
    default: return settings.numberDecimals;
    }
}

TotalFormatter::TotalFormatter(const sXmlReportField &field, const FormatOptions &options, UnitRatio ratio)
    : field_(field),
      options_(options),
      ratio_(std::move(ratio)),
      shownSettings_(withoutConversion(*options.settings)),
      values_(field),
      texts_(withType(field, VARIABLE_TEXT)),
      counts_(withType(field, VARIABLE_INTEGER)),
      decimals_(shownDecimals(field, *options.settings))
{}

Shown TotalFormatter::append(TextBuffer &out, const ColumnTotal &total, TotalKind kind, QStringView suffix) const
{
    if (kind == TotalKind::Count) {
        return appendCount(out, total.count);
    }
    if (kind == TotalKind::Sum) {
        return appendRounded(out, total.sum.exact().rounded(ratio_, 1, decimals_), suffix);
    }
    if (total.count == 0) {
        appendBlank(out);
        return Shown::Whole;
    }
    switch (kind) {
    case TotalKind::Least: return appendExtreme(out, total.least, suffix);
    case TotalKind::Greatest: return appendExtreme(out, total.greatest, suffix);
    default: return appendRounded(out, total.sum.exact().rounded(ratio_, total.count, decimals_), suffix);
    }
}

void TotalFormatter::appendBlank(TextBuffer &out) const
{
    const QString none;
    texts_.append(out, options_, ValueKind::Text, &none, QStringView());
}

void TotalFormatter::appendRule(TextBuffer &out) const
{
    out.appendFill(static_cast<std::size_t>(std::max(field_.Width, 1)), u'-');
}

/// The least and the greatest value show as they do in their own rows.
Shown TotalFormatter::appendExtreme(TextBuffer &out, double value, QStringView suffix) const
{
    if (field_.Type == VARIABLE_INTEGER) {
        const auto whole = static_cast<qint32>(value);
        return values_.append(out, options_, ValueKind::Int32, &whole, suffix);
    }
    return values_.append(out, options_, ValueKind::Double, &value, suffix);
}

Shown TotalFormatter::appendCount(TextBuffer &out, quint64 count) const
{
    if (count > static_cast<quint64>(std::numeric_limits<qint32>::max())) {
        return appendText(out, QString::number(count));
    }
    const auto whole = static_cast<qint32>(count);
    FormatOptions options = options_;
    options.zeroBlank = false; // a count of 0 says something
    return counts_.append(out, options, ValueKind::Int32, &whole, QStringView());
}

Shown TotalFormatter::appendRounded(TextBuffer &out, const RoundedDecimal &number, QStringView suffix) const
{
    if (!number.fitsDouble()) {
        return appendText(out, longText(number, suffix));
    }
    double value = 0;
    std::from_chars(number.digits.data(), number.digits.data() + number.digits.size(), value);
    if (field_.Type == VARIABLE_INTEGER) {
        if (value > std::numeric_limits<qint32>::max()) {
            return appendText(out, longText(number, suffix));
        }
        const auto whole = static_cast<qint32>(number.isNegative ? -value : value);
        return values_.append(out, options_, ValueKind::Int32, &whole, suffix);
    }
    if (value == 0 && !number.isZero) {
        value = std::pow(10.0, -decimals_ - 1); // not 0, but rounded to it
    }
    FormatOptions options = options_;
    options.settings = &shownSettings_;
    value = number.isNegative ? -value : value;
    return values_.append(out, options, ValueKind::Double, &value, suffix);
}

Shown TotalFormatter::appendText(TextBuffer &out, const QString &text) const
{
    return texts_.append(out, options_, ValueKind::Text, &text, QStringView());
}

/// A number of more digits than a double has, as its field would show it.
QString TotalFormatter::longText(const RoundedDecimal &number, QStringView suffix) const
{
    QString text = QString::fromStdString(number.digits);
    const QString sign = number.isNegative ? QStringLiteral("-") : QString();
    if (field_.Type == VARIABLE_OFFSET) {
        return suffix == u"+" ? (number.isNegative ? u'-' : u'+') + text : text + (number.isNegative ? u'L' : u'R');
    }
    const auto format = options_.settings->stationFormat;
    if (field_.Type == VARIABLE_STATION && format != UJobSettings::StationFormat::Plain) {
        const qsizetype digitsAfterPlus = format == UJobSettings::StationFormat::HundredsPlus ? 2 : 3;
        const qsizetype point = text.indexOf(u'.');
        const qsizetype whole = point < 0 ? text.size() : point;
        text.insert(0, QString(std::max<qsizetype>(digitsAfterPlus + 1 - whole, 0), u'0'));
        text.insert(std::max(whole - digitsAfterPlus, qsizetype(1)), u'+');
    }
    return sign + text;
}

TotalledCell::TotalledCell(const TotalledVariable &variable, const FormatOptions &options, bool addsPrinted)
    : reader_(variable.reader),
      options_(options),
      type_(variable.field.Type),
      addsPrinted_(addsPrinted),
      decimals_(shownDecimals(variable.field, *options.settings))
{}

double TotalledCell::shown(double value) const
{
    return options_.settings->ConvertToDisplay(value, type_, 0);
}

TotalledCell::Value TotalledCell::read(const UDictEntry *entry)
{
    if (entry == nullptr) {
        return {};
    }
    if ((FieldFormatter::kindsOf(type_) & static_cast<int>(entry->kind())) == 0) {
        return {}; // another variable of the same identifier has left it
    }
    if (const auto *whole = std::get_if<qint32>(&entry->value())) {
        return {State::Number, static_cast<double>(*whole), {*whole, 0}};
    }
    const auto *value = std::get_if<double>(&entry->value());
    if (value == nullptr) {
        return {State::Text, 0, {}};
    }
    if (!std::isfinite(*value) || (addsPrinted_ && !std::isfinite(shown(*value)))) {
        return {State::NotFinite, *value, {}};
    }
    if (!addsPrinted_) {
        return {State::Number, *value, reader_.read(*value)};
    }
    const double printed = shown(*value);
    const FixedNotation fixed(printed, decimals_);
    if (fixed.digits().size() > mostQuickDigits) {
        return {State::Long, *value, {}};
    }
    CellDecimal number{0, -decimals_};
    for (const char character : fixed.digits()) {
        number.digits = character == '.' ? number.digits : number.digits * 10 + (character - '0');
    }
    number.digits = printed < 0 ? -number.digits : number.digits;
    return {State::Number, *value, number};
}

std::optional<double> TotalledCell::internal(const ColumnTotal &total, TotalKind kind) const
{
    if (kind == TotalKind::Count || (total.count == 0 && kind != TotalKind::Sum)) {
        return std::nullopt;
    }
    if (kind == TotalKind::Least || kind == TotalKind::Greatest) {
        return kind == TotalKind::Least ? total.least : total.greatest;
    }
    const double sum = total.sum.toDouble();
    const double number = kind == TotalKind::Mean ? sum / static_cast<double>(total.count) : sum;
    return addsPrinted_ ? number / shown(1) : reader_.internal(number);
}

void TotalledCell::add(ColumnTotal &total, const Value &value) const
{
    switch (value.state) {
    case State::Missing:
    case State::NotFinite: break;
    case State::Text: total.addText(); break;
    case State::Number: total.add(value.value, value.number); break;
    case State::Long: {
        const double printed = shown(value.value);
        total.sum.add(printed < 0, FixedNotation(printed, decimals_).digits());
        total.addRange(value.value, value.value, 1);
        break;
    }
    }
}

} // namespace kareport
