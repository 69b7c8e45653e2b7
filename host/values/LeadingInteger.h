#pragma once

#include <QStringView>

namespace kareport
{

/// The decimal integer at the front of a text, after white space and one sign; 0 when there is none. A number outside
/// 32 bits becomes the nearest that fits.
qint32 leadingInteger(QStringView text);

} // namespace kareport
