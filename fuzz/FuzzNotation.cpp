#include "Notation.h"
#include "NumberText.h"
#include "UDataObject.h"
#include "ValueParser.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <cstdlib>

using kareport::DataUnits;
using kareport::ValueParser;

/// Reads a text as a value of every type, with decimal points and with other marks. What is stored for an offset or a bearing
/// that is noted must be a number.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const std::string_view text(reinterpret_cast<const char *>(data), size);
    DataUnits sexagesimal;
    sexagesimal.sexagesimal = true;
    UDataObject object;
    for (const DataUnits &units : {DataUnits(), sexagesimal}) {
        for (int type = 0; type < 23; ++type) {
            ValueParser parser(type, 1, units);
            parser.store(text, object);
            parser.setNumberStyle({',', "."});
            parser.store(text, object);
            parser.setNumberStyle({'.', "'"});
            parser.store(text, object);
        }
    }
    const auto bearing = kareport::parseBearing(text, 90);
    if (bearing && !std::isfinite(bearing->value)) {
        std::abort();
    }
    const auto angle = kareport::parseMarkedAngle(text);
    if (angle && !std::isfinite(angle->value)) {
        std::abort();
    }
    return 0;
}
