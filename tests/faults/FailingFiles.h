#pragma once

#include <QtGlobal>

/// Lets one call of the system for files fail, on this thread. One at a time.
class FailingFiles
{
public:
    enum class Call
    {
        Write,      ///< nothing is written: the disk is full
        ShortWrite, ///< half is written, and nothing from then on
        Flush,      ///< the bytes do not reach the disk
        Rename
    };

    /// @param number  which call from now on fails, from 1; 0 for none
    FailingFiles(Call call, qint64 number);
    ~FailingFiles();
    FailingFiles(const FailingFiles &) = delete;
    FailingFiles &operator=(const FailingFiles &) = delete;

    /// Whether it has failed.
    bool hasFailed() const;
};
