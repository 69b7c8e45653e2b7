#include "PostgresObjectList.h"

#include "PrivatePostgres.h"
#include "SurveyData.h"
#include "SurveyRows.h"

#include <QFile>

#include <gtest/gtest.h>

namespace
{

using kareport::ColumnChoice;
using kareport::PostgresObjectList;
using kareport::PostgresQuery;

/// One server for all tests, as it takes a while to make.
class PostgresServer : public testing::Test
{
protected:
    static void SetUpTestSuite() { server_ = std::make_unique<PrivatePostgres>(); }
    static void TearDownTestSuite() { server_.reset(); }
    void SetUp() override
    {
        if (!server_->isRunning()) {
            GTEST_SKIP() << "no server: " << server_->reason();
        }
    }

    static PrivatePostgres &server() { return *server_; }
    static PostgresQuery query(const char *sql, std::vector<std::optional<QString>> parameters = {},
                               std::vector<ColumnChoice> columns = {})
    {
        return {server_->connection(), QString::fromUtf8(sql), std::move(parameters), std::move(columns)};
    }
    static std::string rowsOf(const PostgresQuery &query, const std::vector<unsigned> &sortedBy = {})
    {
        PostgresObjectList list(query, survey::variables(), {});
        if (!sortedBy.empty()) {
            list.Sort(sortedBy);
        }
        return survey::rowsOf(list).join(u'\n').toStdString();
    }

private:
    static inline std::unique_ptr<PrivatePostgres> server_;
};

TEST_F(PostgresServer, ReadsWhatAQueryAnswers)
{
    server().runSql(
        "CREATE TABLE points (number text, northing float8, easting numeric(12, 3), code text, count int, flag bool);"
        "INSERT INTO points VALUES ('BM-1', 100.5, 200, 'x', 3, true), ('2', -1e3, NULL, NULL, NULL, false)");
    const char *all = "number=BM-1 northing=100.5 easting=200 count=3 flag=yes\nnumber=2 northing=-1000 flag=no";
    EXPECT_EQ(rowsOf(query("SELECT * FROM points")), all) << "NULL means no value, and what is not known is skipped";
    EXPECT_EQ(rowsOf(query("TABLE points;")), all) << "in short";
    EXPECT_EQ(rowsOf(query("WITH p AS (SELECT * FROM points) SELECT number AS \"Number\" FROM p ORDER BY 1 DESC")),
              "number=BM-1\nnumber=2");
    EXPECT_EQ(rowsOf(query("SELECT * FROM points WHERE false")), "") << "no row";
    EXPECT_EQ(rowsOf(query("SELECT * FROM points"), {survey::numberId}),
              "number=2 northing=-1000 flag=no\nnumber=BM-1 northing=100.5 easting=200 count=3 flag=yes")
        << "sorted by the template, in natural order";
    EXPECT_EQ(rowsOf(query("SELECT number, northing AS n FROM points", {}, {{"Elevation", QStringLiteral("N")}})),
              "number=BM-1 elevation=100.5\nnumber=2 elevation=-1000")
        << "a column that is chosen";
    EXPECT_EQ(rowsOf(query("SELECT number, max(northing) FROM points GROUP BY 1 ORDER BY 2", {}, {{"Elevation", 2}})),
              "number=2 elevation=-1000\nnumber=BM-1 elevation=100.5")
        << "by its number";
}

TEST_F(PostgresServer, ParametersGoBesideTheQuery)
{
    const char *sql = "SELECT $1 AS Number, $2::float8 AS Northing, $3::text AS Description";
    EXPECT_EQ(rowsOf(query(sql, {QStringLiteral("'; DROP TABLE points; --"), QStringLiteral("2.5"), std::nullopt})),
              "number='; DROP TABLE points; -- northing=2.5");
    EXPECT_EQ(rowsOf(query("SELECT i AS number FROM generate_series(1, 9) i WHERE i > $1", {QStringLiteral("7")})),
              "number=8\nnumber=9");
    EXPECT_EQ(rowsOf(query(sql, {QStringLiteral("a")})), "error the query has 3 parameters: values of 1 are given");
    EXPECT_EQ(rowsOf(query("SELECT 1 AS number", {QStringLiteral("a")})),
              "error the query has 0 parameters: values of 1 are given");
    EXPECT_EQ(rowsOf(query("SELECT $1::int AS count", {QStringLiteral("x")})),
              "error the database does not answer the query: invalid input syntax for type integer: \"x\"");
}

TEST_F(PostgresServer, ValuesFitTheTypesOfTheirVariables)
{
    struct Row
    {
        const char *value;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"0.1::float8 AS northing", "northing=0.1", "the nearest double"},
        {"12.50::numeric AS description", "description=12.50", "a number as a text"},
        {"'Infinity'::float8 AS northing", "northing=inf", "infinite"},
        {"'Gr\xC3\xB6\xC3\x9F"
         "e'::text AS description",
         "description=Größe", "UTF-8"},
        {"''::text AS northing", "", "an empty text means no value"},
        {"true AS flag", "flag=yes", "a boolean"},
        {"'12+345.678'::text AS station, '3.2 L'::text AS offset", "station=12345.678 offset=-3.2", "notation"},
        {"'N45-30-36E'::text AS bearing", "bearing=45.51", "notation"},
        {"'abc'::text AS northing",
         "error row 1: the value \"abc\" of the column \"northing\" does not fit: a number was expected", "a text"},
        {"2.5 AS count",
         "error row 1: the value \"2.5\" of the column \"count\" does not fit: a whole number was expected",
         "not whole"},
        {"date '2024-03-05' AS description", "description=2024-03-05", "a date, as ISO writes it"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(rowsOf(query((QByteArray("SELECT ") + row.value).constData())), row.expected) << row.reason;
    }
    EXPECT_EQ(
        rowsOf(query(
            "SELECT i AS number, CASE WHEN i = 4 THEN 'n/a' ELSE '1' END AS elevation FROM generate_series(1, 9) i")),
        "number=1 elevation=1\nnumber=2 elevation=1\nnumber=3 elevation=1\n"
        "error row 4: the value \"n/a\" of the column \"elevation\" does not fit: a number was expected");
}

TEST_F(PostgresServer, SaysWhatIsWrong)
{
    server().runSql("CREATE TABLE IF NOT EXISTS kept (number text); DELETE FROM kept; INSERT INTO kept VALUES ('1')");
    struct Row
    {
        const char *sql;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"SELECT nought FROM kept",
         "error the database does not answer the query: column \"nought\" does not exist (character 8 of the query)",
         "a misspelt column"},
        {"SELEC 1",
         "error the database does not answer the query: syntax error at or near \"SELEC\" (character 1 of the query)",
         "no SQL"},
        {"", "error the query is not a single SELECT", "nothing"},
        {"SELECT 1 AS number; SELECT 2",
         "error the database does not answer the query: cannot insert multiple commands into a prepared statement",
         "two of them"},
        {"DELETE FROM kept", "error the query is not a single SELECT", "another statement"},
        {"DELETE FROM kept RETURNING number",
         "error the database does not answer the query: cannot execute DELETE in a read-only transaction",
         "one with rows"},
        {"COMMIT", "error the query is not a single SELECT", "the end of the transaction"},
        {"SET TRANSACTION READ WRITE", "error the query is not a single SELECT", "leave to write"},
        {"SELECT set_config('transaction_read_only', 'off', false) AS number",
         "error the database does not answer the query: transaction read-write mode must be set before any query",
         "the same in disguise"},
        {"SELECT nextval('kept_seq') AS number",
         "error the database does not answer the query: relation \"kept_seq\" does not exist", "no sequence"},
        {"SELECT 1 AS other", "error no column is a variable of the dictionary; the columns are: other", "no variable"},
        {"SELECT 1 AS number, 2 AS number", "error the columns 1 and 2 are both named \"number\"", "a variable twice"},
        {"SELECT i AS number, 1 / (3 - i) AS count FROM generate_series(1, 9) i",
         "number=1 count=0\nnumber=2 count=1\nerror the database does not answer the query: division by zero",
         "while it runs"},
        {"COPY kept TO STDOUT", "error the query is not a single SELECT", "a copy"},
    };
    for (const Row &row : rows) {
        const std::string read = rowsOf(query(row.sql));
        EXPECT_TRUE(read.starts_with(row.expected)) << row.reason << ": " << read;
    }
    EXPECT_EQ(rowsOf(query("SELECT * FROM kept")), "number=1") << "all is still there";
    PostgresObjectList chosen(query("SELECT 1 AS a", {}, {{"Elev", 1}}), survey::variables(), {});
    ASSERT_TRUE(chosen.reader().wrongChoice());
    EXPECT_EQ(chosen.reader().wrongChoice()->choice.toStdString(), "Elev");
}

TEST_F(PostgresServer, APasswordComesFromTheUser)
{
    const PostgresQuery guarded = {
        server().guardedConnection(), QStringLiteral("SELECT current_user AS number"), {}, {}};
    const JobFolder folder;
    qputenv("PGPASSFILE", QFile::encodeName(folder.path("none")));
    EXPECT_EQ(rowsOf(guarded), "error the server asks for a password: it was expected in the user's own password file "
                               "(~/.pgpass) or in PGPASSWORD");
    qputenv("PGPASSWORD", "open sesame");
    EXPECT_EQ(rowsOf(guarded), "number=guarded") << "from the environment";
    qputenv("PGPASSWORD", "wrong");
    const std::string read = rowsOf(guarded);
    EXPECT_NE(read.find("password authentication failed for user \"guarded\""), std::string::npos) << read;
    EXPECT_EQ(read.find("wrong"), std::string::npos) << read;
    qunsetenv("PGPASSWORD");
    folder.put("pass", "*:*:survey:guarded:open sesame\n");
    ASSERT_TRUE(QFile::setPermissions(folder.path("pass"), QFile::ReadOwner | QFile::WriteOwner));
    qputenv("PGPASSFILE", QFile::encodeName(folder.path("pass")));
    EXPECT_EQ(rowsOf(guarded), "number=guarded") << "from the password file";
    qunsetenv("PGPASSFILE");
}

TEST_F(PostgresServer, ManyRowsAreReadInTurn)
{
    const PostgresQuery many =
        query("SELECT i AS number, i / 4.0::float8 AS northing FROM generate_series(0, 19999) i");
    std::size_t read = 0;
    PostgresObjectList list(many, survey::variables(), [&read](std::size_t rows) {
        read = rows;
        return true;
    });
    const auto row = [](std::size_t i) {
        return QStringLiteral("number=%1 northing=%2").arg(i).arg(QString::number(static_cast<double>(i) / 4, 'g', 15));
    };
    for (std::size_t i = 0; i < 20000; ++i) {
        ASSERT_EQ(survey::textOf(list.GetAt(i)), row(i));
    }
    EXPECT_EQ(list.GetAt(20000), nullptr);
    EXPECT_EQ(read, 20000U);
    EXPECT_EQ(survey::textOf(list.GetAt(3)), row(3)) << "going back";
    EXPECT_EQ(survey::textOf(list.GetAt(15000)), row(15000));
    EXPECT_EQ(survey::textOf(list.GetAt(0)), row(0)) << "going back in the middle";
    list.Sort({survey::northingId});
    EXPECT_EQ(survey::textOf(list.GetAt(19999)), row(19999));
    EXPECT_FALSE(list.error());
}

TEST_F(PostgresServer, GivesTheRowsThatATextGives)
{
    const auto points = survey::somePoints(3000);
    server().runSql("DROP TABLE IF EXISTS points;" + survey::sqlOf(points));
    const JobFolder folder;
    folder.put("points.csv", survey::textOf(points, {}));
    const auto file = kareport::FileBytes::open(folder.path("points.csv"));
    kareport::CsvObjectList text(std::get<std::shared_ptr<const kareport::FileBytes>>(file), kareport::CsvDialect(),
                                 survey::variables(), {});
    PostgresObjectList list(query("SELECT * FROM points"), survey::variables(), {});
    // A database gives its rows in an order of its own.
    const auto inAnyOrder = [](QStringList rows) {
        rows.sort();
        return rows.join(u'\n').toStdString();
    };
    EXPECT_EQ(inAnyOrder(survey::rowsOf(list)), inAnyOrder(survey::rowsOf(text)));
    list.Sort({survey::numberId, survey::northingId});
    text.Sort({survey::numberId, survey::northingId});
    const QStringList sorted = survey::rowsOf(list);
    const QStringList expected = survey::rowsOf(text);
    EXPECT_EQ(inAnyOrder(sorted), inAnyOrder(expected)) << "sorted";
    ASSERT_EQ(sorted.size(), expected.size());
    for (qsizetype i = 0; i < sorted.size(); ++i) {
        ASSERT_EQ(sorted[i].section(u' ', 0, 1), expected[i].section(u' ', 0, 1)) << "row " << i;
    }
}

TEST_F(PostgresServer, RowsAreOfOneState)
{
    server().runSql("CREATE TABLE state (number text); INSERT INTO state VALUES ('1')");
    PostgresObjectList list(query("SELECT * FROM state"), survey::variables(), {});
    EXPECT_EQ(survey::rowsOf(list).size(), 1);
    server().runSql("INSERT INTO state VALUES ('2')");
    EXPECT_EQ(survey::rowsOf(list).size(), 1) << "read again";
    EXPECT_EQ(rowsOf(query("SELECT * FROM state")), "number=1\nnumber=2");
}

TEST_F(PostgresServer, ListsOfOneConnectionAreOfOneState)
{
    server().runSql("CREATE TABLE shared (number text); INSERT INTO shared VALUES ('1')");
    std::shared_ptr<kareport::PostgresConnection> connection;
    const auto rows = [&](const char *sql) {
        PostgresObjectList list(connection, query(sql), survey::variables(), {});
        return survey::rowsOf(list).join(u'\n').toStdString();
    };
    EXPECT_EQ(rows("SELECT * FROM shared"), "number=1");
    server().runSql("INSERT INTO shared VALUES ('2')");
    EXPECT_EQ(rows("SELECT * FROM shared"), "number=1") << "as the list before saw it";
    EXPECT_EQ(rows("SELECT number || 'x' AS number FROM shared"), "number=1x") << "with another query";
    EXPECT_TRUE(rows("SELECT 1 / 0 AS number").starts_with("error ")) << "a query that fails ends the transaction";
    EXPECT_EQ(rows("SELECT * FROM shared"), "number=1\nnumber=2") << "a new one is begun";
    {
        PostgresObjectList left(connection, query("SELECT i AS count FROM generate_series(1, 100000) i"),
                                survey::variables(), {});
        ASSERT_NE(left.GetAt(0), nullptr);
    }
    EXPECT_EQ(rows("SELECT * FROM shared"), "number=1\nnumber=2") << "after a list that was not read to its end";
}

TEST_F(PostgresServer, NumbersAreWholeAndBytesAreNoText)
{
    EXPECT_EQ(rowsOf(query("SELECT 5.0::numeric AS count")), "count=5");
    EXPECT_EQ(rowsOf(query("SELECT 7::float8 AS count")), "count=7");
    EXPECT_TRUE(rowsOf(query("SELECT 5.5::numeric AS count")).starts_with("error row 1: the value \"5.5\""));
    EXPECT_TRUE(rowsOf(query("SELECT '5.0'::text AS count")).starts_with("error row 1: the value \"5.0\""));
    EXPECT_EQ(rowsOf(query("SELECT 'AB'::bytea AS description")),
              "error row 1: the value \"2 bytes\" of the column \"description\" does not fit: a text was expected");
}

TEST_F(PostgresServer, AReferenceSystemThatCannotBeReadIsSaid)
{
    server().runSql("CREATE TABLE spatial_ref_sys (srid int)");
    EXPECT_TRUE(rowsOf(query("SELECT 1 AS number, '\\x0101000000000000000000F03F0000000000000040'::bytea AS geom", {},
                             {{"Description", QStringLiteral("@srs")}}))
                    .starts_with("error the database does not answer the query: column \"auth_name\" does not exist"));
    server().runSql("DROP TABLE spatial_ref_sys");
}

TEST_F(PostgresServer, AReferenceSystemThatTheUserMustNotReadIsNone)
{
    server().runSql("CREATE TABLE spatial_ref_sys (srid int, auth_name text, auth_srid int, srtext text);"
                    "INSERT INTO spatial_ref_sys VALUES (1, 'EPSG', 31467, ''); CREATE ROLE limited");
    PostgresQuery limited =
        query("SELECT '1' AS number, decode('010100002001000000000000000000F03F0000000000000040', 'hex') AS g", {},
              {{"Description", QStringLiteral("@srs")}});
    limited.connection += QStringLiteral(" options='-c role=limited'");
    EXPECT_EQ(rowsOf(limited), "number=1") << "as in a database without PostGIS";
    server().runSql("GRANT SELECT ON spatial_ref_sys TO limited");
    EXPECT_EQ(rowsOf(limited), "number=1 description=EPSG:31467");
    server().runSql("DROP TABLE spatial_ref_sys; DROP ROLE limited");
}

TEST_F(PostgresServer, AQueryThatRunsLongCanBeStopped)
{
    constexpr int mostCalls = 40; // more than it takes to connect
    for (const bool isSorted : {false, true}) {
        int calls = 0;
        PostgresObjectList list(query("SELECT pg_sleep(300) AS number"), survey::variables(),
                                [&calls](std::size_t) { return ++calls < mostCalls; });
        if (isSorted) {
            list.Sort({survey::numberId});
        }
        EXPECT_EQ(list.GetAt(0), nullptr);
        EXPECT_LE(calls, mostCalls + 1) << "it is not asked much longer";
        EXPECT_FALSE(list.error()) << "to be stopped is not a mistake of the data";
    }
    EXPECT_EQ(
        rowsOf(query(
            "SELECT count(*) AS number FROM pg_stat_activity WHERE query LIKE 'SELECT pg_sleep%' AND state = 'active'")),
        "number=0")
        << "the server does not go on";
}

TEST_F(PostgresServer, ReferenceSystemsAreThoseOfTheTypeOfGeometries)
{
    server().runSql("CREATE SCHEMA gis; CREATE SCHEMA other;"
                    "CREATE TABLE other.spatial_ref_sys (srid int, auth_name text, auth_srid int, srtext text);"
                    "INSERT INTO other.spatial_ref_sys VALUES (1, 'OTHER', 1, '');"
                    "CREATE TABLE gis.spatial_ref_sys (srid int, auth_name text, auth_srid int, srtext text);"
                    "INSERT INTO gis.spatial_ref_sys VALUES (1, 'EPSG', 31467, '');"
                    "CREATE DOMAIN gis.geometry AS bytea;"
                    "ALTER DATABASE survey SET search_path = other, public");
    EXPECT_EQ(
        rowsOf(query("SELECT '1' AS number, decode('010100002001000000000000000000F03F0000000000000040', 'hex') AS g",
                     {}, {{"Description", QStringLiteral("@srs")}})),
        "number=1 description=EPSG:31467")
        << "not those of a table that only has the name";
    server().runSql("ALTER DATABASE survey RESET search_path; DROP SCHEMA gis CASCADE; DROP SCHEMA other CASCADE");
}

TEST_F(PostgresServer, PointsHaveCoordinates)
{
    // Points as PostGIS hands them out; the type itself, without PostGIS, by the functions of bytes.
    server().runSql(
        "CREATE TYPE geometry;"
        "CREATE FUNCTION geometry_in(cstring) RETURNS geometry AS 'byteain' LANGUAGE internal IMMUTABLE STRICT;"
        "CREATE FUNCTION geometry_out(geometry) RETURNS cstring AS 'byteaout' LANGUAGE internal IMMUTABLE STRICT;"
        "CREATE TYPE geometry (INPUT = geometry_in, OUTPUT = geometry_out);"
        "CREATE TABLE spatial_ref_sys (srid int, auth_name text, auth_srid int, srtext text);"
        "INSERT INTO spatial_ref_sys VALUES (25832, 'EPSG', 25832, 'PROJCS[\"ETRS89 / UTM zone 32N\",GEOGCS[\"ETRS89\"]]');"
        "CREATE TABLE marks (number text, geom geometry, photo bytea);"
        "INSERT INTO marks VALUES ('A', '\\x01010000A0E8640000000000000000F03F00000000000000400000000000000840', 'x'),"
        "('B', '\\x0101000000000000000000F03F0000000000000040', NULL), ('C', NULL, NULL),"
        "('D', '\\x0101000020E6100000000000000000F87F000000000000F87F', NULL);"
        "CREATE TABLE lines (number text, geom geometry);"
        "INSERT INTO lines VALUES ('A', '\\x010200000002000000000000000000F03F000000000000004000000000000008400000000000001040')");
    const std::vector<ColumnChoice> parts = {{"Easting", QStringLiteral("@x")},
                                             {"Northing", QStringLiteral("@y")},
                                             {"Elevation", QStringLiteral("@z")},
                                             {"Description", QStringLiteral("@srs")}};
    EXPECT_EQ(
        rowsOf(query("SELECT * FROM marks", {}, parts)),
        "number=A northing=2 easting=1 elevation=3 description=EPSG:25832\nnumber=B northing=2 easting=1\nnumber=C\nnumber=D");
    EXPECT_EQ(
        rowsOf(query("SELECT number, geom AS g FROM marks LIMIT 1", {}, {{"Description", QStringLiteral("@srsName")}})),
        "number=A description=ETRS89 / UTM zone 32N");
    EXPECT_EQ(rowsOf(query(
                  "SELECT number, decode('0101000000000000000000F03F0000000000000040', 'hex') AS g FROM marks LIMIT 1",
                  {}, {{"Easting", QStringLiteral("@x")}})),
              "number=A easting=1")
        << "bytes that a query makes";
    EXPECT_EQ(rowsOf(query("SELECT * FROM lines", {}, {{"Easting", QStringLiteral("@x")}})),
              "error row 1: a point was expected instead of a line string");
    EXPECT_EQ(rowsOf(query("SELECT * FROM lines")), "number=A") << "where it is not asked for, it may be anything";
    EXPECT_EQ(rowsOf(query("SELECT number, geom, geom AS h FROM marks", {}, parts)),
              "error the columns \"geom\" and \"h\" both have geometries: a query with one of them was expected");
    EXPECT_EQ(rowsOf(query("SELECT number FROM marks", {}, parts)),
              "error there is no column \"@x\": one of number was expected");
}

TEST_F(PostgresServer, ZZAServerThatEndsIsSaid)
{
    bool isReading = false;
    PostgresObjectList list(
        query("SELECT i AS number, pg_sleep(CASE WHEN i > 3 THEN 60 ELSE 0 END) FROM generate_series(1, 9) i"),
        survey::variables(), [&isReading](std::size_t) {
            if (isReading) {
                server().kill();
            }
            return true;
        });
    isReading = true; // connected
    const std::string read = survey::rowsOf(list).join(u'\n').toStdString();
    EXPECT_TRUE(read.find("error the connection to the server is lost: ") != std::string::npos ||
                read.find("terminating connection") != std::string::npos)
        << read;
}

} // namespace
