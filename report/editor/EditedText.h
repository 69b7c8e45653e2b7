#pragma once

#include <QByteArrayView>
#include <QString>

namespace kareport
{

/// The bytes of a text as two-byte characters, low byte first; an odd byte at the end is left out.
QString textOfBytes(QByteArrayView bytes);
/// Replaces by a blank every character that cannot be printed, line ends among them, and takes white space from
/// the end.
QString printableText(const QString &text);
/// Breaks a text after a blank where a line has reached 80 characters: such a break is a bare LF. An LF of the text gets a
/// CR before it.
QString wrappedText(const QString &text);

} // namespace kareport
