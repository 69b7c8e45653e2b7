#include "RichTextReader.h"
#include "RichTextWriter.h"

#include <QBuffer>
#include <QGuiApplication>
#include <QTextDocument>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace
{

void check(bool holds)
{
    if (!holds) {
        std::abort();
    }
}

void checkError(const std::optional<kareport::RichTextError> &error)
{
    check(!error || (error->place.line >= 1 && error->place.column >= 1 && !error->text.isEmpty()));
}

/// What has been read is written, and reading that gives the same text.
void checkRoundTrip(const QTextDocument &document)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    check(kareport::writeRichText(buffer, document));
    QTextDocument again;
    check(!kareport::readRichText(QByteArrayView(buffer.data()), again));
    check(again.toRawText() == document.toRawText());
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    // Documents have fonts, which need an application; a window is never shown.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    static int count = 1;
    static char name[] = "FuzzRichText";
    static char *arguments[] = {name, nullptr};
    static const QGuiApplication application(count, arguments);

    const QByteArrayView bytes(data, static_cast<qsizetype>(size));
    kareport::RichTextNotes notes;
    QTextDocument document;
    checkError(kareport::readRichText(bytes, document, &notes));
    check(notes.texts().size() <= 6);
    check(document.characterCount() <= 2 * static_cast<int>(size) + 1); // a byte may be a sign of two halves
    checkRoundTrip(document);
    checkError(kareport::readRichText(QString::fromUtf8(bytes), document, &notes));
    checkRoundTrip(document);
    return 0;
}
