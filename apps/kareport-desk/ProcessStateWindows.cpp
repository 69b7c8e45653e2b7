#include "ProcessState.h"

#include <windows.h>

namespace kareport
{

bool isProcessRunning(qint64 process)
{
    if (process <= 0) {
        return false;
    }
    HANDLE handle = OpenProcess(SYNCHRONIZE, FALSE, static_cast<DWORD>(process));
    if (handle == nullptr) {
        return GetLastError() == ERROR_ACCESS_DENIED; // another user's exists
    }
    // A process is found after its end as long as any program holds a handle of it.
    const bool isRunning = WaitForSingleObject(handle, 0) == WAIT_TIMEOUT;
    CloseHandle(handle);
    return isRunning;
}

} // namespace kareport
