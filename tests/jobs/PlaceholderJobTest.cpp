#include "JobRunnerFixture.h"

#include <gtest/gtest.h>

namespace
{

using jobs::TestJob;

/// A template "T" of the title "Sheet" whose labels have placeholders.
QByteArray labelledTemplate(const char *label = "North {lengthUnit}")
{
    using namespace markup;
    const QByteArray tables =
        output("Table", "Points", "Survey", {field("Number", "Pt", "4"), field("Northing", label, "8.3", "RIGHT")});
    const QByteArray blocks =
        output("Block", "Point", "Survey", {field("Northing", "North in {lengthUnit}, {page}", "0")});
    return element("ReportTemplate", element("Name", "T") + element("Title", "Sheet") + element("Tables", tables) +
                                         element("Dictionaries", surveyDictionary()) + element("Blocks", blocks) +
                                         element("Options", separatorOption("124")));
}

QByteArray job(const char *options, const char *steps, const char *more = "")
{
    return jobs::templateJob(R"("p": {"values": [{"Number": "1", "Northing": 12.5}]})", steps,
                             QByteArray(more) + R"("options": {)" + options + "}, ");
}

TEST(PlaceholderJob, TextsHaveTheValuesWhereTheJobAsksForThem)
{
    const char *const on = R"("placeholders": true)";
    const char *const off = R"("placeholders": false)";
    const char *const line = R"({"line": "{title}: {lengthUnit}, {areaUnit}, {angleUnit}, {date} {time} {{x} {page}"})";
    const char *const table = R"({"line": "a"}, {"table": "Points", "data": "p"})";
    const char *const usft = R"("settings": {"lengthUnit": "usft"}, )";
    const char *const ft = R"("settings": {"lengthUnit": "ft", "areaUnit": "ha", "angleUnit": "gon"}, )";
    const struct
    {
        const char *options;
        const char *steps;
        const char *more;
        const char *text;
        const char *reason;
    } rows[] = {
        {on, line, usft, "Sheet: US ft, m², °, Mar 05, 2024 02:07PM {x} 1\n", "a line"},
        {on, line, R"("title": "Own", )", "Own: m, m², °, Mar 05, 2024 02:07PM {x} 1\n", "the job's own title"},
        {on, line, ft, "Sheet: ft, ha, gon, Mar 05, 2024 02:07PM {x} 1\n", "the international foot"},
        {off, line, usft, "{title}: {lengthUnit}, {areaUnit}, {angleUnit}, {date} {time} {{x} {page}\n",
         "off: the text stays"},
        {"", R"({"line": "{nix} {"})", "", "{nix} {\n", "without the option as well"},
        {on, table, usft, "a\nPt  |North US ft\n\n1   |     41.010\n",
         "a label: its column is as wide as what is shown"},
        {on, table, "", "a\nPt  | North m\n\n1   |  12.500\n",
         "a shorter text leaves the column as wide as its format"},
        {off, table, "", "a\nPt  |North {lengthUnit}\n\n1   |            12.500\n", "off: the name counts"},
        {on, R"({"block": "Point", "data": "p"})", ft, "North in ft,   1|41.010\n", "the label of a block"},
    };
    for (const auto &row : rows) {
        TestJob test;
        test.folder.put("t.xml", labelledTemplate());
        test.run(job(row.options, row.steps, row.more));
        EXPECT_EQ(test.text().toStdString(), row.text) << row.reason;
    }
}

TEST(PlaceholderJob, APageNumberIsThatOfThePage)
{
    TestJob test;
    test.folder.put("t.xml", labelledTemplate("Page {page}"));
    test.runWhole(R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 10, "charsPerRow": 60}, )" +
                  jobs::templateJob(R"("p": {"values": [{"Number": "1"}, {"Number": "2"}, {"Number": "3"}]})",
                                    R"({"heading": "sheet {page}", "after": 1}, {"line": "on {page}"},
                                       {"line": "on {page}", "before": -1}, {"table": "Points", "data": "p"})",
                                    R"("options": {"placeholders": true}, )")
                      .replace(R"("header": false)", R"("header": true)") +
                  '}');
    const QString text = test.text();
    EXPECT_TRUE(text.contains(u"sheet 1\non 1\n")) << text.toStdString();
    EXPECT_TRUE(text.contains(u"sheet 2\non 2\n")) << text.toStdString();
    EXPECT_TRUE(text.contains(u"Pt  |Page   3\n")) << "the heading of each page: " << text.toStdString();
    EXPECT_FALSE(text.contains(u"{page}"));
    EXPECT_FALSE(text.contains(QChar(0xFDD0)));
}

TEST(PlaceholderJob, TheWordForStationsHasThemAsWell)
{
    TestJob test;
    test.run(jobs::templateJob(R"("p": {"values": [{"Chainage": 5}]})",
                               R"({"line": "a"}, {"table": "Stations", "data": "p"})",
                               R"("options": {"placeholders": true, "chainageLabel": "St. {lengthUnit}"}, )"));
    EXPECT_TRUE(test.text().contains(u"St. m")) << test.text().toStdString();
}

TEST(PlaceholderJob, AnUnknownOneIsAnErrorWithItsPlace)
{
    const QByteArray wrong = labelledTemplate("{{ {lenghtUnit}");
    const MarkedText marked(QByteArray(wrong).replace("<Label>{{", "@<Label>{{"));
    TestJob test;
    test.folder.put("t.xml", marked.text);
    test.run(job(R"("placeholders": true)", R"({"line": "a"})"));
    ASSERT_TRUE(test.error);
    EXPECT_TRUE(test.error->file.endsWith(u"t.xml")) << test.error->message().toStdString();
    ASSERT_TRUE(test.error->place);
    EXPECT_EQ(QStringLiteral("%1:%2").arg(test.error->place->line).arg(test.error->place->column), marked.place);
    EXPECT_TRUE(test.error->text.startsWith(u"unknown placeholder {lenghtUnit}: one of {lengthUnit}, "));
    EXPECT_TRUE(test.error->text.endsWith(u"did you mean \"{lengthUnit}\"?")) << test.error->text.toStdString();

    TestJob other;
    other.folder.put("t.xml", marked.text);
    other.run(job(R"("placeholders": false)", R"({"line": "a"})"));
    EXPECT_FALSE(other.error) << "off: the text stays";
}

} // namespace
