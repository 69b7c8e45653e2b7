#include "PointGeometry.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const std::string_view bytes(reinterpret_cast<const char *>(data), size);
    for (const auto &read :
         {kareport::parseGeoPackagePoint(bytes), kareport::parseWkbPoint(bytes), kareport::parseHexPoint(bytes)})
    {
        const QString *fault = std::get_if<QString>(&read);
        if (fault != nullptr && fault->isEmpty()) {
            std::abort();
        }
    }
    return 0;
}
