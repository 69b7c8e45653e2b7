#include "RichTextReader.h"

#include "MemoryLasts.h"
#include "RichTextParser.h"
#include "StandardText.h"
#include "Xlate.h"

#include <QStringEncoder>
#include <QTextDocument>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr char beginning[] = "{\\rtf";

TextPlace placeOf(QByteArrayView bytes, qsizetype position, RichTextRawBytes rawBytes)
{
    const QByteArrayView before = bytes.first(position);
    const QByteArrayView line = before.sliced(before.lastIndexOf('\n') + 1);
    const auto continues = std::count_if(line.begin(), line.end(), [rawBytes](char byte) {
        return rawBytes == RichTextRawBytes::Utf8 && (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
    });
    return {before.count('\n') + 1, line.size() - continues + 1};
}

/// @param target  a document, or a text
template <typename Target>
std::optional<RichTextError> readBytes(QByteArrayView bytes, RichTextRawBytes rawBytes, Target &target,
                                       RichTextNotes *notes)
{
    if (notes != nullptr) {
        *notes = {};
    }
    if (!isRichText(bytes)) {
        target.clear();
        return RichTextError{{},
                             Xlate("a rich text that begins with %1 was expected").arg(QLatin1StringView(beginning))};
    }
    RichTextParser parser(bytes, rawBytes, target);
    const QString error = parser.read();
    if (notes != nullptr) {
        *notes = parser.notes();
    }
    if (error.isEmpty()) {
        return std::nullopt;
    }
    return RichTextError{placeOf(bytes, parser.position(), rawBytes), error};
}

} // namespace

QStringList RichTextNotes::texts() const
{
    QStringList sentences;
    const auto add = [&sentences](int count, const QString &sentence) {
        if (count > 0) {
            sentences.append(sentence.arg(count));
        }
    };
    add(pictures, Xlate("Pictures are not shown: %1."));
    add(objects, Xlate("Embedded objects and drawings are not shown: %1."));
    add(footnotes, Xlate("Footnotes and comments are not shown: %1."));
    add(headers, Xlate("Page headers and footers are not shown: %1."));
    add(hidden, Xlate("Hidden text is not shown: %1."));
    add(signs, Xlate("Characters of symbol fonts are not known: %1."));
    return sentences;
}

bool isRichText(QByteArrayView bytes)
{
    return bytes.startsWith(beginning);
}

bool isRichText(QStringView text)
{
    return text.startsWith(QLatin1StringView(beginning));
}

bool isRichText(QLatin1StringView text)
{
    return text.startsWith(QLatin1StringView(beginning));
}

QByteArrayView richTextIn(QByteArrayView bytes)
{
    constexpr QByteArrayView mark("\xEF\xBB\xBF");
    const QByteArrayView text = bytes.sliced(bytes.startsWith(mark) ? mark.size() : 0).trimmed();
    return isRichText(text) ? bytes.sliced(text.data() - bytes.data()) : QByteArrayView();
}

std::optional<RichTextError> readRichText(QByteArrayView bytes, QTextDocument &document, RichTextNotes *notes)
{
    return readBytes(bytes, RichTextRawBytes::CodePage, document, notes);
}

std::optional<RichTextError> readRichTextCharacters(QByteArrayView bytes, QString &text, RichTextNotes *notes)
{
    std::optional<RichTextError> error;
    if (!doneWhileMemoryLasts([&] { error = readBytes(bytes, RichTextRawBytes::CodePage, text, notes); })) {
        error = RichTextError{{}, noMemoryText()};
    }
    return error;
}

std::optional<RichTextError> readRichText(QStringView text, QTextDocument &document, RichTextNotes *notes)
{
    QStringEncoder encode(QStringEncoder::Utf8);
    const QByteArray bytes = encode(text);
    return readBytes(bytes, RichTextRawBytes::Utf8, document, notes);
}

} // namespace kareport
