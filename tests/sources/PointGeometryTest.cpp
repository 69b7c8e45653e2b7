#include "PointGeometry.h"

#include "GeoPackageFile.h"

#include <gtest/gtest.h>

#include <cmath>

namespace
{

using kareport::parseGeoPackagePoint;
using kareport::parseHexPoint;
using kareport::parseWkbPoint;
using kareport::PointGeometry;
using kareport::PointOrFault;

const double none = std::nan("");

std::string_view viewOf(const QByteArray &bytes)
{
    return {bytes.constData(), static_cast<std::size_t>(bytes.size())};
}

/// A point as "x y z system", or what is in its place.
std::string textOf(const PointOrFault &read)
{
    if (const auto *fault = std::get_if<QString>(&read)) {
        return fault->toStdString();
    }
    const auto &point = std::get<PointGeometry>(read);
    QString text;
    for (const double number : {point.x, point.y, point.z}) {
        text += (std::isnan(number) ? QStringLiteral("-") : QString::number(number)) + u' ';
    }
    return (text + QString::number(point.referenceSystem)).toStdString();
}

TEST(PointGeometry, ReadsPointsOfEveryKind)
{
    for (const bool isLittle : {true, false}) {
        for (int envelope = 0; envelope < 5; ++envelope) {
            const auto point = [&](double z, double m) {
                return textOf(parseGeoPackagePoint(viewOf(geo::pointBytes(1.5, -2, z, m, 25832, isLittle, envelope))));
            };
            EXPECT_EQ(point(none, none), "1.5 -2 - 25832");
            EXPECT_EQ(point(3, none), "1.5 -2 3 25832");
            EXPECT_EQ(point(none, 4), "1.5 -2 - 25832") << "a measure is not a height";
            EXPECT_EQ(point(3, 4), "1.5 -2 3 25832");
        }
        EXPECT_EQ(textOf(parseWkbPoint(viewOf(geo::wkbPoint(1, 2, 3, none, isLittle)))), "1 2 3 0");
    }
    EXPECT_EQ(textOf(parseGeoPackagePoint(viewOf(geo::pointBytes(none, none, none, none, -1)))), "- - - -1") << "empty";
}

TEST(PointGeometry, ReadsExtendedBinaryInDigits)
{
    // SELECT ST_AsEWKB('SRID=25832;POINT Z (1 2 3)') and its kin.
    EXPECT_EQ(textOf(parseHexPoint("01010000A0E8640000000000000000F03F00000000000000400000000000000840")),
              "1 2 3 25832");
    EXPECT_EQ(textOf(parseHexPoint("\\x01010000a0e8640000000000000000f03f00000000000000400000000000000840")),
              "1 2 3 25832");
    EXPECT_EQ(textOf(parseHexPoint("0101000000000000000000F03F0000000000000040")), "1 2 - 0");
    EXPECT_EQ(textOf(parseHexPoint("0101000040000000000000F03F00000000000000400000000000000840")), "1 2 - 0")
        << "a measure";
    EXPECT_EQ(textOf(parseHexPoint("0101000000000000000000F87F000000000000F87F")), "- - - 0") << "empty";
    EXPECT_EQ(textOf(parseHexPoint("010200000002000000" + std::string(64, '0'))), "a line string");
    EXPECT_EQ(textOf(parseHexPoint("010300000001000000" + std::string(6400, '0'))), "a polygon");
}

TEST(PointGeometry, SaysWhatIsThereInstead)
{
    struct Row
    {
        QByteArray bytes;
        const char *expected;
        const char *reason;
    };
    const QByteArray good = geo::pointBytes(1, 2, 3, none, 0);
    const auto withByte = [&good](qsizetype at, char byte) {
        QByteArray changed = good;
        changed[at] = byte;
        return changed;
    };
    const char *nothing = "bytes that are not a geometry";
    const Row rows[] = {
        {"", nothing, "nothing"},
        {"GP", nothing, "two letters"},
        {good.left(20), nothing, "cut short"},
        {good.chopped(1), nothing, "a byte is missing"},
        {good + '\0', nothing, "a byte too many"},
        {withByte(0, 'g'), nothing, "another beginning"},
        {withByte(2, 1), nothing, "another version"},
        {withByte(3, 0x0B), nothing, "an envelope of an unknown kind"},
        {withByte(3, 0x21), nothing, "an extension's geometry"},
        {withByte(3, 0x09), nothing, "the envelope is missing"},
        {withByte(8, 2), nothing, "an unknown order of bytes"},
        {withByte(9, 0), nothing, "kind 0"},
        {withByte(9, 99), nothing, "no kind"},
        {withByte(10, 0x7F), nothing, "unknown dimensions"},
        {withByte(9, static_cast<char>(0xEA)), "a line string", "kind 1002"},
        {withByte(9, static_cast<char>(0xEB)), "a polygon", "kind 1003"},
        {withByte(9, static_cast<char>(0xEC)), "several points", "kind 1004"},
        {withByte(9, static_cast<char>(0xED)), "several line strings", "kind 1005"},
        {withByte(9, static_cast<char>(0xEE)), "several polygons", "kind 1006"},
        {withByte(9, static_cast<char>(0xEF)), "a collection of geometries", "kind 1007"},
        {withByte(9, static_cast<char>(0xF0)), "a geometry of another kind", "kind 1008"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(textOf(parseGeoPackagePoint(viewOf(row.bytes))), row.expected) << row.reason;
    }
    for (const char *text :
         {"", "\\x", "0", "01", "0101000000", "zz", "0101000000000000000000F03F000000000000004",
          "0101000000000000000000F03F00000000000000400", "0101000000000000000000F03F000000000000004G"})
    {
        EXPECT_EQ(textOf(parseHexPoint(text)), nothing) << text;
    }
    EXPECT_EQ(textOf(parseHexPoint("0101000000" + std::string(100000, '0'))), nothing) << "more than a point has";
}

} // namespace
