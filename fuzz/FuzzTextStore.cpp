#include "TextStoreModel.h"

#include <cstdio>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const std::vector<textstore::Step> steps = textstore::stepsOf(data, size);
    if (textstore::violationOf(steps)) {
        std::fputs(textstore::reportOf(textstore::shortest(steps)).c_str(), stderr);
        std::abort();
    }
    return 0;
}
