#pragma once

#include "PdfFaces.h"

#include <QDateTime>
#include <QString>

#include <hpdf.h>

#include <memory>
#include <mutex>
#include <vector>

namespace kareport
{

/// A document of the PDF library, which can be used for one PDF after the other. The faces that were read for one need not be
/// read for the next: that is most of the work of a short PDF. Each PDF has the bytes that a new document gives it.
class KeptDocument
{
public:
    /// Documents with more faces than this, or with larger files of faces, are not kept.
    static constexpr std::size_t mostFaces = 8;
    static constexpr qint64 mostBytes = qint64(64) << 20;

    KeptDocument() = default;
    ~KeptDocument();
    KeptDocument(const KeptDocument &) = delete;
    KeptDocument &operator=(const KeptDocument &) = delete;

    /// Begins a PDF. The library's errors are told to a function with the pointer that belongs to it.
    void begin(HPDF_Error_Handler noteError, void *user);
    /// Ends a PDF that was saved. It must not be called after an error.
    void end();
    /// The document of the library. Null before `begin`, and where memory did not last for it.
    HPDF_Doc document() const { return document_; }

    /// What the library knows of a face of the PDF that was begun: it is read now, or was read for an earlier PDF.
    /// @return null where it cannot be read
    HPDF_FontDef definitionOf(const PdfFace &face);

    /// Whether the files of all its faces are as they were when they were read.
    bool isCurrent() const;
    /// Whether it has few enough faces to be kept.
    bool isSmall() const;

private:
    /// A face that was read. Its definition is in the library's list as long as the PDF has it, and else owned here: the library
    /// would take it for any other face of the same name.
    struct Face
    {
        QString file;
        unsigned index = 0;        ///< in a collection, from 0
        bool isCollection = false; ///< which is read in another way
        QDateTime changed;         ///< when the file was changed last
        qint64 size = 0;           ///< of the file, in bytes
        HPDF_FontDef definition = nullptr;
    };

    HPDF_FontDef readFace(const PdfFace &face);
    HPDF_FontDef useFace(HPDF_FontDef definition);
    void takeFacesOut();

    HPDF_Doc document_ = nullptr;
    std::vector<Face> faces_;
};

/// Keeps the document that ended last. May be used from several threads.
class KeptDocuments
{
public:
    /// What the process keeps.
    static KeptDocuments &ofProcess();

    /// The document that is kept, which is not kept any more then; a new one where there is none, or where the files of its
    /// faces were changed.
    std::unique_ptr<KeptDocument> take();
    /// Keeps a document in the place of the one before, unless it has too many faces.
    void keep(std::unique_ptr<KeptDocument> document);
    /// Keeps none.
    void clear();

private:
    std::mutex lock_;
    std::unique_ptr<KeptDocument> kept_;
};

} // namespace kareport
