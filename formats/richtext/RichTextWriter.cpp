#include "RichTextWriter.h"

#include "RichTextTables.h"

#include <QIODevice>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

constexpr qsizetype pieceSize = qsizetype(64) * 1024;

/// Gathers bytes and writes them in pieces.
class Output
{
public:
    explicit Output(QIODevice &device) : device_(device) { bytes_.reserve(2 * pieceSize); }

    QByteArray &bytes() { return bytes_; }
    /// Writes what has been gathered, once that is worthwhile. @return false where it cannot
    bool pass() { return bytes_.size() < pieceSize || flush(); }
    bool flush()
    {
        const bool isWritten = device_.write(bytes_) == bytes_.size();
        bytes_.resize(0);
        return isWritten;
    }

private:
    QIODevice &device_;
    QByteArray bytes_;
};

bool writeText(Output &out, QStringView text)
{
    for (qsizetype at = 0; at < text.size(); at += pieceSize) {
        appendRichText(out.bytes(), text.sliced(at, std::min(pieceSize, text.size() - at)));
        if (!out.pass()) {
            return false;
        }
    }
    return true;
}

} // namespace

bool writeRichText(QIODevice &device, const QTextDocument &document)
{
    const RichTextTables tables(document);
    Output out(device);
    out.bytes() += tables.header();
    int paragraphFormat = -1;
    int characterFormat = -1;
    const auto useCharacters = [&](int format) {
        if (format != characterFormat) {
            characterFormat = format;
            out.bytes() += tables.characterWords(format);
        }
    };
    bool breaksPage = false;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        if (std::exchange(breaksPage, false)) {
            out.bytes() += "\\page\r\n";
        }
        if (block.blockFormatIndex() != paragraphFormat) {
            paragraphFormat = block.blockFormatIndex();
            out.bytes() += tables.paragraphWords(paragraphFormat);
            // Whatever follows, the last word ends here.
            characterFormat = -1;
        }
        // Once for each block: it is what takes the longest here.
        auto at = block.begin();
        if (at.atEnd()) {
            useCharacters(block.charFormatIndex());
        }
        for (; !at.atEnd(); ++at) {
            const QTextFragment fragment = at.fragment();
            useCharacters(fragment.charFormatIndex());
            const bool isText = fragment.charFormat().objectType() == QTextFormat::NoObject;
            if (isText && !writeText(out, fragment.text())) {
                return false;
            }
        }
        out.bytes() += "\\par\r\n";
        breaksPage = block.blockFormat().pageBreakPolicy().testFlag(QTextFormat::PageBreak_AlwaysAfter);
        if (!out.pass()) {
            return false;
        }
    }
    out.bytes() += "}\r\n";
    return out.flush();
}

} // namespace kareport
