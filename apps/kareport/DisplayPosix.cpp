#include "Display.h"

#include <QtGlobal>

namespace kareport
{

bool hasDisplay()
{
    return qEnvironmentVariableIsSet("QT_QPA_PLATFORM") || !qEnvironmentVariableIsEmpty("DISPLAY") ||
           !qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY");
}

const char *platformWithoutWindows()
{
    return "offscreen";
}

} // namespace kareport
