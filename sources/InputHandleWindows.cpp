#include "InputHandle.h"

#include "WidePathWindows.h"

#include <windows.h>

#include <fcntl.h>
#include <io.h>

#include <algorithm>
#include <cstdio>

namespace kareport
{

namespace
{

HANDLE systemHandle(int handle)
{
    // NOLINTNEXTLINE(performance-no-int-to-ptr): the C library gives it so
    return reinterpret_cast<HANDLE>(_get_osfhandle(handle));
}

} // namespace

int openForReading(const QString &path)
{
    return _wopen(widePath(path).c_str(), _O_RDONLY | _O_BINARY | _O_NOINHERIT);
}

int openStandardInput()
{
    const int handle = _dup(_fileno(stdin));
    if (handle >= 0) {
        _setmode(handle, _O_BINARY);
        SetHandleInformation(systemHandle(handle), HANDLE_FLAG_INHERIT, 0);
    }
    return handle;
}

bool isAtStart(int handle)
{
    // A pipe says how many bytes are waiting when it is asked for a size.
    return GetFileType(systemHandle(handle)) == FILE_TYPE_DISK && _telli64(handle) <= 0;
}

qint64 readSome(int handle, char *to, std::size_t most)
{
    constexpr std::size_t mostAtOnce = std::size_t(1) << 30;
    return _read(handle, to, static_cast<unsigned>(std::min(most, mostAtOnce)));
}

} // namespace kareport
