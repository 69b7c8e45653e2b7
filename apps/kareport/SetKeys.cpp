#include "SetKeys.h"

namespace kareport
{

namespace
{

struct SetKey
{
    const char *key;
    const char *values; ///< with blanks between them; empty for any
};

constexpr const char *lengths = "m mm km ft usft";
constexpr const char *yesOrNo = "true false";

constexpr SetKey keys[] = {
    {"title", ""},
    {"application", ""},
    {"strict", yesOrNo},
    {"header", yesOrNo},
    {"now", ""},
    {"page.paper", "A4 A3 Letter Legal"},
    {"page.orientation", "portrait landscape"},
    {"page.printer", "default"},
    {"page.resolution", ""},
    {"page.margins", ""},
    {"page.fontName", ""},
    {"page.fontSize", ""},
    {"page.linesPerPage", ""},
    {"page.charsPerRow", ""},
    {"settings.lengthUnit", lengths},
    {"settings.areaUnit", "m2 ha km2 ft2 ac"},
    {"settings.angleUnit", "deg gon rad"},
    {"settings.lengthDecimals", ""},
    {"settings.stationDecimals", ""},
    {"settings.numberDecimals", ""},
    {"settings.stationFormat", "plain 0+00 0+000"},
    {"settings.northEastOrder", "NE EN"},
    {"settings.bearingUnit", "dms deg gon"},
    {"settings.bearingStyle", "quadrant circle"},
    {"settings.bearingDecimals", ""},
    {"settings.bearingPadding", yesOrNo},
    {"settings.bearingReference", "north south"},
    {"options.zeroBlank", yesOrNo},
    {"options.writeTableName", yesOrNo},
    {"options.printHash", yesOrNo},
    {"options.excel", yesOrNo},
    {"options.placeholders", yesOrNo},
    {"options.chainageLabel", ""},
    {"options.separator", ""},
    {"template.file", ""},
    {"template.name", ""},
};

} // namespace

QStringList setKeys(const QString &start)
{
    QStringList list;
    for (const SetKey &row : keys) {
        const QString key = QString::fromLatin1(row.key);
        if (!key.startsWith(start)) {
            continue;
        }
        // A text without words is one empty word.
        for (const QString &value : QString::fromLatin1(row.values).split(u' ')) {
            list.append(key + u'=' + value);
        }
    }
    return list;
}

} // namespace kareport
