#pragma once

#include "AppMessageBox.h"
#include "KaReportExport.h"

#include <QString>

class QLabel;
class QWidget;

namespace kareport
{

// Titles, names of files and the contents of files come from anywhere. Qt's labels, message boxes and tool tips take a text
// that looks like HTML for HTML and open the pictures that it names: a text that is not the program's own is shown through
// one of these.

/// Shows a message in a box and waits for the answer. Its texts are shown literally. The Escape key answers `Cancel`.
KAREPORT_EXPORT MessageAnswer showMessageBox(QWidget *parent, const Message &message);

/// A label that shows its text literally. The caller owns it until it has a parent.
KAREPORT_EXPORT QLabel *plainLabel(const QString &text = QString(), QWidget *parent = nullptr);

/// Makes all labels in a window show their texts literally: for windows that Qt makes itself.
KAREPORT_EXPORT void keepLabelsPlain(const QWidget &window);

/// A text for a tool tip that is shown literally.
KAREPORT_EXPORT QString plainToolTip(const QString &text);

/// A text for a menu entry that is shown literally: an ampersand in it does not mark a key, and a tab does not begin the column
/// of the keys.
KAREPORT_EXPORT QString plainMenuText(const QString &text);

} // namespace kareport
