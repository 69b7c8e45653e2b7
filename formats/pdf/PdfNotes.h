#pragma once

#include "KaReportExport.h"

#include <QString>
#include <QStringList>

#include <vector>

namespace kareport
{

/// A character that no face of the system has.
struct MissingCharacter
{
    char32_t character = 0; ///< its code point
    qint64 count = 0;       ///< how often it is in the report
    qint64 firstLine = 0;   ///< where it is first, from 1
};

/// Lines that are too wide for a page.
struct PdfWideLines
{
    qint64 count = 0;     ///< lines
    qint64 firstLine = 0; ///< the first of them, from 1
    double points = 0;    ///< the type size that they led to
};

/// The remarks on a PDF.
struct KAREPORT_EXPORT PdfNotes
{
    PdfWideLines reduced;                  ///< lines that made the type of the whole PDF smaller
    PdfWideLines broken;                   ///< lines that still had to be broken
    std::vector<MissingCharacter> missing; ///< in the order in which they occur; U+FFFD or "?" takes their place
    QString problem;                       ///< one sentence, when the PDF could not be made

    /// A sentence about a missing character.
    static QString sentenceOf(const MissingCharacter &missing);
    /// Sentences about wide lines and missing characters, for a person.
    QStringList warnings() const;
};

} // namespace kareport
