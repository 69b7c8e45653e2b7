#include "FixedPitchFont.h"

namespace kareport
{

const QStringList &substituteFaces()
{
    static const QStringList faces = {QStringLiteral("DejaVu Sans Mono"), QStringLiteral("Liberation Mono"),
                                      QStringLiteral("Hack")};
    return faces;
}

QFont fixedPitchFont(const QString &face)
{
    QFont font(QStringList{face});
    setFixedPitch(font);
    font.setWeight(QFont::Normal);
    font.setItalic(false);
    return font;
}

void setFixedPitch(QFont &font)
{
    QStringList families = font.families();
    for (const QString &face : substituteFaces()) {
        if (!families.contains(face)) {
            families.append(face);
        }
    }
    font.setFamilies(families);
    font.setStyleHint(QFont::TypeWriter);
    font.setFixedPitch(true);
}

} // namespace kareport
