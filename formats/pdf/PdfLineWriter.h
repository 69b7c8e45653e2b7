#pragma once

#include <QByteArray>
#include <QString>
#include <QStringView>

#include <functional>

namespace kareport
{

/// Writes a number as PDFs have it.
void addPdfNumber(QByteArray &operators, double number);
/// Writes the codes of a text as a string, of two bytes each.
void addPdfString(QByteArray &operators, QStringView codes);

/// Writes a line of text glyph by glyph, each where it has to be.
class PdfLineWriter
{
public:
    /// @param operators  of the page; the text state is the same before and after the line
    /// @param fontName  by which the page knows a font; the first one is the font at the line's beginning
    PdfLineWriter(QByteArray &operators, const std::function<const char *(std::size_t)> &fontName, double fontSize);

    /// Shows a glyph. Lengths are thousandths of the font size, from the line's beginning.
    /// @param advance  of the glyph as it is drawn
    void show(std::size_t font, char16_t code, double left, double rise, double stretch, double advance);
    /// What the glyphs up to `endText` say to a reader who copies them.
    void beginText(QStringView text);
    void endText();
    void end();

private:
    void setState(std::size_t font, double rise, double stretch);
    void closeString();
    void closeArray();

    QByteArray &operators_;
    const std::function<const char *(std::size_t)> fontName_;
    double fontSize_;
    std::size_t font_ = 0;
    double rise_ = 0;
    double stretch_ = 1;
    double pen_ = 0;  ///< where the next glyph would be
    int entries_ = 0; ///< of the open array
    bool isArrayOpen_ = false;
    QString string_; ///< codes that follow each other
};

} // namespace kareport
