#pragma once

#include "KaReportExport.h"

#include <QByteArrayView>
#include <QString>

namespace kareport
{

/// The bytes of a text as two-byte characters, low byte first; an odd byte at the end is left out.
KAREPORT_EXPORT QString textOfBytes(QByteArrayView bytes);
/// Puts a blank in the place of every character that cannot be printed, line ends among them, and takes white space from
/// the end.
KAREPORT_EXPORT QString printableText(const QString &text);
/// Breaks a text after a blank where a line has reached 80 characters: such a break is a bare LF. An LF of the text gets a
/// CR before it.
KAREPORT_EXPORT QString wrappedText(const QString &text);

} // namespace kareport
