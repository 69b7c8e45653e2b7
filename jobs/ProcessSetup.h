#pragma once

namespace kareport
{

/// Makes the process independent of what its caller left to it. It comes before anything is opened.
///
/// Closed descriptors of standard input, output and error are taken, so that no file that is opened later becomes one of
/// them, and in the wrong direction, so that using them fails as it would have. A file that grows beyond the user's limit is
/// a failed write, as on a full disk, and not the end of the process.
void prepareProcess();

/// Whether standard output leads to a pipe without a reader.
bool isOutputReaderGone();

/// Lets Qt use the faces that come with the programs, where no package of the system brings them. An application must be
/// there.
void addShippedFaces();

} // namespace kareport
