#include "PdfDocument.h"

#include <QFile>
#include <QIODevice>

#include <memory>

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
    HPDF_UINT32 size = HPDF_GetStreamSize(document_);
    if (size == 0) {
        return false;
    }
    const std::unique_ptr<HPDF_BYTE[]> bytes(new (std::nothrow) HPDF_BYTE[size]);
    if (!bytes || HPDF_ReadFromStream(document_, bytes.get(), &size) != HPDF_OK) {
        return false;
    }
    return device.write(reinterpret_cast<const char *>(bytes.get()), size) == qint64(size);
}

} // namespace kareport
