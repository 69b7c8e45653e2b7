#include "PostgresPreview.h"

#include "ConnectionWords.h"
#include "PrivatePostgres.h"
#include "SurveyRows.h"

#include <gtest/gtest.h>

namespace
{

using kareport::ConnectionWords;
using kareport::DataPreview;
using kareport::Expected;
using kareport::PostgresSample;
using kareport::PostgresTable;

const std::function<bool()> goOn = [] { return false; };

/// One server for all tests, as it takes a while to make.
class PostgresTables : public testing::Test
{
protected:
    static void SetUpTestSuite() { server_ = std::make_unique<PrivatePostgres>(); }
    static void TearDownTestSuite() { server_.reset(); }
    void SetUp() override
    {
        if (!server_->isRunning()) {
            GTEST_SKIP() << "no server: " << server_->reason();
        }
        server_->runSql("DROP SCHEMA IF EXISTS \"lot 7\" CASCADE; DROP SCHEMA public CASCADE; CREATE SCHEMA public");
    }

    static PrivatePostgres &server() { return *server_; }
    /// The names of the tables, as they are offered.
    static QStringList names()
    {
        QStringList found;
        const auto tables = kareport::postgresTables(server_->connection(), goOn);
        if (const auto *wrong = kareport::errorOf(tables)) {
            return {wrong->text};
        }
        for (const PostgresTable &table : std::get<std::vector<PostgresTable>>(tables)) {
            found.append(table.name + u'=' + table.sql + u'(' + table.columns.join(u',') + u')');
        }
        return found;
    }
    static PostgresSample sampleOf(const char *sql, int rows = 20)
    {
        const auto sample = kareport::readPostgresSample(server_->connection(), QString::fromUtf8(sql), rows, goOn);
        const auto *wrong = kareport::errorOf(sample);
        EXPECT_EQ(wrong, nullptr) << wrong->message().toStdString();
        return wrong == nullptr ? std::get<PostgresSample>(sample) : PostgresSample();
    }

private:
    static inline std::unique_ptr<PrivatePostgres> server_;
};

TEST_F(PostgresTables, TablesAndViewsAreListedWithTheirColumns)
{
    EXPECT_EQ(names(), QStringList()) << "those of the server itself are none";
    server().runSql("CREATE TABLE points (number text, northing float8, gone int);"
                    "ALTER TABLE points DROP COLUMN gone;"
                    "CREATE VIEW near AS SELECT number FROM points;"
                    "CREATE TABLE secret (a int); REVOKE ALL ON secret FROM PUBLIC;"
                    "CREATE SCHEMA \"lot 7\"; CREATE TABLE \"lot 7\".\"As built\" (\"N\" int)");
    EXPECT_EQ(names(), QStringList({QStringLiteral("public.near=public.near(number)"),
                                    QStringLiteral("public.points=public.points(number,northing)"),
                                    QStringLiteral("public.secret=public.secret(a)"),
                                    QStringLiteral("lot 7.As built=\"lot 7\".\"As built\"(N)")}));
    EXPECT_EQ(kareport::queryOfTable(QStringLiteral("public.points")), QStringLiteral("SELECT * FROM public.points"));
    EXPECT_EQ(sampleOf("\"lot 7\".\"As built\"").columns.own, 1U);
}

TEST_F(PostgresTables, FirstRowsAreShownAsTheyAreRead)
{
    server().runSql("CREATE TABLE points (number text, northing text, count float8, photo bytea);"
                    "INSERT INTO points VALUES ('A1', '2.5', 5.0, '\\x0102'), ('A2', 'abc', NULL, NULL),"
                    "('A3', '7', 2.5, NULL), ('A4', '8', 1, NULL)");
    const PostgresSample sample = sampleOf("public.points", 3);
    const DataPreview preview = kareport::previewPostgres(sample, {}, survey::variables());
    ASSERT_EQ(preview.rows.size(), 3U);
    ASSERT_GE(preview.columns.size(), 4U);
    EXPECT_EQ(preview.columns[1].name, QStringLiteral("northing"));
    EXPECT_EQ(preview.columns[1].variable.toLower(), QStringLiteral("northing"));
    EXPECT_EQ(preview.columns[3].variable, QString());
    EXPECT_EQ(preview.rows[0][2].text, QStringLiteral("5"));
    EXPECT_EQ(preview.rows[0][2].wrong, QString()) << "a number of the database that is whole";
    EXPECT_EQ(preview.rows[0][3].text, QStringLiteral("(bytes)"));
    EXPECT_EQ(preview.rows[1][2].text, QString()) << "NULL";
    EXPECT_TRUE(preview.rows[1][1].wrong.contains(QStringLiteral("\"abc\"")));
    EXPECT_FALSE(preview.rows[2][2].wrong.isEmpty()) << "not whole";
    ASSERT_TRUE(preview.error);
    EXPECT_TRUE(preview.error->text.startsWith(QStringLiteral("row 2: the value \"abc\" of the column")))
        << preview.error->text.toStdString();

    // The same rows serve for any choice of columns.
    const DataPreview chosen = kareport::previewPostgres(
        sample, {{QStringLiteral("Description"), QStringLiteral("northing")}, {QStringLiteral("Northing"), 3}},
        survey::variables());
    EXPECT_FALSE(chosen.error) << chosen.error->text.toStdString();
    EXPECT_EQ(chosen.columns[1].variable, QStringLiteral("Description"));
    EXPECT_EQ(chosen.columns[2].variable, QStringLiteral("Northing"));
    const DataPreview none = kareport::previewPostgres(sample, {}, {[](const QString &) { return std::nullopt; }, {}});
    ASSERT_TRUE(none.error);
    EXPECT_EQ(none.columns.size(), preview.columns.size()) << "columns are shown all the same";
    EXPECT_EQ(none.rows.size(), 3U);
}

TEST_F(PostgresTables, PointsHaveTheirCoordinatesAsColumns)
{
    server().runSql("CREATE TABLE trees (number text, geom bytea);"
                    "INSERT INTO trees VALUES ('oak', decode('0101000000000000000000F03F0000000000000040', 'hex')),"
                    "('ash', decode('0102', 'hex'))");
    const std::vector<kareport::ColumnChoice> choices = {{QStringLiteral("Northing"), QStringLiteral("@y")}};
    const DataPreview preview = kareport::previewPostgres(sampleOf("trees"), choices, survey::variables());
    ASSERT_EQ(preview.columns.size(), 7U) << "two of its own, and the parts of the point";
    EXPECT_EQ(preview.columns[3].name, QStringLiteral("@y"));
    EXPECT_EQ(preview.columns[3].variable, QStringLiteral("Northing"));
    EXPECT_EQ(preview.rows[0][3].wrong, QString());
    EXPECT_FALSE(preview.rows[1][3].wrong.isEmpty()) << "no point";
}

TEST_F(PostgresTables, WhatIsWrongIsSaid)
{
    const auto wrongOf = [](const auto &read) {
        const auto *wrong = kareport::errorOf(read);
        return wrong != nullptr ? wrong->text.toStdString() : std::string("nothing");
    };
    EXPECT_EQ(
        wrongOf(kareport::readPostgresSample(server().connection(), QStringLiteral("nothing"), 20, goOn)),
        "the database does not answer the query: relation \"nothing\" does not exist (character 15 of the query)");
    const QString secret = server().connection() + QStringLiteral(" password=secret");
    const auto refused = kareport::postgresTables(secret, goOn);
    EXPECT_EQ(wrongOf(refused).find("secret"), std::string::npos);
    EXPECT_NE(wrongOf(refused).find("~/.pgpass"), std::string::npos);
    EXPECT_EQ(wrongOf(kareport::postgresTables(server().guardedConnection(), goOn)),
              "the server asks for a password: it was expected in the user's own password file (~/.pgpass) or in "
              "PGPASSWORD");
}

TEST(ConnectionWords, AreReadAndWrittenAsLibpqHasThem)
{
    const auto words = kareport::connectionWords(QStringLiteral("host = '/run/my db' dbname=survey user=o\\'neill"));
    ASSERT_TRUE(words);
    EXPECT_EQ(words->value(QStringLiteral("host")), QStringLiteral("/run/my db"));
    EXPECT_EQ(words->value(QStringLiteral("user")), QStringLiteral("o'neill"));
    EXPECT_EQ(words->size(), 3);
    const QString text = kareport::connectionOf(*words);
    EXPECT_EQ(text, QStringLiteral("host='/run/my db' dbname=survey user='o\\'neill'"));
    EXPECT_EQ(kareport::connectionWords(text), words) << "it comes back";
    ConnectionWords more = {{QStringLiteral("sslmode"), QStringLiteral("require")},
                            {QStringLiteral("service"), QStringLiteral("a\\b")},
                            {QStringLiteral("port"), QString()}};
    EXPECT_EQ(kareport::connectionOf(more), QStringLiteral("service='a\\\\b' sslmode=require"));
    EXPECT_EQ(kareport::connectionWords(QStringLiteral("hots=a")), std::nullopt);
    EXPECT_EQ(kareport::connectionWords(QString())->size(), 0);
}

TEST(ConnectionWords, ATextIsToldFromTheNameOfAFile)
{
    for (const char *text : {"service=survey", " host = x", "postgresql://u@h/d", "postgres://h"}) {
        EXPECT_TRUE(kareport::isLikeConnection(QString::fromUtf8(text))) << text;
    }
    for (const char *text : {"", "points.csv", "/data/a=b.csv", "C:\\data\\a=b.csv", "A=b", "https://h/d"}) {
        EXPECT_FALSE(kareport::isLikeConnection(QString::fromUtf8(text))) << text;
    }
}

} // namespace
