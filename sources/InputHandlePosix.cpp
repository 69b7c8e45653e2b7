#include "InputHandle.h"

#include "Interrupt.h"

#include <QFile>

#include <cerrno>
#include <fcntl.h>
#include <unistd.h>

namespace kareport
{

int openForReading(const QString &path)
{
    // Qt's own opening goes on waiting for a pipe's writer when a signal comes.
    int handle = -1;
    do {
        handle = ::open(QFile::encodeName(path).constData(), O_RDONLY | O_CLOEXEC);
    } while (handle < 0 && errno == EINTR && !isInterrupted());
    return handle;
}

int openStandardInput()
{
    return ::fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, 0);
}

bool isAtStart(int handle)
{
    return ::lseek(handle, 0, SEEK_CUR) <= 0;
}

qint64 readSome(int handle, char *to, std::size_t most)
{
    ssize_t count = -1;
    do {
        count = ::read(handle, to, most);
    } while (count < 0 && errno == EINTR && !isInterrupted());
    return count;
}

} // namespace kareport
