#include "LineWidth.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

constexpr qsizetype tabColumns = 8;
/// Widths that are whole but for the rounding of a sum stay whole.
constexpr qreal roundingError = 1e-3;

constexpr bool isAscii(char16_t character)
{
    return character >= 0x20 && character < 0x7F;
}

bool isShownAsItIs(char16_t character)
{
    return character >= 0x20 && character != 0x7F && (character < 0x80 || character > 0x9F) && character != 0x2028 &&
           character != 0x2029;
}

/// Whether a character takes its place in a line whatever stands beside it: it is not joined, not stacked, not turned round
/// and no half of a pair.
constexpr bool standsAlone(char16_t character)
{
    struct Range
    {
        char16_t first;
        char16_t last;
    };
    constexpr Range ranges[] = {
        {0x00A0, 0x00AC}, {0x00AE, 0x02FF},                   // Latin
        {0x0370, 0x0482}, {0x048A, 0x0523},                   // Greek, Cyrillic
        {0x2010, 0x2027}, {0x2030, 0x205E}, {0x2070, 0x20CF}, // punctuation, signs of currency
        {0x2100, 0x2BFF},                                     // symbols, arrows, box drawing
        {0x2E80, 0x3029}, {0x3030, 0x3098}, {0x309B, 0x9FFF}, // Chinese, Japanese
        {0xAC00, 0xD7A3}, {0xF900, 0xFAFF}, {0xFF01, 0xFF9D}, {0xFFA0, 0xFFEE},
    };
    return std::any_of(std::begin(ranges), std::end(ranges),
                       [character](const Range &range) { return character >= range.first && character <= range.last; });
}

qreal pitchOf(const QFontMetricsF &metrics)
{
    QString all;
    for (char16_t character = 0x20; isAscii(character); ++character) {
        all += QChar(character);
    }
    const qreal pitch = metrics.horizontalAdvance(u'0');
    const bool isFixed =
        std::all_of(
            all.begin(), all.end(),
            [&](QChar character) { return std::abs(metrics.horizontalAdvance(character) - pitch) < roundingError; }) &&
        std::abs(metrics.horizontalAdvance(all) - pitch * static_cast<qreal>(all.size())) < roundingError;
    return isFixed ? pitch : 0;
}

} // namespace

QString shownLine(QStringView line)
{
    while (line.endsWith(u'\n') || line.endsWith(u'\r')) {
        line.chop(1);
    }
    QString shown;
    shown.reserve(line.size());
    for (const QChar character : line) {
        if (character == u'\t') {
            shown += QString(tabColumns - shown.size() % tabColumns, u' ');
        } else {
            shown += isShownAsItIs(character.unicode()) ? character : QChar(u' ');
        }
    }
    return shown;
}

LineWidth::LineWidth(const QFont &font, const QPaintDevice *device) : metrics_(font, device), pitch_(pitchOf(metrics_))
{}

int LineWidth::lineHeight() const
{
    return static_cast<int>(std::ceil(metrics_.height() - roundingError));
}

qreal LineWidth::widthOf(char16_t character) const
{
    std::unique_ptr<Row> &row = widths_[character >> 8];
    if (!row) {
        row = std::make_unique<Row>();
        row->fill(-1);
    }
    float &width = (*row)[character & 0xFF];
    if (width < 0) {
        width = static_cast<float>(metrics_.horizontalAdvance(QChar(character)));
    }
    return width;
}

int LineWidth::of(QStringView line) const
{
    qreal width = 0;
    bool isSum = pitch_ > 0;
    qsizetype ascii = 0;
    for (qsizetype i = 0; isSum && i < line.size(); ++i) {
        const char16_t character = line[i].unicode();
        if (isAscii(character)) {
            ++ascii;
        } else if (standsAlone(character)) {
            width += widthOf(character);
        } else {
            isSum = false;
        }
    }
    width = isSum ? width + pitch_ * static_cast<qreal>(ascii) : metrics_.horizontalAdvance(shownLine(line));
    return static_cast<int>(std::ceil(width - roundingError));
}

} // namespace kareport
