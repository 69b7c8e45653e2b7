#pragma once

#include <QFontMetricsF>
#include <QString>
#include <QStringView>

#include <array>
#include <memory>

class QPaintDevice;

namespace kareport
{

/// A line as a list shows it: without its line end, a tab as blanks up to the next eighth column, and every other control
/// character as one blank.
QString shownLine(QStringView line);

/// Measures lines as they are shown in one font. In a font of one pitch the widths of the characters are added up, which is
/// many times faster than laying the line out.
class LineWidth
{
public:
    LineWidth(const QFont &font, const QPaintDevice *device);

    /// The width of a line in whole pixels, rounded up.
    int of(QStringView line) const;
    /// The advance of a character of the font, in pixels.
    qreal characterWidth() const { return metrics_.horizontalAdvance(u'0'); }
    /// The height of a line in whole pixels.
    int lineHeight() const;

private:
    using Row = std::array<float, 256>;

    qreal widthOf(char16_t character) const;

    QFontMetricsF metrics_;
    qreal pitch_; ///< advance of every ASCII character; 0 in a font where they differ
    /// Widths of other characters, in rows of 256 that are filled when they are needed; below 0: not measured yet.
    mutable std::array<std::unique_ptr<Row>, 256> widths_;
};

} // namespace kareport
