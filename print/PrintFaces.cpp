#include "PrintFaces.h"

#include "Characters.h"
#include "FixedPitchFont.h"
#include "PageUnits.h"

#include <QFontInfo>
#include <QFontMetricsF>
#include <QGuiApplication>
#include <QPaintDevice>
#include <QRawFont>
#include <QScreen>
#include <QTextDocument>

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

constexpr qreal usualScreenResolution = 96;

qreal screenResolution()
{
    const QScreen *screen = QGuiApplication::primaryScreen();
    return screen == nullptr ? usualScreenResolution : screen->logicalDotsPerInchY();
}

int rounded(qreal dots)
{
    return static_cast<int>(std::lround(dots));
}

/// Makes each character take `pitch` dots where it takes `advance`.
void setPitch(QFont &font, QPaintDevice &device, qreal advance, int pitch)
{
    // What a unit of spacing comes to depends on the device.
    QFont spaced(font);
    spaced.setLetterSpacing(QFont::AbsoluteSpacing, 1);
    const qreal unit = QFontMetricsF(spaced, &device).horizontalAdvance(QStringLiteral("xx")) -
                       QFontMetricsF(font, &device).horizontalAdvance(QStringLiteral("xx"));
    if (unit > 0) {
        font.setLetterSpacing(QFont::AbsoluteSpacing, (pitch - advance) * 2 / unit);
    }
}

void fillGlyphs(PrintFace &face)
{
    QString characters;
    for (std::size_t code = 0; code < face.glyphs.size(); ++code) {
        const auto character = static_cast<char16_t>(code);
        characters += needsNoShaping(character) ? QChar(character) : QChar(u' ');
    }
    face.raw = QRawFont::fromFont(face.font);
    const QList<quint32> glyphs = face.raw.glyphIndexesForString(characters);
    if (glyphs.size() == characters.size()) {
        for (std::size_t character = 0; character < face.glyphs.size(); ++character) {
            const auto index = static_cast<qsizetype>(character);
            const bool isShown = characters[index] == QChar(static_cast<char16_t>(character));
            face.glyphs.at(character) = isShown ? glyphs[index] : 0;
        }
    }
}

} // namespace

PrintFaces::PrintFaces(const QTextDocument &text, QPaintDevice &device)
    : device_(device), base_(makeFace(text.defaultFont(), Qt::black))
{}

qreal PrintFaces::dots(qreal pixels) const
{
    return pixels * device_.logicalDpiY() / screenResolution();
}

PrintFace PrintFaces::makeFace(const QFont &font, const QColor &color) const
{
    PrintFace face;
    face.color = color;
    face.font = font;
    const bool fixedPitch = font.fixedPitch() || font.styleHint() == QFont::TypeWriter || QFontInfo(font).fixedPitch();
    if (fixedPitch) {
        setFixedPitch(face.font);
    }
    face.font.setHintingPreference(QFont::PreferNoHinting);
    const qreal size =
        font.pointSizeF() > 0 ? font.pointSizeF() * device_.logicalDpiY() / pointsPerInch : dots(font.pixelSize());
    face.font.setPixelSize(std::max(1, rounded(size)));

    const QFontMetricsF metrics(face.font, &device_);
    face.ascent = rounded(metrics.ascent());
    face.height = std::max(1, face.ascent + rounded(metrics.descent()) + rounded(metrics.leading()));
    const qreal advance = metrics.horizontalAdvance(u'x');
    if (fixedPitch && rounded(advance) > 0 && metrics.horizontalAdvance(u'i') == advance) {
        face.pitch = rounded(advance);
        fillGlyphs(face);
        setPitch(face.font, device_, advance, face.pitch);
    }
    return face;
}

const PrintFace &PrintFaces::face(const QTextCharFormat &format, int number)
{
    const auto known = faces_.find(number);
    if (known != faces_.end()) {
        return known->second;
    }
    // Without a colour of its own text is black: the screen's may be white on black.
    const bool isColored = format.foreground().style() != Qt::NoBrush;
    QFont font = format.font();
    font.setUnderline(format.fontUnderline());
    const QColor color = isColored ? format.foreground().color() : QColor(Qt::black);
    return faces_.emplace(number, makeFace(font, color)).first->second;
}

} // namespace kareport
