#include "LineWidth.h"

#include "Characters.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// Widths that are whole except for the rounding of a sum stay whole.
constexpr qreal roundingError = 1e-3;

constexpr bool isAscii(char16_t character)
{
    return character >= 0x20 && character < 0x7F;
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
            shown += isControl(character.unicode()) ? QChar(u' ') : character;
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
        } else if (needsNoShaping(character)) {
            width += widthOf(character);
        } else {
            isSum = false;
        }
    }
    width = isSum ? width + pitch_ * static_cast<qreal>(ascii) : metrics_.horizontalAdvance(shownLine(line));
    return static_cast<int>(std::ceil(width - roundingError));
}

} // namespace kareport
