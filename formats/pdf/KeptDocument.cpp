#include "KeptDocument.h"

#include "FaceFiles.h"

#include <QFileInfo>

#include <hpdf_doc.h>
#include <hpdf_fontdef.h>
#include <hpdf_list.h>

#include <algorithm>
#include <numeric>
#include <utility>

namespace kareport
{

void countFaceTag(HPDF_BYTE *tag)
{
    if (tag[0] == 0) {
        std::copy_n("HPDFAA", HPDF_TTF_FONT_TAG_LEN, tag);
        return;
    }
    for (int i = HPDF_TTF_FONT_TAG_LEN - 1; i >= 0; --i) {
        if (tag[i] != 'Z') {
            ++tag[i];
            return;
        }
        tag[i] = 'A';
    }
}

KeptDocument::~KeptDocument()
{
    if (document_ != nullptr) {
        HPDF_FreeDoc(document_);
        takeFacesOut();
        for (const Face &face : faces_) {
            HPDF_FontDef_Free(face.definition);
        }
        HPDF_Free(document_);
    }
}

void KeptDocument::begin(HPDF_Error_Handler noteError, void *user)
{
    if (document_ == nullptr) {
        document_ = HPDF_New(noteError, user);
        if (document_ == nullptr) {
            return;
        }
        HPDF_UseUTFEncodings(document_);
    } else {
        document_->error.user_data = user;
        HPDF_NewDoc(document_);
    }
    HPDF_SetCurrentEncoder(document_, "UTF-8");
    HPDF_SetCompressionMode(document_, HPDF_COMP_ALL);
}

void KeptDocument::end()
{
    HPDF_FreeDoc(document_);
    takeFacesOut();
    document_->error.user_data = nullptr;
}

/// Leaves no face in the library's list.
void KeptDocument::takeFacesOut()
{
    for (const Face &face : faces_) {
        HPDF_List_Remove(document_->fontdef_list, face.definition);
    }
}

HPDF_FontDef KeptDocument::definitionOf(const PdfFace &face)
{
    const auto read = std::find_if(faces_.begin(), faces_.end(), [&face](const Face &other) {
        return other.file == face.file() && other.index == face.index() && other.isCollection == face.isCollection();
    });
    return read != faces_.end() ? useFace(read->definition) : readFace(face);
}

HPDF_FontDef KeptDocument::readFace(const PdfFace &face)
{
    if (!face.isFont()) {
        return nullptr; // the library takes the first bytes of any file for sizes
    }
    faces_.reserve(faces_.size() + 1); // nothing fails once the library has it
    const QFileInfo file(face.file());
    Face read = {face.file(), face.index(), face.isCollection(), file.lastModified(), file.size(), nullptr};
    const char *const name = embedFaceFile(document_, face);
    read.definition = name != nullptr ? HPDF_Doc_FindFontDef(document_, name) : nullptr;
    // The library has one face of each name, whatever file it is from.
    const bool isKnown = std::any_of(faces_.begin(), faces_.end(),
                                     [&read](const Face &other) { return other.definition == read.definition; });
    if (read.definition != nullptr && !isKnown) {
        faces_.push_back(read);
    }
    return read.definition;
}

/// Does what the library does with a face that it has read.
HPDF_FontDef KeptDocument::useFace(HPDF_FontDef definition)
{
    if (const HPDF_FontDef used = HPDF_Doc_FindFontDef(document_, definition->base_font)) {
        return used;
    }
    if (HPDF_List_Add(document_->fontdef_list, definition) != HPDF_OK) {
        return nullptr;
    }
    countFaceTag(document_->ttfont_tag);
    HPDF_TTFontDef_SetTagName(definition, reinterpret_cast<char *>(document_->ttfont_tag));
    return definition;
}

bool KeptDocument::isCurrent() const
{
    return std::all_of(faces_.begin(), faces_.end(), [](const Face &face) {
        const QFileInfo file(face.file);
        return file.lastModified() == face.changed && file.size() == face.size;
    });
}

bool KeptDocument::isSmall() const
{
    const qint64 bytes = std::accumulate(faces_.begin(), faces_.end(), qint64(0),
                                         [](qint64 sum, const Face &face) { return sum + face.size; });
    return faces_.size() <= mostFaces && bytes <= mostBytes;
}

KeptDocuments &KeptDocuments::ofProcess()
{
    static KeptDocuments documents;
    return documents;
}

std::unique_ptr<KeptDocument> KeptDocuments::take()
{
    std::unique_ptr<KeptDocument> document;
    {
        const std::lock_guard held(lock_);
        document = std::move(kept_);
    }
    return document && document->isCurrent() ? std::move(document) : std::make_unique<KeptDocument>();
}

void KeptDocuments::keep(std::unique_ptr<KeptDocument> document)
{
    if (!document->isSmall()) {
        return;
    }
    const std::lock_guard held(lock_);
    std::swap(kept_, document); // the one before is freed without the lock
}

void KeptDocuments::clear()
{
    const std::lock_guard held(lock_);
    kept_.reset();
}

} // namespace kareport
