#include "CsvObjectList.h"
#include "JsonFileList.h"
#include "VariableType.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

using namespace kareport;

namespace
{

std::optional<ValueParser> findVariable(const QString &name)
{
    if (name.isEmpty() || name.size() > 12) {
        return std::nullopt;
    }
    const int type = name.front().unicode() % 23;
    return ValueParser(type, name.front().unicode(), DataUnits());
}

/// A dialect that a byte stands for.
CsvDialect dialectOf(unsigned char byte)
{
    CsvDialect dialect;
    dialect.kind = static_cast<DelimiterKind>(byte % 3);
    dialect.encoding = static_cast<TextEncoding>(byte / 3 % 4);
    dialect.delimiter = ';';
    dialect.hasHeader = byte % 2 == 0;
    dialect.order = byte % 5 == 0 ? QStringLiteral("PN-Z") : QString();
    if (byte % 7 == 0) {
        dialect.numbers = {',', "."};
        dialect.comment = '#';
        dialect.passesBlankLines = true;
        dialect.skip = 1;
    }
    return dialect;
}

void readAll(RowObjectList &list)
{
    if (list.GetAt(0) != nullptr) {
        list.Sort({78, 80});
    }
    for (std::size_t i = 0; list.GetAt(i) != nullptr; ++i) {
    }
    if (list.error() && list.error()->text.isEmpty()) {
        std::abort();
    }
}

} // namespace

/// Reads a file of rows and cells in the dialect that its first byte says, or JSON.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    if (size == 0) {
        return 0;
    }
    SpooledBytes bytes;
    bytes.append({reinterpret_cast<const char *>(data) + 1, size - 1});
    const auto made = FileBytes::ofSpooled(QStringLiteral("fuzz"), std::move(bytes));
    const auto &file = std::get<std::shared_ptr<const FileBytes>>(made);
    if (data[0] == 'J') {
        JsonFileList list(file, {}, {findVariable, {}}, {});
        readAll(list);
    } else {
        CsvObjectList list(file, dialectOf(data[0]), {findVariable, {}}, {});
        readAll(list);
    }
    return 0;
}
