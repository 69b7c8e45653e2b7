#include "Readable.h"

#include "Contrast.h"

#include <QWidget>

namespace kareport
{

namespace
{

/// A mix of two colours. @param part  of the second one, from 0 to 1
QColor mixed(const QColor &one, const QColor &other, qreal part)
{
    const auto mix = [part](float a, float b) { return float(a + (b - a) * part); };
    return QColor::fromRgbF(mix(one.redF(), other.redF()), mix(one.greenF(), other.greenF()),
                            mix(one.blueF(), other.blueF()));
}

constexpr int steps = 20;

} // namespace

QColor readableOn(const QColor &text, const QColor &background)
{
    const bool isDark = contrast(background, Qt::white) > contrast(background, Qt::black);
    const QColor end = isDark ? Qt::white : Qt::black;
    for (int step = 0; step < steps; ++step) {
        // Rounded to what is shown, so that what is measured there is enough as well.
        const QColor tried(mixed(text, end, qreal(step) / steps).rgb());
        if (contrast(tried, background) >= leastTextContrast) {
            return tried;
        }
    }
    return end;
}

QPalette readablePalette(const QPalette &palette)
{
    struct Pair
    {
        QPalette::ColorRole text;
        QPalette::ColorRole background;
    };
    constexpr Pair pairs[] = {
        {QPalette::WindowText, QPalette::Window},    {QPalette::Text, QPalette::Base},
        {QPalette::ButtonText, QPalette::Button},    {QPalette::ToolTipText, QPalette::ToolTipBase},
        {QPalette::PlaceholderText, QPalette::Base}, {QPalette::Link, QPalette::Base},
        {QPalette::LinkVisited, QPalette::Base}};
    QPalette readable = palette;
    for (const auto group : {QPalette::Active, QPalette::Inactive}) {
        for (const Pair &pair : pairs) {
            QColor text = palette.color(group, pair.text);
            const QColor background = palette.color(group, pair.background);
            if (text.alpha() < 255) {
                text = mixed(background, text, text.alphaF()); // as it is seen there
            }
            readable.setColor(group, pair.text, readableOn(text, background));
        }
        // Selected text keeps its colour, which is white in most palettes: its background changes instead.
        const QColor selected = palette.color(group, QPalette::HighlightedText);
        readable.setColor(group, QPalette::Highlight, readableOn(palette.color(group, QPalette::Highlight), selected));
    }
    return readable;
}

QColor quietColor(const QPalette &palette, QPalette::ColorRole background)
{
    const auto role = background == QPalette::Base ? QPalette::Text : QPalette::WindowText;
    const QColor behind = palette.color(QPalette::Active, background);
    constexpr qreal quiet = 0.35;
    return readableOn(mixed(palette.color(QPalette::Active, role), behind, quiet), behind);
}

void makeQuiet(QWidget &widget, QPalette::ColorRole background)
{
    QPalette palette = widget.palette();
    palette.setColor(QPalette::WindowText, quietColor(palette, background));
    widget.setPalette(palette);
}

void makeCaption(QWidget &widget)
{
    constexpr qreal larger = 1.15;
    QFont font = widget.font();
    font.setPointSizeF(font.pointSizeF() * larger);
    font.setBold(true);
    widget.setFont(font);
}

} // namespace kareport
