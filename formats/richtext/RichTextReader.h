#pragma once

#include "TextPlaces.h"

#include <QByteArrayView>
#include <QLatin1StringView>
#include <QString>
#include <QStringList>
#include <QStringView>

#include <optional>

class QTextDocument;

namespace kareport
{

/// What a rich text holds that is not shown.
struct RichTextNotes
{
    int pictures = 0;
    int objects = 0;   ///< embedded or linked; the text that takes its place is shown
    int footnotes = 0; ///< and endnotes and annotations
    int headers = 0;   ///< page headers and footers
    int hidden = 0;    ///< texts that are marked as hidden
    int signs = 0;     ///< characters of symbol fonts that are not known; they are shown as private characters

    /// A sentence for a person about each kind that was skipped; empty where all is shown.
    QStringList texts() const;
};

/// Why a rich text could not be read to its end.
struct RichTextError
{
    TextPlace place; ///< lines end with LF; columns are bytes of a file, or characters of a text
    QString text;    ///< one sentence that says what was expected
};

/// Whether the bytes or the text begin as a rich text does: with "{\rtf".
bool isRichText(QByteArrayView bytes);
bool isRichText(QStringView text);
bool isRichText(QLatin1StringView text);

/// The rich text of a file, whatever it is called: it may begin with a byte-order mark or white space. Empty when it is
/// none.
QByteArrayView richTextIn(QByteArrayView bytes);

/// Reads the bytes of a rich-text file (RTF) into a document, whose content is replaced. Bytes from 0x80 on are read in the
/// code page of the current font, else of the file. What is after the end of the outermost group is not read.
/// Headers, footers, notes, pictures, objects and hidden text are skipped and counted in `notes`.
/// The signs of the fonts Symbol and Wingdings become the characters that Unicode has for them.
/// The document keeps no undo steps of what is read.
/// @return what is wrong, the document then holds what was read up to there; nothing where all was read
std::optional<RichTextError> readRichText(QByteArrayView bytes, QTextDocument &document,
                                          RichTextNotes *notes = nullptr);
/// Reads the characters alone, as the document's `toRawText` has them: several times faster. That memory has ended is an
/// error as well.
std::optional<RichTextError> readRichTextCharacters(QByteArrayView bytes, QString &text,
                                                    RichTextNotes *notes = nullptr);
/// Reads into a document a rich text in memory, in which characters from U+0080 on are themselves.
std::optional<RichTextError> readRichText(QStringView text, QTextDocument &document, RichTextNotes *notes = nullptr);

} // namespace kareport
