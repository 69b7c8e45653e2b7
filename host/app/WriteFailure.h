#pragma once

#include <QString>

namespace kareport
{

/// Why no more can be written to a file of which a part was written: it tries with one byte more. Empty when that can be
/// written.
QString whyWritingFails(int handle);

/// Waits until what was written to a file is on its disk. @return why it could not be stored; empty when it was, or when
/// the file system cannot say
QString whySyncFails(int handle);

} // namespace kareport
