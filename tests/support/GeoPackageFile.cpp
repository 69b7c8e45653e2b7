#include "GeoPackageFile.h"

#include <QFile>

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdint>

#include <sqlite3.h>

namespace geo
{

namespace
{

void put(QByteArray &bytes, std::uint64_t number, int count, bool isLittleEndian)
{
    for (int i = 0; i < count; ++i) {
        const int shift = 8 * (isLittleEndian ? i : count - 1 - i);
        bytes.append(static_cast<char>(number >> shift & 0xFF));
    }
}

void put(QByteArray &bytes, double number, bool isLittleEndian)
{
    put(bytes, std::bit_cast<std::uint64_t>(number), 8, isLittleEndian);
}

} // namespace

void runSql(const QString &path, const QByteArray &sql)
{
    sqlite3 *database = nullptr;
    ASSERT_EQ(sqlite3_open(path.toUtf8().constData(), &database), SQLITE_OK);
    char *message = nullptr;
    EXPECT_EQ(sqlite3_exec(database, sql.constData(), nullptr, nullptr, &message), SQLITE_OK) << message;
    sqlite3_free(message);
    sqlite3_close(database);
}

QByteArray packageSql()
{
    return "PRAGMA application_id=1196444487;"
           "CREATE TABLE gpkg_spatial_ref_sys (srs_name TEXT, srs_id INTEGER PRIMARY KEY, organization TEXT, "
           "organization_coordsys_id INTEGER, definition TEXT, description TEXT);"
           "INSERT INTO gpkg_spatial_ref_sys VALUES ('ETRS89 / UTM zone 32N', 25832, 'EPSG', 25832, '', '');"
           "CREATE TABLE gpkg_contents (table_name TEXT PRIMARY KEY, data_type TEXT, identifier TEXT, srs_id INTEGER);"
           "CREATE TABLE gpkg_geometry_columns (table_name TEXT, column_name TEXT, geometry_type_name TEXT, "
           "srs_id INTEGER, z TINYINT, m TINYINT);";
}

QByteArray wkbPoint(double x, double y, double z, double m, bool isLittleEndian)
{
    QByteArray bytes;
    put(bytes, isLittleEndian ? 1 : 0, 1, isLittleEndian);
    put(bytes, static_cast<std::uint64_t>(1 + (std::isnan(z) ? 0 : 1000) + (std::isnan(m) ? 0 : 2000)), 4,
        isLittleEndian);
    put(bytes, x, isLittleEndian);
    put(bytes, y, isLittleEndian);
    if (!std::isnan(z)) {
        put(bytes, z, isLittleEndian);
    }
    if (!std::isnan(m)) {
        put(bytes, m, isLittleEndian);
    }
    return bytes;
}

QByteArray pointBytes(double x, double y, double z, double m, qint32 system, bool isLittleEndian, int envelope)
{
    constexpr int lengths[] = {0, 32, 48, 48, 64};
    QByteArray bytes("GP");
    bytes.append('\0').append(static_cast<char>(envelope << 1 | (isLittleEndian ? 1 : 0)));
    put(bytes, static_cast<std::uint32_t>(system), 4, isLittleEndian);
    bytes.append(QByteArray(envelope < 5 ? lengths[envelope] : 0, '\0'));
    return bytes + wkbPoint(x, y, z, m, isLittleEndian);
}

QByteArray pointLiteral(double x, double y, double z, double m, qint32 system, bool isLittleEndian, int envelope)
{
    return "x'" + pointBytes(x, y, z, m, system, isLittleEndian, envelope).toHex() + "'";
}

} // namespace geo
