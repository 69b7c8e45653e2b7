#pragma once

#include <QColor>
#include <QFont>
#include <QRawFont>
#include <QTextCharFormat>

#include <array>
#include <map>

class QPaintDevice;
class QTextDocument;

namespace kareport
{

/// A character format as it is printed.
struct PrintFace
{
    QFont font;   ///< in dots
    QRawFont raw; ///< of the glyphs
    QColor color;
    int ascent = 0; ///< dots
    int height = 0; ///< of a line, dots
    int pitch = 0;  ///< dots that each character takes; 0 where characters differ in width
    /// The glyphs of the first characters; 0 where the font has none, for controls, and where characters differ in width.
    std::array<quint32, 256> glyphs = {};
};

/// The character formats of a text on one device, each made when it is first met.
///
/// A line is as high, and a character of a fixed-pitch font as wide, as a page is measured with: whole dots.
class PrintFaces
{
public:
    PrintFaces(const QTextDocument &text, QPaintDevice &device);

    const PrintFace &base() const { return base_; }
    /// The face of a format, known by its number in the text; valid as long as this object.
    const PrintFace &face(const QTextCharFormat &format, int number);

private:
    qreal dots(qreal pixels) const; ///< of the screen
    PrintFace makeFace(const QFont &font, const QColor &color) const;

    QPaintDevice &device_;
    PrintFace base_;
    std::map<int, PrintFace> faces_;
};

} // namespace kareport
