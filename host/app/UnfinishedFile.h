#pragma once

namespace kareport
{

/// Remembers the name of a file that is written next to its target, so that a program that is ended by a
/// signal can take it away. A file without a name, as most file systems have, vanishes by itself.
class UnfinishedFile
{
public:
    /// @param handle  of the open file
    explicit UnfinishedFile(int handle);
    ~UnfinishedFile();
    UnfinishedFile(const UnfinishedFile &) = delete;
    UnfinishedFile &operator=(const UnfinishedFile &) = delete;

    /// Takes away the file that is being written, if any. It may be called by a signal's handler.
    static void remove();

private:
    int handle_ = -1; ///< that it remembers the name of
};

} // namespace kareport
