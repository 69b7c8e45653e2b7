#include "JobSettings.h"

#include "NearestName.h"
#include "OrientationOrder.h"
#include "Xlate.h"

#include <QJsonArray>

#include <algorithm>
#include <array>
#include <iterator>

namespace kareport
{

namespace
{

/// A word of a setting and the value that it means.
template <typename Value>
struct Word
{
    QStringView word;
    Value value;
};

using StationFormat = UJobSettings::StationFormat;

// In the order in which a message lists them.
constexpr Word<StationFormat> stationFormats[] = {
    {u"plain", StationFormat::Plain}, {u"0+00", StationFormat::HundredsPlus}, {u"0+000", StationFormat::ThousandsPlus}};
constexpr Word<int> northEastOrders[] = {{u"NE", ORDER_NORTHING_EASTING}, {u"EN", ORDER_EASTING_NORTHING}};
// The numbers of a bearing are those that `UFormatBearing` takes.
constexpr Word<int> bearingUnits[] = {{u"dms", 0}, {u"deg", 1}, {u"gon", 2}};
constexpr Word<int> bearingStyles[] = {{u"quadrant", 1}, {u"circle", 0}};
constexpr Word<int> bearingReferences[] = {{u"north", 0}, {u"south", 1}};

constexpr int mostDecimals = 15;
constexpr int mostBearingDecimals = 9;

/// A word that `find` turns into a value. Any other fails the node, with the words that were expected.
template <typename Value, typename Find>
void choose(const JsonNode &node, Find find, const char *expected, Value &value)
{
    if (!node.exists()) {
        return;
    }
    if (const auto found = find(node.text())) {
        value = static_cast<Value>(*found);
    } else {
        node.fail(oneOfExpected(node.text(), QString(QLatin1StringView(expected)).split(QStringLiteral(", "))));
    }
}

/// The same with one of a list of words.
template <typename Entry, std::size_t count, typename Value>
void choose(const JsonNode &node, const Word<Entry> (&words)[count], Value &value)
{
    if (!node.exists()) {
        return;
    }
    const QString text = node.text();
    const auto *found =
        std::find_if(std::begin(words), std::end(words), [&text](const Word<Entry> &one) { return one.word == text; });
    if (found != std::end(words)) {
        value = static_cast<Value>(found->value);
        return;
    }
    QStringList expected;
    for (const Word<Entry> &one : words) {
        expected.append(one.word.toString());
    }
    node.fail(Xlate("one of %1 was expected").arg(expected.join(QStringLiteral(", "))));
}

constexpr const char *lengthKeys = "m, mm, km, ft, usft";
constexpr const char *areaKeys = "m2, ha, km2, ft2, ac";

void readAngleMarks(const JsonNode &node, std::array<char, 3> &marks)
{
    if (!node.exists()) {
        return;
    }
    if (!node.value().isArray() || node.size() != qsizetype(marks.size())) {
        node.fail(Xlate("a list of three texts was expected"));
        return;
    }
    for (std::size_t i = 0; i < marks.size(); ++i) {
        const JsonNode mark = node[qsizetype(i)];
        const QString text = mark.text();
        if (text.size() > 1 || (text.size() == 1 && text[0].unicode() > 255)) {
            mark.fail(Xlate("one character with a code up to 255, or an empty text, was expected"));
        }
        marks[i] = text.isEmpty() ? '\0' : text[0].toLatin1();
    }
}

/// The word of a value; that of the first one for a value that has none.
template <typename Entry, std::size_t count, typename Value>
QString wordOf(const Word<Entry> (&words)[count], Value value)
{
    const auto *found = std::find_if(std::begin(words), std::end(words), [value](const Word<Entry> &one) {
        return static_cast<Value>(one.value) == value;
    });
    return (found != std::end(words) ? found : words)->word.toString();
}

} // namespace

UJobSettings readSettings(const JsonNode &node, UJobSettings settings)
{
    if (!node.expectObject()) {
        return settings;
    }
    node.allowOnly({"lengthUnit", "areaUnit", "angleUnit", "lengthDecimals", "stationDecimals", "numberDecimals",
                    "stationFormat", "northEastOrder", "bearingUnit", "bearingStyle", "bearingDecimals",
                    "bearingPadding", "bearingReference", "angleMarks"});
    choose(node["lengthUnit"], lengthUnitFromKey, lengthKeys, settings.lengthUnit);
    choose(node["areaUnit"], areaUnitFromKey, areaKeys, settings.areaUnit);
    choose(node["angleUnit"], angleUnitFromKey, "deg, gon, rad", settings.angleUnit);
    settings.lengthDecimals = node["lengthDecimals"].whole(settings.lengthDecimals, 0, mostDecimals);
    settings.stationDecimals = node["stationDecimals"].whole(settings.stationDecimals, 0, mostDecimals);
    settings.numberDecimals = node["numberDecimals"].whole(settings.numberDecimals, 0, mostDecimals);
    choose(node["stationFormat"], stationFormats, settings.stationFormat);
    choose(node["northEastOrder"], northEastOrders, settings.northEastOrder);
    choose(node["bearingUnit"], bearingUnits, settings.bearingUnit);
    choose(node["bearingStyle"], bearingStyles, settings.bearingStyle);
    settings.bearingDecimals = node["bearingDecimals"].whole(settings.bearingDecimals, 0, mostBearingDecimals);
    settings.bearingPadding = node["bearingPadding"].boolean(settings.bearingPadding != 0) ? 1 : 0;
    choose(node["bearingReference"], bearingReferences, settings.bearingReference);
    readAngleMarks(node["angleMarks"], settings.angleMarks);
    return settings;
}

QJsonObject settingsToJson(const UJobSettings &settings)
{
    QJsonArray marks;
    for (const char mark : settings.angleMarks) {
        marks.append(mark == 0 ? QString() : QString(QLatin1Char(mark)));
    }
    return {{QStringLiteral("lengthUnit"), keyOf(settings.lengthUnit).toString()},
            {QStringLiteral("areaUnit"), keyOf(settings.areaUnit).toString()},
            {QStringLiteral("angleUnit"), keyOf(settings.angleUnit).toString()},
            {QStringLiteral("lengthDecimals"), settings.lengthDecimals},
            {QStringLiteral("stationDecimals"), settings.stationDecimals},
            {QStringLiteral("numberDecimals"), settings.numberDecimals},
            {QStringLiteral("stationFormat"), wordOf(stationFormats, settings.stationFormat)},
            {QStringLiteral("northEastOrder"), wordOf(northEastOrders, settings.northEastOrder)},
            {QStringLiteral("bearingUnit"), wordOf(bearingUnits, settings.bearingUnit)},
            {QStringLiteral("bearingStyle"), wordOf(bearingStyles, settings.bearingStyle)},
            {QStringLiteral("bearingDecimals"), settings.bearingDecimals},
            {QStringLiteral("bearingPadding"), settings.bearingPadding != 0},
            {QStringLiteral("bearingReference"), wordOf(bearingReferences, settings.bearingReference)},
            {QStringLiteral("angleMarks"), marks}};
}

DataUnits readDataUnits(const JsonNode &node)
{
    DataUnits units;
    if (!node.expectObject()) {
        return units;
    }
    node.allowOnly({"length", "area", "angle"});
    units.isLengthSaid = node["length"].exists();
    units.isAreaSaid = node["area"].exists();
    units.isAngleSaid = node["angle"].exists();
    choose(node["length"], lengthUnitFromKey, lengthKeys, units.length);
    choose(node["area"], areaUnitFromKey, areaKeys, units.area);
    const JsonNode angle = node["angle"];
    units.sexagesimal = angle.isText() && angle.text() == u"dms";
    if (!units.sexagesimal) {
        choose(angle, angleUnitFromKey, "deg, gon, rad, dms", units.angle);
    }
    return units;
}

} // namespace kareport
