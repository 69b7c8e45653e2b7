#include "LandXmlQueryReader.h"

#include "NumberText.h"
#include "Xlate.h"

#include <QStringList>

#include <cmath>
#include <numbers>

namespace kareport
{

namespace
{

using Kind = LandXmlListKind;

constexpr double mostLength = 1e9;

/// What a list has a use for.
namespace uses
{

constexpr unsigned group = 1;
constexpr unsigned surface = 2;
constexpr unsigned parcel = 4;
constexpr unsigned alignment = 8;
constexpr unsigned gradeLine = 16;
constexpr unsigned places = 32; ///< the keys that say where stations are

} // namespace uses

constexpr struct
{
    Kind kind;
    unsigned used;
} lists[] = {{Kind::Points, uses::group},
             {Kind::SurfacePoints, uses::surface},
             {Kind::Parcels, uses::parcel},
             {Kind::Courses, uses::parcel},
             {Kind::Alignments, uses::alignment},
             {Kind::Elements, uses::alignment},
             {Kind::Stations, uses::alignment | uses::gradeLine | uses::surface | uses::places},
             {Kind::Profile, uses::alignment | uses::gradeLine},
             {Kind::CrossSections, uses::alignment | uses::surface},
             {Kind::OffsetsOf, uses::group | uses::alignment | uses::gradeLine}};

unsigned usesOf(Kind kind)
{
    for (const auto &list : lists) {
        if (list.kind == kind) {
            return list.used;
        }
    }
    return 0;
}

QString allLists()
{
    QStringList keys;
    for (const auto &list : lists) {
        keys.append(keyOf(list.kind).toString());
    }
    return keys.join(QStringLiteral(", "));
}

/// The keys that not every list has a use for.
constexpr struct
{
    const char *key;
    unsigned use;
} keys[] = {{"group", uses::group},         {"surface", uses::surface},     {"parcel", uses::parcel},
            {"alignment", uses::alignment}, {"gradeLine", uses::gradeLine}, {"interval", uses::places},
            {"from", uses::places},         {"atElements", uses::places},   {"stations", uses::places},
            {"offsets", uses::places}};

/// Fails at a key that the list does not use: a reader of the job would believe that it does something.
void expectKeysOf(const JsonNode &set, unsigned used, QStringView list)
{
    for (const auto &row : keys) {
        const JsonNode node = set[QString::fromLatin1(row.key)];
        if (node.exists() && (used & row.use) == 0) {
            node.fail(Xlate("the list \"%1\" does not use the key \"%2\": remove the key, or choose another list")
                          .arg(list, QString::fromLatin1(row.key)));
        }
    }
}

double numberOf(const JsonNode &node, double least, double most)
{
    const double number = node.value().toDouble();
    if (!node.value().isDouble() || !(number >= least && number <= most)) {
        node.fail(Xlate("a number from %1 to %2 was expected").arg(least).arg(most));
        return least;
    }
    return number;
}

/// A station such as 1052.5 or "1+052.500".
double stationOf(const JsonNode &node)
{
    if (!node.value().isString()) {
        return numberOf(node, -mostLength, mostLength);
    }
    QByteArray text = node.text().toUtf8();
    const qsizetype plus = text.indexOf('+', 1);
    if (plus > 0) {
        text.remove(plus, 1);
    }
    double station = 0;
    if (!parseNumber({text.constData(), static_cast<std::size_t>(text.size())}, station) ||
        !(std::fabs(station) <= mostLength))
    {
        node.fail(Xlate("a station such as 12345.678 or \"12+345.678\" was expected"));
        return 0;
    }
    return station;
}

/// A line parallel to the alignment: its offset alone, or an object of offset and crossfall.
LandXmlOffset offsetOf(const JsonNode &node)
{
    constexpr double mostCrossfall = 1000;
    LandXmlOffset line;
    if (!node.isObject()) {
        line.offset = numberOf(node, -mostLength, mostLength);
        return line;
    }
    node.allowOnly({"offset", "crossfall"});
    const JsonNode offset = node[QStringLiteral("offset")];
    if (!offset.exists()) {
        node.fail(Xlate("the key \"%1\" was expected").arg(QStringLiteral("offset")));
        return line;
    }
    line.offset = numberOf(offset, -mostLength, mostLength);
    if (const JsonNode crossfall = node[QStringLiteral("crossfall")]; crossfall.exists()) {
        line.crossfall = numberOf(crossfall, -mostCrossfall, mostCrossfall);
    }
    return line;
}

void readPlaces(const JsonNode &set, LandXmlQuery &query)
{
    constexpr double leastInterval = 0.001;
    if (const JsonNode interval = set[QStringLiteral("interval")]; interval.exists()) {
        query.interval = numberOf(interval, leastInterval, mostLength);
    }
    if (const JsonNode from = set[QStringLiteral("from")]; from.exists()) {
        query.fromRound = from.text() == u"round";
        if (!query.fromRound && from.text() != u"start") {
            from.fail(Xlate("one of %1 was expected").arg(QStringLiteral("start, round")));
        }
    }
    query.atElements = set[QStringLiteral("atElements")].boolean(true);
    if (const JsonNode stations = set[QStringLiteral("stations")]; stations.expectArray()) {
        for (qsizetype i = 0; i < stations.size(); ++i) {
            query.stations.push_back(stationOf(stations[i]));
        }
    }
    if (const JsonNode offsets = set[QStringLiteral("offsets")]; offsets.expectArray()) {
        for (qsizetype i = 0; i < offsets.size(); ++i) {
            query.offsets.push_back(offsetOf(offsets[i]));
        }
    }
}

/// Differences that are not noted: of lengths in millimetres, of directions in ten-thousandths of a gon.
void readTolerance(const JsonNode &node, LandXmlTolerance &tolerance)
{
    constexpr double most = 1e6;
    if (!node.expectObject()) {
        return;
    }
    node.allowOnly({"mm", "cc"});
    if (const JsonNode length = node[QStringLiteral("mm")]; length.exists()) {
        tolerance.length = numberOf(length, 0, most) / 1000;
    }
    if (const JsonNode angle = node[QStringLiteral("cc")]; angle.exists()) {
        tolerance.angle = numberOf(angle, 0, most) / 10000 * std::numbers::pi / 200;
    }
}

} // namespace

QStringList landXmlQueryKeys()
{
    QStringList all;
    all.append(QStringLiteral("list"));
    for (const auto &row : keys) {
        all.append(QString::fromLatin1(row.key));
    }
    all.append(QStringLiteral("tolerance"));
    return all;
}

QStringList landXmlKeysOf(LandXmlListKind kind)
{
    QStringList used;
    for (const auto &row : keys) {
        if ((usesOf(kind) & row.use) != 0) {
            used.append(QString::fromLatin1(row.key));
        }
    }
    return used;
}

LandXmlQuery readLandXmlQuery(const JsonNode &set)
{
    LandXmlQuery query;
    query.unit.reset();
    const JsonNode list = set[QStringLiteral("list")];
    const auto kind = landXmlListFromKey(list.text());
    if (!kind) {
        (list.exists() ? list : set)
            .fail(Xlate("the key \"%1\" with one of %2 was expected").arg(QStringLiteral("list"), allLists()));
        return query;
    }
    query.kind = *kind;
    const unsigned used = usesOf(*kind);
    expectKeysOf(set, used, keyOf(*kind));
    const QString alignment = set[QStringLiteral("alignment")].text();
    const QString surface = set[QStringLiteral("surface")].text();
    switch (*kind) {
    case Kind::Points: query.name = set[QStringLiteral("group")].text(); break;
    case Kind::SurfacePoints: query.name = surface; break;
    case Kind::Parcels:
    case Kind::Courses: query.name = set[QStringLiteral("parcel")].text(); break;
    case Kind::OffsetsOf:
        query.name = set[QStringLiteral("group")].text();
        query.alignment = alignment;
        break;
    default:
        query.name = alignment;
        query.surface = surface;
        break;
    }
    query.gradeLine = set[QStringLiteral("gradeLine")].text();
    if ((used & uses::places) != 0) {
        readPlaces(set, query);
    }
    readTolerance(set[QStringLiteral("tolerance")], query.tolerance);
    return query;
}

} // namespace kareport
