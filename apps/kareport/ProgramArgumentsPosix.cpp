#include "ProgramArguments.h"

namespace kareport
{

ProgramArguments ProgramArguments::of(int argc, char **argv)
{
    return {argc, argv};
}

} // namespace kareport
