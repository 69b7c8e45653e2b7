#include "GeoPackageFile.h"
#include "JsonFileList.h"
#include "SqliteObjectList.h"
#include "SurveyData.h"
#include "SurveyRows.h"

#include <gtest/gtest.h>

#include <random>

namespace
{

using kareport::CsvDialect;
using kareport::DelimiterKind;
using kareport::RowObjectList;
using kareport::TextEncoding;

const std::vector<unsigned> keys = {survey::numberId, survey::northingId};

std::shared_ptr<const kareport::FileBytes> fileOf(const JobFolder &folder, const QByteArray &text)
{
    folder.put("points", text);
    return std::get<std::shared_ptr<const kareport::FileBytes>>(kareport::FileBytes::open(folder.path("points")));
}

/// Compares the rows of a list with the expected ones: in order, again, and sorted.
void expectRows(RowObjectList &list, const QStringList &inTurn, const QStringList &sorted, const std::string &reason)
{
    EXPECT_EQ(survey::rowsOf(list), inTurn) << reason;
    EXPECT_EQ(survey::rowsOf(list), inTurn) << reason << ", again";
    list.Sort(keys);
    EXPECT_EQ(survey::rowsOf(list), sorted) << reason << ", sorted";
}

TEST(SameRows, ComeFromEveryDialectAndSource)
{
    const auto points = survey::somePoints(5000);
    const JobFolder folder;
    CsvDialect plain;
    kareport::CsvObjectList first(fileOf(folder, survey::textOf(points, plain)), plain, survey::variables(), {});
    const QStringList inTurn = survey::rowsOf(first);
    first.Sort(keys);
    const QStringList sorted = survey::rowsOf(first);
    ASSERT_EQ(inTurn.size(), 5000);
    ASSERT_NE(inTurn, sorted);

    std::vector<std::pair<std::string, CsvDialect>> dialects;
    const auto add = [&](const char *name, const std::function<void(CsvDialect &)> &change) {
        change(dialects.emplace_back(name, CsvDialect()).second);
    };
    add("semicolons and decimal commas", [](CsvDialect &d) { d.delimiter = ';', d.numbers = {',', ""}; });
    add("thousands", [](CsvDialect &d) { d.delimiter = '\t', d.numbers = {',', "."}; });
    add("thousands with a delimiter", [](CsvDialect &d) { d.numbers = {'.', "'"}; });
    add("blanks", [](CsvDialect &d) { d.kind = DelimiterKind::Whitespace; });
    add("blanks and decimal commas", [](CsvDialect &d) { d.kind = DelimiterKind::Whitespace, d.numbers = {',', ""}; });
    add("Latin-1", [](CsvDialect &d) { d.encoding = TextEncoding::Latin1; });
    add("Windows-1252", [](CsvDialect &d) { d.encoding = TextEncoding::Windows1252; });
    add("UTF-16", [](CsvDialect &d) { d.encoding = TextEncoding::Utf16; });
    add("an order", [](CsvDialect &d) { d.hasHeader = false, d.order = QStringLiteral("PNEZD"); });
    add("an order after a header", [](CsvDialect &d) { d.order = QStringLiteral("pnezd"); });
    add("lines skipped", [](CsvDialect &d) { d.skip = 3, d.comment = '#', d.passesBlankLines = true; });
    add("columns by number", [](CsvDialect &d) {
        d.hasHeader = false;
        d.columns = {{"Number", 1}, {"Northing", 2}, {"Easting", 3}, {"Elevation", 4}, {"Description", 5}};
    });
    for (const auto &[name, dialect] : dialects) {
        kareport::CsvObjectList list(fileOf(folder, survey::textOf(points, dialect)), dialect, survey::variables(), {});
        expectRows(list, inTurn, sorted, name);
    }
    for (const char delimiter : {',', ';', '\t', '|'}) {
        CsvDialect dialect;
        dialect.delimiter = delimiter;
        const auto file = fileOf(folder, survey::textOf(points, dialect));
        dialect.kind = DelimiterKind::Automatic;
        kareport::CsvObjectList list(file, dialect, survey::variables(), {});
        expectRows(list, inTurn, sorted, std::string("detected: ") + delimiter);
    }
    for (const bool isList : {true, false}) {
        kareport::JsonFileList list(fileOf(folder, survey::jsonOf(points, isList)), {}, survey::variables(), {});
        expectRows(list, inTurn, sorted, isList ? "a JSON list" : "JSON lines");
    }
    geo::runSql(folder.path("points.db"), "BEGIN;" + survey::sqlOf(points) + "COMMIT");
    kareport::SqliteObjectList list({folder.path("points.db"), "points", {}, {}}, survey::variables(), {});
    expectRows(list, inTurn, sorted, "SQLite");
}

TEST(SameRows, NoChangeOfAFileEndsTheProgram)
{
    // Files with bytes that are changed, put in or taken out are read to an end, and what is wrong has a sentence.
    const auto points = survey::somePoints(40);
    const JobFolder folder;
    geo::runSql(
        folder.path("points.gpkg"),
        geo::packageSql() + survey::sqlOf(points) +
            "ALTER TABLE points ADD geom BLOB; UPDATE points SET geom = " + geo::pointLiteral(1, 2, 3, 4, 25832) +
            "; INSERT INTO gpkg_geometry_columns VALUES ('points', 'geom', 'POINT', 25832, 1, 1);");
    CsvDialect dialect;
    dialect.kind = DelimiterKind::Automatic;
    const QByteArray text = survey::textOf(points, CsvDialect());
    const QByteArray json = survey::jsonOf(points, true);
    const QByteArray package = folder.bytesOf("points.gpkg");
    std::mt19937 random(77);
    const auto changed = [&random](QByteArray bytes) {
        for (unsigned count = 1 + static_cast<unsigned>(random() % 4); count > 0 && !bytes.isEmpty(); --count) {
            const auto at = static_cast<qsizetype>(random()) % bytes.size();
            switch (random() % 4) {
            case 0: bytes[at] = static_cast<char>(random()); break;
            case 1: bytes.remove(at, static_cast<qsizetype>(random()) % 100); break;
            case 2: bytes.insert(at, static_cast<char>(random())); break;
            default: bytes[at] = static_cast<char>(static_cast<unsigned char>(bytes[at]) ^ (1U << random() % 8)); break;
            }
        }
        return bytes;
    };
    const auto read = [](RowObjectList &list) {
        list.Sort(keys);
        survey::rowsOf(list);
        EXPECT_TRUE(!list.error() || !list.error()->text.isEmpty());
    };
    const std::vector<kareport::ColumnChoice> parts = {{"Easting", QStringLiteral("@x")}};
    for (int round = 0; round < 300; ++round) {
        kareport::CsvObjectList csv(fileOf(folder, changed(text)), dialect, survey::variables(), {});
        read(csv);
        kareport::JsonFileList lines(fileOf(folder, changed(json)), {}, survey::variables(), {});
        read(lines);
        folder.put("changed.gpkg", changed(package));
        kareport::SqliteObjectList database({folder.path("changed.gpkg"), "points", {}, parts}, survey::variables(),
                                            {});
        read(database);
    }
}

} // namespace
