#pragma once

#include <QByteArray>
#include <QString>

#include <cstddef>

namespace kareport
{

/// What came out of the program's standard input.
struct StandardInput
{
    QByteArray bytes;
    int error = 0; ///< the system's number of what went wrong; 0 when nothing did

    /// Reads until the end, or until so many bytes. It goes through the stream of the C library, as not on every system
    /// can Qt open that of a pipe.
    static StandardInput read(std::size_t most);
};

/// What is wrong with a job that reads standard input and runs in a window, as a sentence that says what was expected.
QString noStandardInputText();

} // namespace kareport
