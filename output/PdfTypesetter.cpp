#include "PdfTypesetter.h"

#include <QStringEncoder>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr std::size_t planeSize = 0x10000;
constexpr unsigned char unknownFace = 0xFF;
/// The library takes a text of 65535 bytes at most.
constexpr qsizetype longestRun = 16000;

} // namespace

bool PdfTypesetter::loadFaces(PdfDocument &pdf, const std::vector<PdfFace> &faces)
{
    for (const PdfFace &face : faces) {
        const HPDF_Font font = pdf.loadFace(face);
        if (font == nullptr) {
            failedFace_ = face.file();
            return false;
        }
        faces_.push_back({face, font});
    }
    faceOf_.assign(planeSize, unknownFace);
    widths_.assign(planeSize, -1);
    return !faces_.empty();
}

FaceHeight PdfTypesetter::height() const
{
    const HPDF_Box box = HPDF_Font_GetBBox(faces_.front().font);
    return {box.top, box.bottom};
}

bool PdfTypesetter::covers(char32_t character) const
{
    return std::any_of(faces_.begin(), faces_.end(),
                       [character](const Entry &entry) { return entry.face.covers(character); });
}

std::size_t PdfTypesetter::faceOf(char16_t character)
{
    unsigned char &face = faceOf_[character];
    if (face == unknownFace) {
        const auto found = std::find_if(faces_.begin(), faces_.end(),
                                        [character](const Entry &entry) { return entry.face.covers(character); });
        // What nobody has is left to the first face, which has a sign for it.
        face = static_cast<unsigned char>(found != faces_.end() ? found - faces_.begin() : 0);
    }
    return face;
}

int PdfTypesetter::width(char32_t character)
{
    short &width = widths_[character & 0xFFFF];
    if (width < 0) {
        const auto code = static_cast<char16_t>(character);
        width = static_cast<short>(std::max(0, HPDF_Font_GetUnicodeWidth(faces_[faceOf(code)].font, code)));
    }
    return width;
}

bool PdfTypesetter::addPage(PdfDocument &pdf, const PdfPageBox &box, const LinePlacement &placement,
                            const std::vector<QStringView> &lines)
{
    const HPDF_Page page = pdf.addPage();
    if (page == nullptr) {
        return false;
    }
    HPDF_Page_SetWidth(page, box.width);
    HPDF_Page_SetHeight(page, box.height);
    HPDF_Page_SetFontAndSize(page, faces_.front().font, placement.fontSize);
    HPDF_Page_BeginText(page);
    HPDF_Page_SetTextLeading(page, placement.leading);
    // Every line begins by moving down to it, the first one as well.
    HPDF_Page_MoveTextPos(page, box.left, placement.firstBaseline + placement.leading);
    for (const QStringView line : lines) {
        if (line.isEmpty()) {
            HPDF_Page_MoveToNextLine(page);
        } else {
            showLine(page, placement.fontSize, line);
        }
    }
    HPDF_Page_EndText(page);
    return pdf.isGood();
}

void PdfTypesetter::showLine(HPDF_Page page, float fontSize, QStringView line)
{
    bool onNextLine = true;
    qsizetype begin = 0;
    while (begin < line.size()) {
        const std::size_t face = faces_.size() > 1 ? faceOf(line[begin].unicode()) : 0;
        qsizetype end = std::min(line.size(), begin + longestRun);
        if (faces_.size() > 1) {
            const auto isOther = [&](QChar character) { return faceOf(character.unicode()) != face; };
            end = std::find_if(line.begin() + begin, line.begin() + end, isOther) - line.begin();
        }
        if (face != 0) {
            HPDF_Page_SetFontAndSize(page, faces_[face].font, fontSize);
        }
        showRun(page, line.sliced(begin, end - begin), onNextLine);
        if (face != 0) {
            HPDF_Page_SetFontAndSize(page, faces_.front().font, fontSize);
        }
        onNextLine = false;
        begin = end;
    }
}

void PdfTypesetter::showRun(HPDF_Page page, QStringView run, bool onNextLine)
{
    QStringEncoder encoder(QStringEncoder::Utf8);
    utf8_.resize(encoder.requiredSpace(run.size()) + 1);
    char *end = encoder.appendToBuffer(utf8_.data(), run);
    *end = '\0';
    if (onNextLine) {
        HPDF_Page_ShowTextNextLine(page, utf8_.constData());
    } else {
        HPDF_Page_ShowText(page, utf8_.constData());
    }
}

} // namespace kareport
