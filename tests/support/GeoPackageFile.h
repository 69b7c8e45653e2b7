#pragma once

#include <QByteArray>
#include <QString>

/// Databases for tests, written by SQLite itself.
namespace geo
{

/// Runs SQL on a database, which is made where it is not there. A failure is one of the test.
void runSql(const QString &path, const QByteArray &sql);

/// What a GeoPackage holds beside its layers, as SQL: the reference systems and the list of geometries.
QByteArray packageSql();

/// A point as a geometry of a GeoPackage, as a literal of SQL. `z` and `m` are left out where they are not-a-number.
QByteArray pointLiteral(double x, double y, double z, double m, qint32 system, bool isLittleEndian = true,
                        int envelope = 0);
/// The same bytes, not as a literal.
QByteArray pointBytes(double x, double y, double z, double m, qint32 system, bool isLittleEndian = true,
                      int envelope = 0);
/// A point in well-known binary of ISO.
QByteArray wkbPoint(double x, double y, double z, double m, bool isLittleEndian = true);

} // namespace geo
