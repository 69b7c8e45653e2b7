#include "PdfDocument.h"

#include <QIODevice>

#include <hpdf_doc.h>
#include <hpdf_fontdef.h>
#include <hpdf_objects.h>

#include <algorithm>
#include <array>
#include <utility>

namespace kareport
{

namespace
{

/// The most pages that the library keeps in one list.
constexpr qint64 longestPageList = 32767;
constexpr HPDF_UINT pagesPerGroup = 1000;
/// Characters of a text string: the library's strings end before 65535 bytes.
constexpr qsizetype longestText = 16000;

/// A face that has no characters as long as this lives. The library asks for the glyph of each of 65536 characters when it
/// makes a font of a face, and goes through the face's ranges for each. All that it makes of the answers is replaced by what
/// `PdfFont::describeCharacters` says of the characters that are shown.
class FaceWithoutCharacters
{
public:
    explicit FaceWithoutCharacters(HPDF_FontDef face)
        : cmap_(static_cast<HPDF_TTFontDefAttr>(face->attr)->cmap), own_(cmap_)
    {
        constexpr HPDF_UINT16 segments = 4; // Unicode in ranges
        cmap_ = HPDF_TTF_CmapRange();
        cmap_.format = segments;
        cmap_.seg_count_x2 = 2;
        cmap_.end_count = &last_;
        cmap_.start_count = &last_;
        cmap_.id_delta = &delta_;
        cmap_.id_range_offset = &rangeOffset_;
    }
    ~FaceWithoutCharacters() { cmap_ = own_; }
    FaceWithoutCharacters(const FaceWithoutCharacters &) = delete;
    FaceWithoutCharacters &operator=(const FaceWithoutCharacters &) = delete;

private:
    HPDF_TTF_CmapRange &cmap_;
    HPDF_TTF_CmapRange own_;
    HPDF_UINT16 last_ = 0xFFFF;
    HPDF_INT16 delta_ = 1; ///< gives it the glyph 0, which is that of no character
    HPDF_UINT16 rangeOffset_ = 0;
};

} // namespace

PdfDocument::PdfDocument() : kept_(KeptDocuments::ofProcess().take())
{
    kept_->begin(&PdfDocument::noteError, this);
    document_ = kept_->document();
}

PdfDocument::~PdfDocument()
{
    if (isSaved_) {
        kept_->end();
        KeptDocuments::ofProcess().keep(std::move(kept_));
    }
    kept_.reset(); // what an error leaves is of no use to another PDF
}

void PdfDocument::noteError(HPDF_STATUS error, HPDF_STATUS /*detail*/, void *self)
{
    // The library calls this from its own functions, which clean up after themselves when it comes back.
    auto *document = static_cast<PdfDocument *>(self);
    if (document != nullptr && document->error_ == HPDF_OK) {
        document->error_ = error;
    }
}

bool PdfDocument::expectPages(qint64 pages)
{
    if (isGood() && pages > longestPageList) {
        HPDF_SetPagesConfiguration(document_, pagesPerGroup);
    }
    return isGood();
}

HPDF_Font PdfDocument::loadFace(const PdfFace &face)
{
    const HPDF_FontDef definition = isGood() ? kept_->definitionOf(face) : nullptr;
    if (!isGood() || definition == nullptr) {
        return nullptr;
    }
    const FaceWithoutCharacters bare(definition);
    const HPDF_Font font = HPDF_GetFont(document_, definition->base_font, "UTF-8");
    return isGood() ? font : nullptr;
}

HPDF_Page PdfDocument::addPage()
{
    lastPage_ = isGood() ? HPDF_AddPage(document_) : nullptr;
    return isGood() ? lastPage_ : nullptr;
}

bool PdfDocument::addText(HPDF_Dict dictionary, const char *key, const QString &text)
{
    // In UTF-16, the text strings of a PDF have all characters. The library's own come through an encoding that knows none
    // beyond U+FFFF.
    QByteArray bytes = "\xFE\xFF";
    QStringView shown = QStringView(text).first(std::min(text.size(), longestText));
    if (shown.size() < text.size() && shown.back().isHighSurrogate()) {
        shown.chop(1);
    }
    for (const QChar unit : shown) {
        bytes += static_cast<char>(unit.unicode() >> 8);
        bytes += static_cast<char>(unit.unicode() & 0xFF);
    }
    auto *const value = HPDF_Binary_New(document_->mmgr, reinterpret_cast<HPDF_BYTE *>(bytes.data()),
                                        static_cast<HPDF_UINT>(bytes.size()));
    return value != nullptr && HPDF_Dict_Add(dictionary, key, value) == HPDF_OK;
}

bool PdfDocument::describe(const PdfDetails &details)
{
    if (!isGood()) {
        return false;
    }
    const auto add = [this](const char *key, const QString &text) {
        return text.isEmpty() || addText(document_->info, key, text);
    };
    if (!add("Title", details.title) || !add("Author", details.author) || !add("Creator", details.creator)) {
        return false;
    }
    if (details.created.isValid()) {
        const QByteArray time = details.created.toString(QStringLiteral("'D:'yyyyMMddHHmmss")).toLatin1();
        HPDF_Dict_Add(document_->info, "CreationDate", HPDF_String_New(document_->mmgr, time.constData(), nullptr));
    }
    if (!details.language.isEmpty()) {
        document_->pdf_version = std::max(document_->pdf_version, HPDF_VER_14); // the first one that has it
        HPDF_Dict_Add(document_->catalog, "Lang",
                      HPDF_String_New(document_->mmgr, details.language.toLatin1().constData(), nullptr));
    }
    return isGood();
}

HPDF_Outline PdfDocument::addOutline(HPDF_Outline parent, const QString &text)
{
    const HPDF_Outline outline = isGood() ? HPDF_CreateOutline(document_, parent, "", nullptr) : nullptr;
    return outline != nullptr && addText(outline, "Title", text) && isGood() ? outline : nullptr;
}

bool PdfDocument::showOutline()
{
    return isGood() && HPDF_SetPageMode(document_, HPDF_PAGE_MODE_USE_OUTLINE) == HPDF_OK;
}

bool PdfDocument::addLabel(unsigned sheet, unsigned number, const QByteArray &prefix)
{
    return isGood() &&
           HPDF_AddPageLabel(document_, sheet, HPDF_PAGE_NUM_STYLE_DECIMAL, number, prefix.constData()) == HPDF_OK;
}

bool PdfDocument::save(QIODevice &device)
{
    if (!isGood() || HPDF_SaveToStream(document_) != HPDF_OK || !isGood()) {
        return false;
    }
    // Piece by piece: the library holds the whole of it already.
    HPDF_UINT32 left = HPDF_GetStreamSize(document_);
    std::array<HPDF_BYTE, std::size_t(64) * 1024> piece;
    bool isWritten = left > 0;
    while (isWritten && left > 0) {
        HPDF_UINT32 size = std::min(left, static_cast<HPDF_UINT32>(piece.size()));
        left -= size;
        isWritten = HPDF_ReadFromStream(document_, piece.data(), &size) == HPDF_OK &&
                    device.write(reinterpret_cast<const char *>(piece.data()), size) == qint64(size);
    }
    isSaved_ = isWritten && isGood();
    return isWritten;
}

} // namespace kareport
