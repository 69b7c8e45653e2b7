#pragma once

class QIODevice;
class QTextDocument;

namespace kareport
{

/// Writes the text and the formats of a document to an open device as a whole rich-text file (RTF) of 7-bit characters.
/// Tables are written as paragraphs, their cells with tabs between; pictures are left out. The same document gives the
/// same bytes.
/// @return false as soon as a write fails
bool writeRichText(QIODevice &device, const QTextDocument &document);

} // namespace kareport
