#include "PdfFaces.h"

#include "FaceFiles.h"
#include "FixedPitchFont.h"
#include "SystemPath.h"

#include <fontconfig/fontconfig.h>

#include <algorithm>

namespace kareport
{

struct PdfFace::Coverage
{
    ~Coverage()
    {
        if (characters != nullptr) {
            FcCharSetDestroy(characters);
        }
    }
    FcCharSet *characters = nullptr;
};

namespace
{

using PatternOwner = std::unique_ptr<FcPattern, decltype(&FcPatternDestroy)>;
using FontSetOwner = std::unique_ptr<FcFontSet, decltype(&FcFontSetDestroy)>;

std::shared_ptr<const PdfFace::Coverage> coverageOf(const FcPattern *pattern)
{
    auto coverage = std::make_shared<PdfFace::Coverage>();
    FcCharSet *characters = nullptr;
    if (pattern != nullptr && FcPatternGetCharSet(pattern, FC_CHARSET, 0, &characters) == FcResultMatch) {
        coverage->characters = FcCharSetCopy(characters);
    }
    return coverage;
}

std::shared_ptr<const PdfFace::Coverage> coverageOf(const QString &file, unsigned index)
{
    const PatternOwner pattern(describeFace(file, index), &FcPatternDestroy);
    return coverageOf(pattern.get());
}

/// The upright regular face of a family; nothing where the system does not have it as a TrueType file.
std::optional<PdfFace> faceOfFamily(const char *family)
{
    const FontSetOwner found(facesOfFamily(family), &FcFontSetDestroy);

    struct Found
    {
        QString file;
        int index;
        const FcPattern *pattern;
    };
    std::optional<Found> best;
    for (int i = 0; found && i < found->nfont; ++i) {
        FcChar8 *file = nullptr;
        int index = 0;
        int weight = 0;
        if (FcPatternGetString(found->fonts[i], FC_FILE, 0, &file) != FcResultMatch ||
            FcPatternGetInteger(found->fonts[i], FC_INDEX, 0, &index) != FcResultMatch ||
            FcPatternGetInteger(found->fonts[i], FC_WEIGHT, 0, &weight) != FcResultMatch || weight < FC_WEIGHT_BOOK ||
            weight > FC_WEIGHT_MEDIUM)
        {
            continue;
        }
        // Of several files the first by name is taken, so that the choice does not depend on the order of a folder.
        const QString name = textOfSystem(reinterpret_cast<const char *>(file));
        if (!best || name < best->file) {
            best = Found{name, index, found->fonts[i]};
        }
    }
    if (!best) {
        return std::nullopt;
    }
    return PdfFace(best->file, static_cast<unsigned>(best->index) & 0xFFFF,
                   best->file.endsWith(u".ttc", Qt::CaseInsensitive), coverageOf(best->pattern));
}

bool coversPlainText(const PdfFace &face)
{
    for (char32_t character = U' '; character <= U'~'; ++character) {
        if (!face.covers(character)) {
            return false;
        }
    }
    return true;
}

} // namespace

PdfFace::PdfFace(const QString &file, unsigned index, bool isCollection)
    : PdfFace(file, index, isCollection, coverageOf(file, index))
{}

PdfFace::PdfFace(QString file, unsigned index, bool isCollection, std::shared_ptr<const Coverage> coverage)
    : file_(std::move(file)), index_(index), isCollection_(isCollection), coverage_(std::move(coverage))
{}

bool PdfFace::isFont() const
{
    return coverage_->characters != nullptr;
}

bool PdfFace::covers(char32_t character) const
{
    return character <= 0xFFFF && coverage_->characters != nullptr &&
           FcCharSetHasChar(coverage_->characters, character) == FcTrue;
}

std::vector<PdfFace> fixedPitchPdfFaces()
{
    // The last two have the characters of Chinese and Japanese.
    const QStringList families =
        substituteFaces() + QStringList{QStringLiteral("WenQuanYi Zen Hei Mono"), QStringLiteral("WenQuanYi Zen Hei")};
    std::vector<PdfFace> faces;
    for (const QString &family : families) {
        if (auto face = faceOfFamily(family.toLatin1().constData())) {
            faces.push_back(std::move(*face));
        }
    }
    return faces;
}

std::vector<PdfFace> orderPdfFaces(const std::optional<PdfFace> &preferred, const std::vector<PdfFace> &others)
{
    std::vector<PdfFace> faces = others;
    if (preferred) {
        faces.insert(faces.begin(), *preferred);
        return faces;
    }
    const auto base = std::find_if(faces.begin(), faces.end(), coversPlainText);
    if (base != faces.end()) {
        std::rotate(faces.begin(), base, base + 1);
    }
    return faces;
}

} // namespace kareport
