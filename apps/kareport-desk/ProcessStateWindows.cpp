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
    // What somebody still holds a handle of is found after its end.
    const bool isRunning = WaitForSingleObject(handle, 0) == WAIT_TIMEOUT;
    CloseHandle(handle);
    return isRunning;
}

} // namespace kareport
