#pragma once

#include <QString>

namespace kareport
{

/// Why no more can be written to a file of which a part was written: it tries with one byte more. Empty when that can be
/// written.
QString whyWritingFails(int handle);

} // namespace kareport
