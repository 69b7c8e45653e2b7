#include "LandXmlFile.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

constexpr double start = -75;     // station of the road's first point
constexpr double rounding = 5e-4; // of the coordinates and the heights that are compared

QByteArray exampleFile(const char *name)
{
    QFile file(QStringLiteral(KAREPORT_EXAMPLES_DIR "/data/") + QLatin1StringView(name));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name;
    return file.readAll();
}

/// The rows of a file of the examples, without its header row. No cell of the ones read here is quoted.
std::vector<QStringList> exampleRows(const char *name)
{
    QStringList lines = QString::fromUtf8(exampleFile(name)).split(u'\n', Qt::SkipEmptyParts);
    std::vector<QStringList> rows;
    for (qsizetype i = 1; i < lines.size(); ++i) {
        rows.push_back(lines[i].split(u','));
    }
    return rows;
}

/// The road was designed, and what the other examples show of it was worked out, by a script that knows nothing of this
/// reader: it integrates the curvature by itself.
TEST(LandXmlExample, ElementsAreThoseOfTheDesign)
{
    LandXmlFile file(exampleFile("road.xml"), queryOf(Kind::Elements));
    const auto rows = exampleRows("alignment.csv");
    std::size_t index = 0;
    for (; file.list->GetAt(index) != nullptr; ++index) {
        const QStringList &row = rows[index];
        EXPECT_NEAR(file.number(index, "StartNorthing"), row[10].toDouble(), rounding) << index;
        EXPECT_NEAR(file.number(index, "StartEasting"), row[11].toDouble(), rounding) << index;
        EXPECT_NEAR(file.number(index, "StartBearing"), qDegreesToRadians(row[9].toDouble()), 5e-6) << index;
        EXPECT_NEAR(file.number(index, "Length"), row[5].toDouble(), 1e-9) << index;
        for (const auto &[variable, cell] : {std::pair("StartRadius", 6), std::pair("EndRadius", 7)}) {
            if (row[cell] == u"INF") {
                EXPECT_TRUE(std::isinf(file.number(index, variable))) << index;
            } else {
                EXPECT_NEAR(file.number(index, variable), row[cell].toDouble(), 0.01) << index;
            }
        }
        if (!row[8].isEmpty()) {
            EXPECT_NEAR(file.number(index, "Parameter"), row[8].toDouble(), 1e-3) << index;
        }
    }
    EXPECT_EQ(index, 13U);
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlExample, StationsAreWhereTheyWereSetOut)
{
    const auto rows = exampleRows("stakeout.csv");
    LandXmlQuery query = queryOf(Kind::Stations, "RR-1");
    query.atElements = false;
    query.offsets = {{-5.5, std::nullopt}, {0, std::nullopt}};
    for (const QStringList &row : rows) {
        const double station = row[1].toDouble();
        query.stations.push_back(station < 700 ? station : station + 300); // the equation's
    }
    LandXmlFile file(exampleFile("road.xml"), query);
    std::vector<double> places;
    for (std::size_t i = 0; file.list->GetAt(i) != nullptr; ++i) {
        places.push_back(file.number(i, "Along") + start);
    }
    int compared = 0;
    for (const QStringList &row : rows) {
        const double station = row[1].toDouble();
        const double offset = row[2].toDouble();
        if (offset > 0) {
            continue; // the right edge is not at one distance
        }
        const auto place = std::lower_bound(places.begin(), places.end(), station - 2e-4);
        ASSERT_TRUE(place != places.end() && *place < station + 2e-4) << row[1].toStdString();
        const auto index = static_cast<std::size_t>(place - places.begin());
        EXPECT_NEAR(file.number(index, offset < 0 ? "Northing1" : "Northing2"), row[3].toDouble(), rounding);
        EXPECT_NEAR(file.number(index, offset < 0 ? "Easting1" : "Easting2"), row[4].toDouble(), rounding);
        if (offset == 0) {
            EXPECT_NEAR(file.number(index, "Design"), row[6].toDouble(), 6e-4) << row[1].toStdString();
        }
        ++compared;
    }
    EXPECT_EQ(compared, 302);
}

TEST(LandXmlExample, PointsThatWereSetOutHaveTheirStationsAndOffsets)
{
    const auto rows = exampleRows("stakeout.csv");
    QByteArray points = "<CgPoints name=\"stakeout\">";
    for (const QStringList &row : rows) {
        points += "<CgPoint name=\"" + row[0].toUtf8() + "\">" + row[3].toUtf8() + ' ' + row[4].toUtf8() + "</CgPoint>";
    }
    QByteArray content = exampleFile("road.xml");
    content.replace("</LandXML>", points + "</CgPoints></LandXML>");
    LandXmlQuery query = queryOf(Kind::OffsetsOf, "stakeout");
    query.alignment = u"RR-1"_qs;
    LandXmlFile file(content, query);
    for (std::size_t i = 0; i < rows.size(); ++i) {
        EXPECT_NEAR(file.number(i, "Along") + start, rows[i][1].toDouble(), rounding) << rows[i][0].toStdString();
        EXPECT_NEAR(file.number(i, "Offset"), rows[i][2].toDouble(), rounding) << rows[i][0].toStdString();
    }
    EXPECT_EQ(file.list->GetAt(rows.size()), nullptr);
    EXPECT_EQ(rows.size(), 453U);
}

TEST(LandXmlExample, EveryListOfTheFileHasRowsAndNothingIsSaidOfIt)
{
    struct Row
    {
        Kind kind;
        qsizetype count;
    };
    constexpr Row rows[] = {{Kind::Points, 22}, {Kind::SurfacePoints, 27}, {Kind::Parcels, 2},
                            {Kind::Courses, 8}, {Kind::Alignments, 1},     {Kind::Elements, 13},
                            {Kind::Profile, 6}, {Kind::CrossSections, 65}, {Kind::OffsetsOf, 22}};
    for (const Row &row : rows) {
        LandXmlFile file(exampleFile("road.xml"), queryOf(row.kind));
        EXPECT_EQ(file.rows().size(), row.count) << keyOf(row.kind).toString().toStdString();
        EXPECT_EQ(file.notes(), QStringList()) << keyOf(row.kind).toString().toStdString();
    }
}

} // namespace
