#include "BenchProfile.h"

#include "Profile.h"

namespace kareport
{

void useBenchProfile()
{
    setProfileStore(makeMemoryProfile());
}

} // namespace kareport
