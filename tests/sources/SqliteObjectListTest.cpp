#include "SqliteObjectList.h"

#include "GeoPackageFile.h"
#include "Interrupt.h"
#include "SurveyRows.h"

#include <QCryptographicHash>
#include <QFile>

#include <gtest/gtest.h>

#include <chrono>
#include <cmath>
#include <thread>

#include <sqlite3.h>

namespace
{

using kareport::ColumnChoice;
using kareport::SqliteObjectList;
using kareport::SqliteQuery;

const double none = std::nan("");

/// A database of one test.
class Database
{
public:
    explicit Database(const QByteArray &sql) { geo::runSql(path(), sql); }

    QString path() const { return folder_.path("job.gpkg"); }
    const JobFolder &folder() const { return folder_; }
    SqliteQuery table(const char *name, std::vector<ColumnChoice> columns = {}) const
    {
        return {path(), QString::fromUtf8(name), QString(), std::move(columns)};
    }
    SqliteQuery query(const char *sql, std::vector<ColumnChoice> columns = {}) const
    {
        return {path(), QString(), QString::fromUtf8(sql), std::move(columns)};
    }

private:
    JobFolder folder_;
};

QStringList rowsOf(const SqliteQuery &query, const std::vector<unsigned> &sortedBy = {})
{
    SqliteObjectList list(query, survey::variables(), {});
    if (!sortedBy.empty()) {
        list.Sort(sortedBy);
    }
    return survey::rowsOf(list);
}

std::string joined(const QStringList &rows)
{
    return rows.join(u'\n').toStdString();
}

QByteArray hashOf(const QString &path)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    return QCryptographicHash::hash(file.readAll(), QCryptographicHash::Sha256);
}

const QByteArray points = "CREATE TABLE points (Number TEXT, Northing REAL, Easting REAL, Code TEXT, Count INTEGER);"
                          "INSERT INTO points VALUES ('BM-1', 100.5, 200, 'x', 3), ('2', -1e3, NULL, NULL, NULL);";

TEST(SqliteObjectList, ReadsTablesViewsAndQueries)
{
    const Database database(points + "CREATE VIEW high AS SELECT Number, Northing AS Elevation FROM points;"
                                     "CREATE TABLE \"odd \"\"name\" (\"Number\" INTEGER);"
                                     "INSERT INTO \"odd \"\"name\" VALUES (7);");
    const char *all = "number=BM-1 northing=100.5 easting=200 count=3\nnumber=2 northing=-1000";
    struct Row
    {
        SqliteQuery query;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {database.table("points"), all, "a table; NULL means no value, and what is not known is skipped"},
        {database.table("POINTS"), all, "in any case"},
        {database.table("high"), "number=BM-1 elevation=100.5\nnumber=2 elevation=-1000", "a view"},
        {database.table("odd \"name"), "number=7", "a name with a quote"},
        {database.query("SELECT * FROM points"), all, "a query"},
        {database.query("SELECT * FROM points; -- all\n ;"), all, "with a comment after it"},
        {database.query("WITH p AS (SELECT * FROM points) SELECT Number, Northing + 1 AS elevation FROM p ORDER BY 1"),
         "number=2 elevation=-999\nnumber=BM-1 elevation=101.5", "with everything that a query has"},
        {database.query("SELECT Number FROM points WHERE 0"), "", "no row"},
        {database.table("points", {{"Elevation", QStringLiteral("northing")}}),
         "number=BM-1 easting=200 elevation=100.5 count=3\nnumber=2 elevation=-1000", "a column that is chosen"},
        {database.table("points", {{"Elevation", 2}}),
         "number=BM-1 easting=200 elevation=100.5 count=3\nnumber=2 elevation=-1000", "by its number"},
        {database.query("SELECT max(Northing), Number FROM points", {{"Elevation", 1}}), "number=BM-1 elevation=100.5",
         "an expression, by its number"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(joined(rowsOf(row.query)), row.expected) << row.reason;
    }
    EXPECT_EQ(joined(rowsOf(database.table("points"), {survey::numberId})),
              "number=2 northing=-1000\nnumber=BM-1 northing=100.5 easting=200 count=3")
        << "sorted by the template";
}

TEST(SqliteObjectList, RowsOfATableHaveItsOrder)
{
    // The index has all that is read, so that SQLite would read it instead of the table.
    const Database indexed("CREATE TABLE t (id INTEGER PRIMARY KEY, Number, Northing, rest);"
                           "INSERT INTO t VALUES (1, 'b', 2, 0), (2, 'a', 1, 0), (3, 'c', 0, 0);"
                           "CREATE INDEX i ON t (Number, Northing)");
    EXPECT_EQ(joined(rowsOf(indexed.table("t"))), "number=b northing=2\nnumber=a northing=1\nnumber=c northing=0");
    const Database keyed("CREATE TABLE t (Number PRIMARY KEY, Northing) WITHOUT ROWID;"
                         "INSERT INTO t VALUES ('b', 2), ('a', 1); CREATE VIEW v AS SELECT * FROM t;"
                         "CREATE VIRTUAL TABLE r USING rtree(Count, Northing, Easting);"
                         "INSERT INTO r VALUES (7, 1, 2)");
    EXPECT_EQ(joined(rowsOf(keyed.table("t"))), "number=a northing=1\nnumber=b northing=2") << "a table without rowids";
    EXPECT_EQ(rowsOf(keyed.table("v")).size(), 2) << "a view";
    EXPECT_EQ(joined(rowsOf(keyed.table("r"))), "northing=1 easting=2 count=7") << "a virtual table";
}

TEST(SqliteObjectList, AGeoPackageThatDoesNotDescribeItselfIsSaid)
{
    const Database broken(
        "CREATE TABLE gpkg_geometry_columns (wrong); CREATE TABLE t (Number); INSERT INTO t VALUES (1)");
    EXPECT_EQ(joined(rowsOf(broken.table("t"))),
              "error the database does not answer the query: no such column: table_name");
    const QByteArray layer = "CREATE TABLE t (Number, geom); INSERT INTO t VALUES (1, " +
                             geo::pointLiteral(1, 2, none, none, 25832) +
                             "); INSERT INTO gpkg_geometry_columns VALUES ('t', 'geom', 'POINT', 25832, 0, 0);"
                             "ALTER TABLE gpkg_spatial_ref_sys RENAME COLUMN organization TO other";
    const Database unsystematic(geo::packageSql() + layer);
    EXPECT_EQ(joined(rowsOf(unsystematic.table("t", {{"Northing", QStringLiteral("@y")}}))), "number=1 northing=2")
        << "the reference system is not asked for";
    EXPECT_EQ(joined(rowsOf(unsystematic.table("t", {{"Description", QStringLiteral("@srs")}}))),
              "error the database does not answer the query: no such column: organization");
}

TEST(SqliteObjectList, ListsOfOneFileAreOfOneState)
{
    const Database database("PRAGMA journal_mode = WAL; CREATE TABLE t (Number); INSERT INTO t VALUES (1)");
    const auto file = SqliteObjectList::openFile(database.path());
    const auto rows = [&] {
        SqliteObjectList list(file, database.table("t"), survey::variables(), {});
        return joined(survey::rowsOf(list));
    };
    EXPECT_EQ(rows(), "number=1");
    geo::runSql(database.path(), "INSERT INTO t VALUES (2)");
    EXPECT_EQ(rows(), "number=1") << "as the list before saw it";
    EXPECT_EQ(joined(rowsOf(database.table("t"))), "number=1\nnumber=2") << "another one sees what is there";
}

TEST(SqliteObjectList, ValuesFitTheTypesOfTheirVariables)
{
    struct Row
    {
        const char *column;
        const char *value;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Northing", "1.25", "northing=1.25", "a number"},
        {"Northing", "2", "northing=2", "a whole number"},
        {"Northing", "' 2.5 '", "northing=2.5", "a text that is one"},
        {"Northing", "''", "", "an empty text means no value"},
        {"Northing", "9e999", "northing=inf", "infinite"},
        {"Northing", "'abc'",
         "error row 2: the value \"abc\" of the column \"Northing\" does not fit: a number was expected", "a text"},
        {"Northing", "x'00FF'",
         "error row 2: the value \"2 bytes\" of the column \"Northing\" does not fit: a number was expected", "bytes"},
        {"Number", "12", "number=12", "a number where a text is wanted"},
        {"Number", "9007199254740993", "number=9007199254740993", "with all its digits"},
        {"Number", "2.5", "number=2.5", "with decimals"},
        {"Number", "x'41'",
         "error row 2: the value \"1 bytes\" of the column \"Number\" does not fit: a text was expected",
         "bytes are not a text"},
        {"Description", "'Größe 𝄞'", "description=Größe 𝄞", "UTF-8"},
        {"Description", "CAST(x'FF41' AS TEXT)",
         "error row 2: the value \"\xEF\xBF\xBD"
         "A\" of the column \"Description\" does not fit: a text was expected",
         "bytes that are not UTF-8"},
        {"Description", "CAST(x'410042' AS TEXT)", "error row 2: the value", "a zero byte"},
        {"Count", "5", "count=5", "a whole number"},
        {"Count", "5.0", "count=5", "that is held as another"},
        {"Count", "5.5",
         "error row 2: the value \"5.5\" of the column \"Count\" does not fit: a whole number was expected",
         "not whole"},
        {"Count", "2147483648", "error row 2: the value \"2147483648\"", "too large"},
        {"Flag", "1", "flag=yes", "a flag"},
        {"Flag", "0", "flag=no", "none"},
        {"Flag", "2", "error row 2: the value \"2\" of the column \"Flag\" does not fit: yes or no was expected",
         "no flag"},
        {"Flag", "'*'", "flag=yes", "as a text"},
        {"Station", "'12+345.678'", "station=12345.678", "a station"},
        {"Offset", "'3.2 L'", "offset=-3.2", "an offset"},
        {"Bearing", "'N45-30-36E'", "bearing=45.51", "a bearing"},
        {"Angle", "45.5", "angle=45.5", "in the data's unit"},
    };
    for (const Row &row : rows) {
        const Database database("CREATE TABLE t (" + QByteArray(row.column) + "); INSERT INTO t VALUES (1), (" +
                                row.value + ");");
        const QStringList read = rowsOf(database.table("t"));
        ASSERT_EQ(read.size(), 2) << row.reason << ": " << joined(read);
        EXPECT_TRUE(QByteArray(row.expected).startsWith("error") ? read[1].startsWith(QString::fromUtf8(row.expected))
                                                                 : read[1] == QString::fromUtf8(row.expected))
            << row.reason << ": " << read[1].toStdString();
    }
}

TEST(SqliteObjectList, AColumnOfMixedTypesIsWrongWhereItDoesNotFit)
{
    const Database database("CREATE TABLE t (Number, Elevation);"
                            "INSERT INTO t VALUES (1, 10.5), ('2', '11.5'), (3.5, NULL), (4, 'n/a'), (5, 12);");
    const QStringList read = rowsOf(database.table("t"));
    EXPECT_EQ(joined(read),
              "number=1 elevation=10.5\nnumber=2 elevation=11.5\nnumber=3.5\n"
              "error row 4: the value \"n/a\" of the column \"Elevation\" does not fit: a number was expected");
    EXPECT_EQ(joined(rowsOf(database.table("t"), {survey::numberId})),
              "error row 4: the value \"n/a\" of the column \"Elevation\" does not fit: a number was expected")
        << "sorted";
}

TEST(SqliteObjectList, SaysWhatIsWrong)
{
    const Database database(points + "CREATE TABLE other (a);");
    struct Row
    {
        SqliteQuery query;
        const char *contains;
        const char *reason;
    };
    const Row rows[] = {
        {database.table("point"), "the database has no table \"point\": did you mean \"points\"?", "a misspelt table"},
        {database.table("survey"), "the database has no table \"survey\": one of other, points was expected",
         "another table"},
        {database.table("other"), "no column is a variable of the dictionary; the columns are: a", "no variable"},
        {database.table("points", {{"Elev", 1}}),
         "the dictionary has no variable \"Elev\": did you mean \"Elevation\"?", "no variable"},
        {database.table("points", {{"Elevation", QStringLiteral("Northng")}}),
         "there is no column \"Northng\": did you mean \"Northing\"?", "no column"},
        {database.table("points", {{"Elevation", QStringLiteral("@z")}}), "there is no column \"@z\"", "no geometry"},
        {database.query("SELECT Number, Number FROM points"), "the columns 1 and 2 are both named \"Number\"",
         "a variable twice"},
        {database.query("SELECT Nought FROM points"), "the database does not answer the query: no such column: Nought",
         "a misspelt column"},
        {database.query("SELECT \"Nought\" AS Number FROM points"),
         "the database does not answer the query: no such column: Nought", "in quotes: it is not a text"},
        {database.query("SELEC 1"), "the database does not answer the query: near \"SELEC\": syntax error", "no SQL"},
        {database.query(""), "the query is not a single SELECT", "nothing"},
        {database.query("-- nothing"), "the query is not a single SELECT", "a comment"},
        {database.query("SELECT 1 AS Number; SELECT 2"), "the query is not a single SELECT", "two of them"},
        {database.query("DELETE FROM points"), "the query is not a single SELECT", "another statement"},
        {database.query("DELETE FROM points RETURNING Number"), "the query is not a single SELECT", "one with rows"},
        {database.query("CREATE TEMP TABLE t AS SELECT 1"), "the query is not a single SELECT", "a table in memory"},
        {database.query("ATTACH 'x.db' AS x"), "the query is not a single SELECT", "another file"},
        {database.query("PRAGMA user_version"), "the query is not a single SELECT", "a setting"},
        {database.query("ROLLBACK"), "the query is not a single SELECT", "the end of the transaction"},
        {database.query("SELECT load_extension('x') AS Number"), "the database does not answer the query", "a library"},
        {database.query("SELECT ? AS Number"), "the query has parameters", "a parameter"},
        {database.query("SELECT abs(-9223372036854775808) AS Number"),
         "the database does not answer the query: integer overflow", "while it runs"},
        {database.query("SELECT zeroblob(100000000) AS Number"),
         "the database does not answer the query: string or blob too big", "more than a value has"},
        {{database.folder().path("none.db"), "points", {}, {}},
         "the database cannot be opened: No such file or directory",
         "no file"},
        {{database.folder().path(), "points", {}, {}},
         "a database file was expected, not a folder or a device",
         "a folder"},
    };
    for (const Row &row : rows) {
        const QStringList read = rowsOf(row.query);
        ASSERT_EQ(read.size(), 1) << row.reason << ": " << joined(read);
        EXPECT_TRUE(read[0].startsWith(QStringLiteral("error ") + QString::fromUtf8(row.contains)))
            << row.reason << ": " << read[0].toStdString();
    }
    SqliteObjectList chosen(database.table("points", {{"Elev", 1}}), survey::variables(), {});
    ASSERT_TRUE(chosen.reader().wrongChoice());
    EXPECT_EQ(chosen.reader().wrongChoice()->choice.toStdString(), "Elev");
}

TEST(SqliteObjectList, FilesThatAreNotADatabase)
{
    const JobFolder folder;
    struct Row
    {
        QByteArray content;
        const char *expected;
        const char *reason;
    };
    QByteArray encrypted;
    for (int i = 0; i < 4096; ++i) {
        encrypted.append(static_cast<char>(i * i * 31 + 17 * i));
    }
    const Database good(points);
    QFile file(good.path());
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    const QByteArray whole = file.readAll();
    const Row rows[] = {
        {"", "error the database has no tables: the table \"points\" was expected", "an empty file"},
        {"Number,Northing\n1,2\n", "error the file is not a SQLite database, or it is encrypted", "a text"},
        {encrypted, "error the file is not a SQLite database, or it is encrypted", "bytes without a sense"},
        {whole.left(1024), "error the database is broken: database disk image is malformed", "cut short"},
        {whole.left(4096) + QByteArray(whole.size() - 4096, '\x5A'),
         "error the database is broken: database disk image is malformed", "a broken table"},
    };
    for (const Row &row : rows) {
        folder.put("points.db", row.content);
        EXPECT_EQ(joined(rowsOf({folder.path("points.db"), "points", {}, {}})), row.expected) << row.reason;
    }
}

TEST(SqliteObjectList, TheFileStaysAsItIs)
{
    for (const char *mode : {"delete", "wal", "truncate", "persist"}) {
        const Database database("PRAGMA journal_mode=" + QByteArray(mode) + ";" + points);
        const QByteArray before = hashOf(database.path());
        const std::string files = database.folder().names().join(u' ').toStdString();
        EXPECT_EQ(rowsOf(database.table("points")).size(), 2) << mode;
        EXPECT_EQ(rowsOf(database.table("points"), {survey::numberId}).size(), 2) << mode;
        EXPECT_EQ(hashOf(database.path()), before) << mode;
        // Who reads a database with a log takes part in it, by two files that only a writer may remove.
        const bool hasLog = qstrcmp(mode, "wal") == 0;
        EXPECT_EQ(database.folder().names().join(u' ').toStdString(),
                  files + (hasLog ? " job.gpkg-shm job.gpkg-wal" : ""))
            << mode;
        EXPECT_TRUE(!hasLog || database.folder().bytesOf("job.gpkg-wal").isEmpty()) << "nothing is written to the log";
    }
}

TEST(SqliteObjectList, WhatIsNotYetMovedIntoTheFileCounts)
{
    const Database database("PRAGMA journal_mode=wal;" + points);
    sqlite3 *writer = nullptr;
    ASSERT_EQ(sqlite3_open(database.path().toUtf8().constData(), &writer), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(writer, "PRAGMA wal_autocheckpoint=0; INSERT INTO points (Number) VALUES ('new')", nullptr,
                           nullptr, nullptr),
              SQLITE_OK);
    const QByteArray before = hashOf(database.path());
    EXPECT_EQ(rowsOf(database.table("points")).last().toStdString(), "number=new");
    SqliteObjectList list(database.table("points"), survey::variables(), {});
    EXPECT_NE(list.GetAt(0), nullptr);
    // Another program goes on writing meanwhile: the state that was begun with stays.
    ASSERT_EQ(sqlite3_exec(writer, "DELETE FROM points; PRAGMA wal_checkpoint(PASSIVE)", nullptr, nullptr, nullptr),
              SQLITE_OK);
    EXPECT_EQ(survey::rowsOf(list).size(), 3) << "going back finds the same rows";
    EXPECT_FALSE(list.error());
    sqlite3_close(writer);
    EXPECT_FALSE(before.isEmpty());
    EXPECT_EQ(rowsOf(database.table("points")).size(), 0);
}

TEST(SqliteObjectList, ALockedDatabaseIsSaid)
{
    const Database database(points);
    sqlite3 *writer = nullptr;
    ASSERT_EQ(sqlite3_open(database.path().toUtf8().constData(), &writer), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(writer, "BEGIN EXCLUSIVE", nullptr, nullptr, nullptr), SQLITE_OK);
    EXPECT_EQ(joined(rowsOf(database.table("points"))), "error the database is locked: another program writes to it");
    sqlite3_close(writer);
    EXPECT_EQ(rowsOf(database.table("points")).size(), 2) << "when it is let go";
}

TEST(SqliteObjectList, WhatAWriterPutInWhileItWasWaitedForIsNoChange)
{
    const Database database(points);
    sqlite3 *writer = nullptr;
    ASSERT_EQ(sqlite3_open(database.path().toUtf8().constData(), &writer), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(writer,
                           "BEGIN EXCLUSIVE; INSERT INTO points (Number, Code) VALUES ('new', zeroblob(100000))",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    std::thread ending([writer] {
        std::this_thread::sleep_for(std::chrono::milliseconds(300)); // the lock is waited for meanwhile
        EXPECT_EQ(sqlite3_exec(writer, "COMMIT", nullptr, nullptr, nullptr), SQLITE_OK);
    });
    const QStringList read = rowsOf(database.table("points"));
    ending.join();
    sqlite3_close(writer);
    EXPECT_EQ(joined(read), "number=BM-1 northing=100.5 easting=200 count=3\nnumber=2 northing=-1000\nnumber=new");
}

TEST(SqliteObjectList, ATextThatMemoryEndsForIsNotAMissingOne)
{
    // Such a text is converted when it is asked for, which takes twice its length.
    constexpr sqlite3_int64 megabyte = 1 << 20;
    const Database database("PRAGMA encoding='UTF-16'; CREATE TABLE t (Number TEXT, Description TEXT);"
                            "INSERT INTO t VALUES ('1', 'a'), ('2', hex(zeroblob(1048576)));");
    SqliteObjectList list(database.table("t"), survey::variables(), {});
    const sqlite3_int64 before = sqlite3_hard_heap_limit64(sqlite3_memory_used() + 6 * megabyte);
    const QStringList read = survey::rowsOf(list);
    sqlite3_hard_heap_limit64(before);
    EXPECT_EQ(joined(read), "number=1 description=a\nerror there is not enough memory for it");
    EXPECT_EQ(survey::rowsOf(list).size(), 2) << "with memory they are read";
}

TEST(SqliteObjectList, AWriterThatWasKilledIsSaid)
{
    // A journal that a writer has left half done would have to be played back into the file.
    const Database database("PRAGMA page_size=4096;" + points);
    sqlite3 *writer = nullptr;
    ASSERT_EQ(sqlite3_open(database.path().toUtf8().constData(), &writer), SQLITE_OK);
    ASSERT_EQ(
        sqlite3_exec(writer,
                     "PRAGMA cache_size=1; PRAGMA cache_spill=1; BEGIN; UPDATE points SET Northing=7; "
                     "CREATE TABLE more AS WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i+1 FROM n LIMIT 5000) "
                     "SELECT i, hex(zeroblob(100)) AS h FROM n",
                     nullptr, nullptr, nullptr),
        SQLITE_OK);
    const JobFolder copy;
    for (const char *name : {"job.gpkg", "job.gpkg-journal"}) {
        ASSERT_TRUE(QFile::copy(database.folder().path(name), copy.path(name))) << name;
    }
    sqlite3_close(writer);
    const QByteArray before = hashOf(copy.path("job.gpkg"));
    const QStringList read = rowsOf({copy.path("job.gpkg"), "points", {}, {}});
    EXPECT_EQ(joined(read),
              "error a program that wrote to the database did not finish its work: open the database with that "
              "program first");
    EXPECT_EQ(hashOf(copy.path("job.gpkg")), before);
}

TEST(SqliteObjectList, AFileThatIsChangedMeanwhileIsSaid)
{
    const Database database(points);
    SqliteObjectList list(database.table("points"), survey::variables(), {});
    EXPECT_NE(list.GetAt(0), nullptr);
    QFile file(database.path());
    ASSERT_TRUE(file.open(QIODevice::Append));
    file.write("x");
    file.close();
    EXPECT_EQ(survey::rowsOf(list).last().toStdString(),
              "error the database was changed while it was read, by a program that does not use SQLite");
}

TEST(SqliteObjectList, AQueryThatRunsLongCanBeStopped)
{
    const Database database(points);
    const SqliteQuery endless = database.query("WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i+1 FROM n) "
                                               "SELECT max(i) AS Number FROM n");
    for (const bool isSorted : {false, true}) {
        int calls = 0;
        SqliteObjectList list(endless, survey::variables(), [&calls](std::size_t) { return ++calls < 3; });
        if (isSorted) {
            list.Sort({survey::numberId});
        }
        EXPECT_EQ(list.GetAt(0), nullptr);
        EXPECT_EQ(calls, 3);
        EXPECT_FALSE(list.error()) << "to be stopped is not a mistake of the data";
    }
}

TEST(SqliteObjectList, ManyRowsAreReadInTurn)
{
    const Database database("CREATE TABLE t (Number, Northing, Description);"
                            "WITH RECURSIVE n(i) AS (SELECT 0 UNION ALL SELECT i+1 FROM n LIMIT 20000) "
                            "INSERT INTO t SELECT i, i / 4.0, CASE WHEN i % 3 THEN 'note ' || i END FROM n;");
    std::size_t read = 0;
    SqliteObjectList list(database.table("t"), survey::variables(), [&read](std::size_t rows) {
        read = rows;
        return true;
    });
    const auto row = [](std::size_t i) {
        return QStringLiteral("number=%1 northing=%2")
                   .arg(i)
                   .arg(QString::number(static_cast<double>(i) / 4, 'g', 15)) +
               (i % 3 != 0 ? QStringLiteral(" description=note %1").arg(i) : QString());
    };
    for (std::size_t i = 0; i < 20000; ++i) {
        ASSERT_EQ(survey::textOf(list.GetAt(i)), row(i));
    }
    EXPECT_EQ(list.GetAt(20000), nullptr);
    EXPECT_EQ(read, 20000U);
    EXPECT_EQ(survey::textOf(list.GetAt(7)), row(7)) << "going back";
    list.Sort({survey::descriptionId});
    EXPECT_EQ(survey::textOf(list.GetAt(0)), row(0)) << "no value comes first";
    EXPECT_EQ(survey::textOf(list.GetAt(19999)), row(9998)) << "texts by their characters";
}

/// A layer of three points, one of them empty.
QByteArray layer()
{
    return geo::packageSql() +
           "CREATE TABLE marks (fid INTEGER PRIMARY KEY, geom POINT, Number TEXT);"
           "INSERT INTO gpkg_geometry_columns VALUES ('marks', 'geom', 'POINT', 25832, 2, 0);"
           "INSERT INTO marks VALUES (1, " +
           geo::pointLiteral(500000.25, 5800000.5, 71.125, none, 25832) +
           ", 'A'),"
           "(2, " +
           geo::pointLiteral(1, 2, none, 9, 4326, false, 1) +
           ", 'B'), (3, NULL, 'C'),"
           "(4, " +
           geo::pointLiteral(none, none, none, none, 25832) + ", 'D');";
}

const std::vector<ColumnChoice> coordinates = {{"Easting", QStringLiteral("@x")},
                                               {"Northing", QStringLiteral("@y")},
                                               {"Elevation", QStringLiteral("@Z")},
                                               {"Description", QStringLiteral("@srs")}};

TEST(SqliteObjectList, PointsOfAGeoPackageHaveCoordinates)
{
    const Database database(layer() +
                            "CREATE VIEW seen AS SELECT * FROM marks;"
                            "INSERT INTO gpkg_geometry_columns VALUES ('seen', 'geom', 'POINT', 25832, 2, 0);");
    const char *all = "number=A northing=5800000.5 easting=500000.25 elevation=71.125 description=EPSG:25832\n"
                      "number=B northing=2 easting=1\nnumber=C\nnumber=D description=EPSG:25832";
    EXPECT_EQ(joined(rowsOf(database.table("marks", coordinates))), all) << "a table";
    EXPECT_EQ(joined(rowsOf(database.table("seen", coordinates))), all) << "a view";
    EXPECT_EQ(joined(rowsOf(database.query("SELECT Number AS number, geom AS g FROM marks ORDER BY fid", coordinates))),
              all)
        << "a query";
    EXPECT_EQ(joined(rowsOf(database.table("marks", coordinates), {survey::northingId})),
              "number=C\nnumber=D description=EPSG:25832\nnumber=B northing=2 easting=1\n"
              "number=A northing=5800000.5 easting=500000.25 elevation=71.125 description=EPSG:25832")
        << "sorted";
    EXPECT_EQ(joined(rowsOf(database.table("marks", {{"Description", QStringLiteral("@srsName")}}))),
              "number=A description=ETRS89 / UTM zone 32N\nnumber=B\nnumber=C\n"
              "number=D description=ETRS89 / UTM zone 32N");
    EXPECT_EQ(joined(rowsOf(database.table("marks"))), "number=A\nnumber=B\nnumber=C\nnumber=D")
        << "the geometry is not asked for";
    const SqliteObjectList list(database.table("marks"), survey::variables(), {});
    const auto &columns = list.reader().columns();
    ASSERT_EQ(columns.size(), 8U);
    EXPECT_TRUE(columns[3].isOffered && !columns[0].isOffered) << "what is only offered is not missed";
}

TEST(SqliteObjectList, WhatIsNotAPointIsSaid)
{
    const Database database(geo::packageSql() +
                            "CREATE TABLE lines (fid INTEGER PRIMARY KEY, geom BLOB, second BLOB, Number);"
                            "INSERT INTO gpkg_geometry_columns VALUES ('lines', 'geom', 'GEOMETRY', 25832, 0, 0);"
                            "INSERT INTO lines VALUES (1, " +
                            geo::pointLiteral(1, 2, none, none, 0) +
                            ", NULL, 1),"
                            "(2, x'47500001000000000102000000" +
                            QByteArray(36, '0') + "', NULL, 2);");
    EXPECT_EQ(joined(rowsOf(database.table("lines", {{"Easting", QStringLiteral("@x")}}))),
              "number=1 easting=1\nerror row 2: a point was expected instead of a line string");
    EXPECT_EQ(joined(rowsOf(database.table("lines"))), "number=1\nnumber=2")
        << "where it is not asked for, it may be anything";
    geo::runSql(database.path(), "UPDATE lines SET geom = 'text' WHERE fid = 2");
    EXPECT_EQ(joined(rowsOf(database.table("lines", {{"Easting", QStringLiteral("@x")}}))),
              "number=1 easting=1\nerror row 2: a point was expected instead of bytes that are not a geometry");
    geo::runSql(database.path(),
                "INSERT INTO gpkg_geometry_columns VALUES ('lines', 'second', 'GEOMETRY', 25832, 0, 0)");
    EXPECT_EQ(joined(rowsOf(database.table("lines", {{"Easting", QStringLiteral("@x")}}))),
              "error the columns \"geom\" and \"second\" both have geometries: a query with one of them was expected");
    EXPECT_EQ(joined(rowsOf(database.query("SELECT second, Number FROM lines", {{"Easting", QStringLiteral("@x")}}))),
              "number=1\nnumber=2");
}

} // namespace
