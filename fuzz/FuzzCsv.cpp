#include "CsvReader.h"
#include "UDataObject.h"
#include "ValueParser.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const std::string_view bytes(reinterpret_cast<const char *>(data), size);
    const char first = size > 0 ? static_cast<char>(data[0]) : ',';
    kareport::CsvReader::Layout layout;
    layout.delimiter = first == ';' ? ';' : ',';
    layout.whitespace = first == ' ';
    if (first == '#') {
        layout.comment = '#';
        layout.passesBlankLines = true;
        layout.skip = 1;
    }
    kareport::CsvReader reader(QStringLiteral("fuzz.csv"), bytes, layout);
    kareport::DataUnits sexagesimal;
    sexagesimal.sexagesimal = true;
    UDataObject object;
    std::size_t rows = 0;
    while (reader.next()) {
        ++rows;
        int type = 0;
        for (const std::string_view cell : reader.cells()) {
            kareport::ValueParser(type % 23, static_cast<unsigned>(type), sexagesimal).store(cell, object);
            kareport::ValueParser(type % 23, static_cast<unsigned>(type), {}).store(cell, object);
            ++type;
        }
    }
    if (reader.error()) {
        reader.error()->message();
        if (!reader.error()->place || reader.error()->place->line < 1 || reader.error()->place->column < 1) {
            std::abort();
        }
    }
    return 0;
}
