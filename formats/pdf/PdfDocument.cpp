#include "PdfDocument.h"

#include <QFile>
#include <QIODevice>

#include <algorithm>
#include <array>

namespace kareport
{

namespace
{

/// The most pages that the library keeps in one list.
constexpr qint64 longestPageList = 32767;
constexpr HPDF_UINT pagesPerGroup = 1000;

} // namespace

PdfDocument::PdfDocument() : document_(HPDF_New(&PdfDocument::noteError, this))
{
    if (document_ != nullptr) {
        HPDF_UseUTFEncodings(document_);
        HPDF_SetCurrentEncoder(document_, "UTF-8");
        HPDF_SetCompressionMode(document_, HPDF_COMP_ALL);
    }
}

PdfDocument::~PdfDocument()
{
    if (document_ != nullptr) {
        HPDF_Free(document_);
    }
}

void PdfDocument::noteError(HPDF_STATUS error, HPDF_STATUS /*detail*/, void *self)
{
    // The library calls this from its own functions, which clean up after themselves when it comes back.
    auto *document = static_cast<PdfDocument *>(self);
    if (document->error_ == HPDF_OK) {
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
    if (!isGood()) {
        return nullptr;
    }
    const QByteArray file = QFile::encodeName(face.file());
    const char *name = face.isCollection()
                           ? HPDF_LoadTTFontFromFile2(document_, file.constData(), face.index(), HPDF_TRUE)
                           : HPDF_LoadTTFontFromFile(document_, file.constData(), HPDF_TRUE);
    const HPDF_Font font = name != nullptr ? HPDF_GetFont(document_, name, "UTF-8") : nullptr;
    return isGood() ? font : nullptr;
}

HPDF_Page PdfDocument::addPage()
{
    const HPDF_Page page = isGood() ? HPDF_AddPage(document_) : nullptr;
    return isGood() ? page : nullptr;
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
    return isWritten;
}

} // namespace kareport
