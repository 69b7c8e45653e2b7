#pragma once

#include "KeptDocument.h"
#include "PdfDetails.h"
#include "PdfFaces.h"

#include <QByteArray>

#include <hpdf.h>

#include <memory>

class QIODevice;

namespace kareport
{

/// A PDF in the making. The first error of the library ends it: what is asked afterwards answers false.
class PdfDocument
{
public:
    PdfDocument();
    ~PdfDocument();
    PdfDocument(const PdfDocument &) = delete;
    PdfDocument &operator=(const PdfDocument &) = delete;

    bool isGood() const { return document_ != nullptr && error_ == HPDF_OK; }
    /// The library's number of the first error; 0 without one.
    HPDF_STATUS error() const { return error_; }

    /// Prepares for so many pages. To be called before the first page.
    bool expectPages(qint64 pages);
    /// Embeds a face for texts in UTF-8. @return null when the file is missing or is not a font
    HPDF_Font loadFace(const PdfFace &face);
    /// @return null after an error
    HPDF_Page addPage();
    /// The page that was added last; null before the first.
    HPDF_Page lastPage() const { return lastPage_; }
    /// Says what the document is. @return false after an error
    bool describe(const PdfDetails &details);
    /// Adds an entry to the outline, as the last one of its parent. @param parent  null for the outline itself
    /// @return null after an error
    HPDF_Outline addOutline(HPDF_Outline parent, const QString &text);
    /// Has viewers show the outline beside the pages. @return false after an error
    bool showOutline();
    /// Numbers the sheets from one on. @param sheet  from 0. @return false after an error
    bool addLabel(unsigned sheet, unsigned number, const QByteArray &prefix);
    /// Writes the finished document to an open device. @return false after an error of the library or of the device
    bool save(QIODevice &device);

private:
    static void noteError(HPDF_STATUS error, HPDF_STATUS detail, void *self);

    bool addText(HPDF_Dict dictionary, const char *key, const QString &text);

    std::unique_ptr<KeptDocument> kept_;
    HPDF_Doc document_ = nullptr;
    bool isSaved_ = false;
    HPDF_Page lastPage_ = nullptr;
    HPDF_STATUS error_ = HPDF_OK;
};

} // namespace kareport
