#include "TerminalColumns.h"

#include <windows.h>

namespace kareport
{

int terminalColumns()
{
    CONSOLE_SCREEN_BUFFER_INFO console = {};
    return GetConsoleScreenBufferInfo(GetStdHandle(STD_ERROR_HANDLE), &console) != FALSE
               ? console.srWindow.Right - console.srWindow.Left + 1
               : 0;
}

} // namespace kareport
