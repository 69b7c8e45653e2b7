#include "TextMirrors.h"

#include "ReportWindow.h"
#include "UDocument.h"

namespace kareport
{

bool TextMirrors::textWritten(QStringView text, int style)
{
    const bool isTaken = whileMemoryLasts(false, [&] {
        // The window is notified first: a host's window may look at the rich text, which then ends before the piece.
        // It takes nothing back, so a piece that the rich text has no memory for stays in the window alone.
        if (window != nullptr) {
            window->WriteLine(text.toString());
        }
        return image.write(text, style, imageForm);
    });
    if (isTaken) {
        document_.SetModifiedFlag(true);
    }
    return isTaken;
}

bool TextMirrors::lineEnded()
{
    document_.SetModifiedFlag(true);
    return image.write({}, 0, imageForm);
}

void TextMirrors::changed()
{
    document_.SetModifiedFlag(true);
}

} // namespace kareport
