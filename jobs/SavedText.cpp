#include "SavedText.h"

#include "LineEndings.h"
#include "PageHeader.h"
#include "ReportTextDecoder.h"
#include "RichTextReader.h"
#include "UReportDoc.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

/// Reads a report file or plain text.
Expected<SavedText> readPlain(const QString &path, QByteArrayView bytes)
{
    if (bytes.startsWith("%PDF")) {
        return InputError{path, TextPlace(), Xlate("a saved report was expected; this is a PDF")};
    }
    SavedText saved;
    if (const auto place = decodeReportText(bytes, saved.text)) {
        return InputError{path, *place, Xlate("a report file was expected; this is not UTF-8")};
    }
    return saved;
}

Expected<SavedText> readRich(const QString &path, QByteArrayView bytes)
{
    SavedText saved;
    RichTextNotes notes;
    if (const auto error = readRichTextCharacters(bytes, saved.text, &notes)) {
        return InputError{path, error->place, error->text};
    }
    for (QChar &character : saved.text) {
        if (character == QChar::ParagraphSeparator || character == QChar::LineSeparator) {
            character = u'\n';
        }
    }
    if (!saved.text.isEmpty() && !saved.text.endsWith(u'\n')) {
        saved.text += u'\n'; // the last paragraph is a line as well
    }
    saved.text = withCrLf(saved.text);
    saved.warnings = notes.texts();
    return saved;
}

} // namespace

Expected<SavedText> readSavedText(const QString &path, QByteArrayView bytes)
{
    const QByteArrayView richText = richTextIn(bytes);
    return richText.isEmpty() ? readPlain(path, bytes) : readRich(path, richText);
}

std::optional<int> linesOfPages(QStringView text)
{
    return linesBetweenPageHeaders(text);
}

void writeLines(UReportDoc &report, QStringView text)
{
    while (!text.isEmpty()) {
        const qsizetype feed = text.indexOf(u'\n');
        QStringView line = text.first(feed < 0 ? text.size() : feed);
        text = text.sliced(feed < 0 ? text.size() : feed + 1);
        const bool isEnded = feed >= 0 && line.endsWith(u'\r');
        if (isEnded) {
            line.chop(1);
        }
        const bool isBare = feed >= 0 && !isEnded; // a line feed alone stays one
        report.Write(isBare ? line.toString() + u'\n' : line.toString(), 0);
        report.LineFeed(isEnded ? 1 : 0);
    }
}

} // namespace kareport
