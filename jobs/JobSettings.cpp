#include "JobSettings.h"

#include "OrientationOrder.h"
#include "Xlate.h"

#include <QJsonArray>

#include <array>

namespace kareport
{

namespace
{

// The words of settings, in the order of the values that they mean.
constexpr std::array<QStringView, 3> stationFormats = {u"plain", u"0+00", u"0+000"};
constexpr std::array<QStringView, 2> northEastOrders = {u"EN", u"NE"};
constexpr std::array<QStringView, 3> bearingUnits = {u"dms", u"deg", u"gon"};
constexpr std::array<QStringView, 2> bearingStyles = {u"circle", u"quadrant"};
constexpr std::array<QStringView, 2> bearingReferences = {u"north", u"south"};

static_assert(static_cast<std::size_t>(UJobSettings::StationFormat::ThousandsPlus) + 1 == stationFormats.size() &&
                  static_cast<int>(UJobSettings::StationFormat::Plain) == 0 &&
                  static_cast<int>(UJobSettings::StationFormat::HundredsPlus) == 1,
              "a word for each station format, in their order");
static_assert(ORDER_EASTING_NORTHING == 0 && ORDER_NORTHING_EASTING == 1);

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
        node.fail(Xlate("one of %1 was expected").arg(QLatin1StringView(expected)));
    }
}

/// Finds a word's place in a list.
template <std::size_t count>
auto placeIn(const std::array<QStringView, count> &words)
{
    return [&words](const QString &text) -> std::optional<int> {
        for (std::size_t i = 0; i < count; ++i) {
            if (words[i] == text) {
                return static_cast<int>(i);
            }
        }
        return std::nullopt;
    };
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

/// The word of a value.
template <typename Words, typename Value>
QString wordOf(const Words &words, Value value)
{
    return words[static_cast<std::size_t>(value)].toString();
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
    choose(node["stationFormat"], placeIn(stationFormats), "plain, 0+00, 0+000", settings.stationFormat);
    choose(node["northEastOrder"], placeIn(northEastOrders), "NE, EN", settings.northEastOrder);
    choose(node["bearingUnit"], placeIn(bearingUnits), "dms, deg, gon", settings.bearingUnit);
    choose(node["bearingStyle"], placeIn(bearingStyles), "quadrant, circle", settings.bearingStyle);
    settings.bearingDecimals = node["bearingDecimals"].whole(settings.bearingDecimals, 0, mostBearingDecimals);
    settings.bearingPadding = node["bearingPadding"].boolean(settings.bearingPadding != 0) ? 1 : 0;
    choose(node["bearingReference"], placeIn(bearingReferences), "north, south", settings.bearingReference);
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
