#include "LandXmlList.h"
#include "VariableType.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace
{

using namespace kareport;

/// Reads a list of a file through, sorts it, and reads it again.
void readThrough(const std::shared_ptr<const FileBytes> &file, const LandXmlQuery &query)
{
    constexpr std::size_t most = 5000;
    unsigned id = 0;
    const std::vector<LandXmlVariable> variables = LandXmlList::variables(query);
    const auto find = [&](const QString &name) -> std::optional<ValueParser> {
        for (const LandXmlVariable &variable : variables) {
            if (variable.name == name) {
                return ValueParser(variable.type, ++id, LandXmlList::units());
            }
        }
        return std::nullopt;
    };
    LandXmlList list(file, query, find, {});
    std::size_t rows = 0;
    while (rows < most && list.GetAt(rows) != nullptr) {
        ++rows;
    }
    const auto error = list.error();
    if (error && error->place && (error->place->line < 1 || error->place->column < 1)) {
        std::abort();
    }
    if (rows < most) {
        list.notes();
        list.Sort({3, 1});
        std::size_t sorted = 0;
        while (list.GetAt(sorted) != nullptr) {
            ++sorted;
        }
        if (!error && sorted != rows) {
            std::abort(); // sorting loses no row
        }
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char *>(data), static_cast<qsizetype>(size));
    const auto file = FileBytes::holding(QStringLiteral("fuzz.xml"), bytes);
    for (const char *key : {"points", "surfacePoints", "parcels", "courses", "alignments", "elements", "stations",
                            "profile", "crossSections", "offsetsOf"})
    {
        LandXmlQuery query;
        query.kind = *landXmlListFromKey(QString::fromLatin1(key));
        query.interval = 10;
        query.fromRound = size % 2 == 0;
        query.offsets = {{-5, -2.5}, {5, std::nullopt}};
        query.stations = {0, 100.5};
        readThrough(file, query);
    }
    return 0;
}
