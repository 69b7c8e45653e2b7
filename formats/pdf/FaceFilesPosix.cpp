#include "FaceFiles.h"

#include <QFile>

#include <memory>

namespace kareport
{

namespace
{

using PatternOwner = std::unique_ptr<FcPattern, decltype(&FcPatternDestroy)>;
using ObjectSetOwner = std::unique_ptr<FcObjectSet, decltype(&FcObjectSetDestroy)>;

const FcChar8 *fcText(const char *text)
{
    return reinterpret_cast<const FcChar8 *>(text);
}

} // namespace

QStringList systemFontFolders()
{
    QStringList folders;
    FcStrList *list = FcConfigGetFontDirs(nullptr);
    while (const FcChar8 *folder = list != nullptr ? FcStrListNext(list) : nullptr) {
        folders.append(QFile::decodeName(reinterpret_cast<const char *>(folder)));
    }
    if (list != nullptr) {
        FcStrListDone(list);
    }
    return folders;
}

FcFontSet *facesOfFamily(const char *family)
{
    const PatternOwner pattern(FcPatternCreate(), &FcPatternDestroy);
    FcPatternAddString(pattern.get(), FC_FAMILY, fcText(family));
    FcPatternAddInteger(pattern.get(), FC_SLANT, FC_SLANT_ROMAN);
    FcPatternAddString(pattern.get(), FC_FONTFORMAT, fcText("TrueType"));
    const ObjectSetOwner wanted(FcObjectSetBuild(FC_FILE, FC_INDEX, FC_WEIGHT, FC_CHARSET, nullptr),
                                &FcObjectSetDestroy);
    return FcFontList(nullptr, pattern.get(), wanted.get());
}

FcPattern *describeFace(const QString &file, unsigned index)
{
    int count = 0;
    return FcFreeTypeQuery(fcText(QFile::encodeName(file).constData()), index, nullptr, &count);
}

FT_Face openFaceFile(FT_Library library, const QString &file, unsigned index, QByteArray & /*bytes*/)
{
    FT_Face face = nullptr;
    const FT_Error error =
        FT_New_Face(library, QFile::encodeName(file).constData(), static_cast<FT_Long>(index), &face);
    return error == 0 ? face : nullptr;
}

const char *embedFaceFile(HPDF_Doc document, const PdfFace &face)
{
    const QByteArray file = QFile::encodeName(face.file());
    return face.isCollection() ? HPDF_LoadTTFontFromFile2(document, file.constData(), face.index(), HPDF_TRUE)
                               : HPDF_LoadTTFontFromFile(document, file.constData(), HPDF_TRUE);
}

} // namespace kareport
