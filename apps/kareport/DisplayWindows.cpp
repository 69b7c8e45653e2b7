#include "Display.h"

namespace kareport
{

bool hasDisplay()
{
    return true;
}

const char *platformWithoutWindows()
{
    // The one without a screen knows no fonts of the system. The library that measures is that of other systems, so that
    // pages are the same.
    return "windows:fontengine=freetype";
}

} // namespace kareport
