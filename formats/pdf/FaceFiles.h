#pragma once

#include "PdfFaces.h"

#include <QByteArray>
#include <QString>

#include <fontconfig/fontconfig.h>
#include <ft2build.h>
#include <hpdf.h>
#include FT_FREETYPE_H

namespace kareport
{

/// The upright faces of a family that the system has as TrueType files, each with its file in the bytes that `textOfSystem`
/// reads, its index, weight and characters. To be freed with `FcFontSetDestroy`; may be null.
FcFontSet *facesOfFamily(const char *family);
/// What the file of a face says about it. To be freed with `FcPatternDestroy`; null when it is not a font.
FcPattern *describeFace(const QString &file, unsigned index);
/// @param bytes  may take what is read, and must then live longer than the face
/// @return null when the file is missing or is not a font
FT_Face openFaceFile(FT_Library library, const QString &file, unsigned index, QByteArray &bytes);
/// Embeds a face. @return its name in the document; null when the file is missing or is not a font
const char *embedFaceFile(HPDF_Doc document, const PdfFace &face);
/// Counts the six letters in front of the name of a face of which a part is embedded as the library does. @param tag  zeros
/// before the first one
void countFaceTag(HPDF_BYTE *tag);

} // namespace kareport
