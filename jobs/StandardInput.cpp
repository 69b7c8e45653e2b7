#include "StandardInput.h"

#include "Xlate.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>

namespace kareport
{

StandardInput StandardInput::read(std::size_t most)
{
    constexpr std::size_t piece = std::size_t(64) * 1024;
    StandardInput input;
    QByteArray room(piece, '\0');
    for (std::size_t count = 1; count > 0 && static_cast<std::size_t>(input.bytes.size()) < most;) {
        const std::size_t left = most - static_cast<std::size_t>(input.bytes.size());
        errno = 0;
        count = std::fread(room.data(), 1, std::min(piece, left), stdin);
        const int error = errno;
        input.bytes.append(room.constData(), static_cast<qsizetype>(count));
        if (std::ferror(stdin) != 0 && error == EINTR) {
            std::clearerr(stdin); // a signal asks the program to end, which it does in its own time
            count = 1;
        } else if (std::ferror(stdin) != 0) {
            input.error = error != 0 ? error : EIO;
            break;
        }
    }
    return input;
}

QString noStandardInputText()
{
    return Xlate("a window has no standard input: a file was expected");
}

} // namespace kareport
