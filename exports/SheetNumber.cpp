#include "SheetNumber.h"

#include "NumberText.h"
#include "ShownNumber.h"
#include "UJobSettings.h"
#include "VariableType.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <string_view>

namespace kareport
{

namespace
{

/// 0.000 with as many decimals.
std::string plainFormat(int decimals)
{
    std::string format = "0";
    if (decimals > 0) {
        format += '.';
        format.append(static_cast<std::size_t>(decimals), '0');
    }
    return format;
}

/// A text of digits, a sign, a point and a plus, as numbers and stations are printed, with a letter for a side after it.
struct PrintedNumber
{
    double value = 0;
    char side = 0; ///< 'L' or 'R'; 0 for none
    bool isMinus = false;
    bool isZero = false;
};

std::optional<PrintedNumber> printedNumber(QStringView text)
{
    std::array<char, 400> digits;
    PrintedNumber printed;
    if (!text.isEmpty() && (text.back() == u'L' || text.back() == u'R')) {
        printed.side = text.back().toLatin1();
        text.chop(1);
    }
    if (text.isEmpty() || static_cast<std::size_t>(text.size()) > digits.size()) {
        return std::nullopt;
    }
    char *end = digits.data();
    for (const QChar character : text) {
        if (character != u'+') { // the sign of an offset, or what groups the digits of a station
            *end++ = character < u'\x80' ? character.toLatin1() : '?';
        }
    }
    const std::string_view plain(digits.data(), static_cast<std::size_t>(end - digits.data()));
    if (plain.find_first_not_of("-.0123456789") != std::string_view::npos || !parseNumber(plain, printed.value)) {
        return std::nullopt;
    }
    printed.isMinus = plain.front() == '-';
    printed.isZero = printed.value == 0;
    printed.value = printed.isZero ? 0 : printed.side == 'L' ? -printed.value : printed.value;
    return printed;
}

} // namespace

std::string sheetFormat(const ResultColumn &column, const UJobSettings &settings)
{
    const std::string plain = plainFormat(shownDecimals(column, settings));
    if (column.field.Type == VARIABLE_STATION) {
        switch (settings.stationFormat) {
        case UJobSettings::StationFormat::Plain: return plain;
        case UJobSettings::StationFormat::HundredsPlus: return "0+0" + plain;
        case UJobSettings::StationFormat::ThousandsPlus: return "0+00" + plain;
        }
    }
    if (column.field.Type == VARIABLE_OFFSET) {
        return hasSideLetter(column) ? plain + "\"R\";" + plain + "\"L\";" + plain
                                     : '+' + plain + ";-" + plain + ";+" + plain;
    }
    return plain;
}

std::optional<SheetNumber> blankNumber(const ResultColumn &column, const ResultCell &cell, const UJobSettings &settings)
{
    const auto number = shownNumber(column, cell, settings);
    return number ? std::optional(SheetNumber{*number, ";;;"}) : std::nullopt;
}

std::optional<SheetNumber> sheetNumber(const ResultColumn &column, const ResultCell &cell, const UJobSettings &settings,
                                       ResultValues values)
{
    if (cell.value == nullptr) {
        return std::nullopt;
    }
    const auto printed = printedNumber(cell.text);
    if (!printed) {
        return std::nullopt;
    }
    SheetNumber number;
    number.value = printed->value;
    if (values == ResultValues::Exact) {
        number.value = shownNumber(column, cell, settings).value_or(printed->value);
    }
    if (!printed->isZero) {
        return number;
    }
    // The sign of a zero, and the side of an offset of zero, are in no number: their format has them. What is rounded to zero
    // would show a sign that the report does not show.
    const std::string plain = plainFormat(shownDecimals(column, settings));
    if (printed->isMinus) {
        number.format = "\"-\"" + (column.field.Type == VARIABLE_OFFSET ? plain : sheetFormat(column, settings));
    } else if (hasSideLetter(column)) {
        number.format = plain + (printed->side != 0 ? std::string("\"") + printed->side + '"' : std::string());
    } else if (number.value < 0) {
        number.format = column.field.Type == VARIABLE_OFFSET ? '+' + plain : sheetFormat(column, settings);
    }
    if (number.value < 0) {
        number.format += ';' + number.format; // as it is, without the sign of a single format
    }
    return number;
}

} // namespace kareport
