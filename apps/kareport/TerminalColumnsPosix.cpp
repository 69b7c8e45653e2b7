#include "TerminalColumns.h"

#include <sys/ioctl.h>
#include <unistd.h>

namespace kareport
{

int terminalColumns()
{
    winsize size = {};
    return ioctl(STDERR_FILENO, TIOCGWINSZ, &size) == 0 ? size.ws_col : 0;
}

} // namespace kareport
