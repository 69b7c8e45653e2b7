#include "JobRunnerFixture.h"

#include <gtest/gtest.h>

namespace
{

using jobs::TestJob;

QByteArray pointsWithLengths()
{
    using namespace markup;
    const std::vector<QByteArray> fields = {field("Number", "Pt", "5"), field("Northing", "North", "9.3", "RIGHT"),
                                            field("Note", "Note", "5")};
    const QByteArray tables =
        output("Table", "Points", "Survey", fields) + output("Table", "Sorted", "Survey", fields, {"Note", "Number"});
    const QByteArray dictionary = element(
        "Dictionary",
        element("DictionaryName", "Survey") +
            element("VariableList", joined({variable(1, "Number", "NUMBER"), variable(2, "Northing", "COORDINATE"),
                                            variable(3, "Easting", "COORDINATE"), variable(4, "Area", "AREA"),
                                            variable(5, "Note", "TEXT"), variable(6, "Count", "INTEGER"),
                                            variable(7, "Bearing", "BEARING"), variable(8, "Mark", "FLAG"),
                                            variable(9, "Thickness", "THICKNESS")})));
    return element("ReportTemplate", element("Name", "T") + element("Title", "Title") + element("Tables", tables) +
                                         element("Dictionaries", dictionary) +
                                         element("Options", separatorOption("124")));
}

/// A step with one mistake.
struct Row
{
    const char *keys;
    const char *about; ///< the text at the place of the error
    const char *error;
};

template <std::size_t count>
void expectErrors(const Row (&rows)[count])
{
    for (const Row &row : rows) {
        TestJob test;
        test.folder.put("t.xml", pointsWithLengths());
        const QByteArray before = R"({"table": "Points", "data": "p", )";
        const QByteArray content =
            jobs::templateJob(R"("p": {"values": [{"Number": "1", "Northing": 12.5}]})", before + row.keys + '}');
        test.run(content);
        ASSERT_TRUE(test.error) << row.keys;
        EXPECT_EQ(test.error->text.toStdString(), row.error) << row.keys;
        const QByteArray whole = jobs::fixedFront + content + '}';
        const qsizetype step = whole.indexOf(before) + before.size();
        const qsizetype about = whole.indexOf(row.about, step);
        ASSERT_GE(about, 0) << row.about;
        ASSERT_TRUE(test.error->place) << row.keys;
        EXPECT_EQ(whole.lastIndexOf('\n', about), -1);
        EXPECT_EQ(test.error->place->column, about + 1) << row.keys;
    }
}

TEST(TableShapeError, OfGroups)
{
    constexpr Row rows[] = {
        {R"("group": [])", R"("group")",
         "unknown key \"group\": table, data, before, after, headingAfter, sort, where, "
         "compute, running, flags, groups, totals, pageTotals, rounding expected; did you mean \"groups\"?"},
        {R"("groups": {})", "{}", "a list was expected"},
        {R"("groups": [{"heading": "x"}])", R"({"heading")", "the name of a variable was expected"},
        {R"("groups": [{"by": []}])", "[]", "the name of a variable was expected"},
        {R"("groups": [{"by": "Note", "keep": 0, "heading": "x"}])", "0", "a whole number from 1 to 1000 was expected"},
        {R"("groups": [{"by": "Note", "keep": 2}])", "2", "\"keep\" needs a heading: the key \"heading\" was expected"},
        {R"("groups": [{"by": "Note", "by2": 1}])", R"("by2")",
         "unknown key \"by2\": by, heading, totals, before, keep, newPage expected; did you mean \"by\"?"},
        {R"("groups": [{"by": "Nite"}])", R"("Nite")",
         "the dictionary \"Survey\" has no variable \"Nite\": one of Number, Northing, Easting, Area, Note, Count, Bearing, Mark, Thickness was expected; did you mean \"Note\"?"},
        {R"("groups": [{"by": "Note"}])", R"("Note")",
         "groups by \"Note\" need rows that are sorted by them first: the key \"sort\" was expected in the step"},
        {R"("sort": ["Number", "Note"], "groups": [{"by": "Note"}])", R"("Note"}])",
         "groups by \"Note\" need rows that are sorted by them first: they are sorted by \"Number\", \"Note\""},
        {R"("sort": "Note", "groups": [{"by": "Note"}, {"by": "Number"}])", R"("Note"}, )",
         "groups by \"Note\", \"Number\" need rows that are sorted by them first: they are sorted by \"Note\""},
        {R"("sort": "Note", "groups": [{"by": "Note", "heading": "{Nite}"}])", R"("{Nite}")",
         "unknown placeholder {Nite}: one of {Note}, {count}, {sum:...}, {mean:...}, {min:...}, {max:...}, {count:...}, {lengthUnit}, {areaUnit}, {angleUnit} was expected; did you mean \"{Note}\"?"},
        {R"("sort": "Note", "groups": [{"by": "Note", "heading": "a {Note"}])", R"("a {Note")",
         "\"{Note\" begins a placeholder that does not end: \"}\" was expected, or \"{{\" for a brace"},
        {R"("sort": "Note", "groups": [{"by": "Note", "heading": "{sum:Note}"}])", R"("{sum:Note}")",
         "values of the variable \"Note\" cannot be added up: a number, a length, an area or an angle was expected, or \"count\""},
    };
    expectErrors(rows);
}

TEST(TableShapeError, OfTotals)
{
    constexpr Row rows[] = {
        {R"("totals": [{"sum": "Note"}])", R"("Note")",
         "values of the variable \"Note\" cannot be added up: a number, a length, an area or an angle was expected, or \"count\""},
        {R"("totals": [{"mean": "Bearing"}])", R"("Bearing")",
         "values of the variable \"Bearing\" cannot be added up: a number, a length, an area or an angle was expected, or \"count\""},
        {R"("totals": [{"max": "Thickness"}])", R"("Thickness")",
         "values of the variable \"Thickness\" cannot be added up: a number, a length, an area or an angle was expected, or \"count\""},
        {R"("totals": [{"sum": "Area"}])", R"("Area")", "the table \"Points\" has no column \"Area\" for a total"},
        {R"("totals": [{"sum": "Northing", "max": "Northing"}])", R"("Northing"}])",
         "the column \"Northing\" has a total already: another line was expected for a second one"},
        {R"("totals": [{}])", "{}", "one of label, sum, mean, min, max, count was expected"},
        {R"("totals": [{"label": "{Number}"}])", R"("{Number}")",
         "unknown placeholder {Number}: one of {count}, {sum:...}, {mean:...}, {min:...}, {max:...}, {count:...}, {lengthUnit}, {areaUnit}, {angleUnit} was expected"},
        {R"("rounding": "up", "totals": [])", R"("up")", "one of exact, printed was expected"},
        {R"("rounding": "printed")", R"("printed")", "\"rounding\" was expected only with totals"},
        {R"("rounding": "exact", "sort": "Note", "groups": [{"by": "Note", "heading": "{count} {Note}"}], "totals": [{"label": "end"}])",
         R"("exact")", "\"rounding\" was expected only with totals"},
    };
    expectErrors(rows);
}

TEST(TableShapeError, OfConditions)
{
    constexpr Row rows[] = {
        {R"("where": [{"of": "Northing"}])", R"({"of")",
         "one of is, isNot, above, below, outside, exists was expected"},
        {R"("where": [{"of": "Northing", "above": 1, "below": 2}])", "2",
         "one of is, isNot, above, below, outside, exists was expected, not two"},
        {R"("where": [{"of": "Northing", "above": "high"}])", R"("high")",
         "a number was expected, as the variable \"Northing\" has it"},
        {R"("where": [{"of": "Note", "above": 1}])", R"("Note")",
         "the variable \"Note\" does not hold numbers: a numeric variable was expected"},
        {R"("where": [{"of": "Northing", "outside": -1}])", "-1", "a tolerance of 0 or more was expected"},
        {R"("where": [{"of": "Northing", "above": 1, "beside": "Area"}])", R"("Area")",
         "\"Northing\" and \"Area\" cannot be compared: they have different units"},
        {R"("where": [{"of": "Note", "is": "x", "beside": "Note"}])", R"("Note"}])",
         "\"beside\" was expected only with above, below or outside"},
        {R"("where": [{"of": "Northing", "above": "NAN"}])", R"("NAN")",
         "a number was expected: nothing is above or below NAN"},
    };
    expectErrors(rows);
}

TEST(TableShapeError, OfWhatIsComputed)
{
    constexpr Row rows[] = {
        {R"("compute": [{"variable": "Area", "sum": ["Northing", "Easting"]}])", R"("Area")",
         "the variable \"Area\" does not fit the result: a variable of the same measure was expected, such as a length for lengths"},
        {R"("compute": [{"variable": "Area", "sum": ["Northing", "Area"]}])", R"("Area"]}])",
         "a variable cannot be computed from itself: another variable was expected"},
        {R"("compute": [{"variable": "Northing", "sum": ["Easting", "Area"]}])", R"({"variable")",
         "the variables cannot be combined: variables of the same measure were expected, such as lengths, or for a product two lengths or a number and another variable"},
        {R"("compute": [{"variable": "Northing", "difference": ["Easting"]}])", "[\"Easting\"",
         "two variables were expected"},
        {R"("compute": [{"variable": "Northing", "sum": ["Note", "Easting"]}])", R"("Note")",
         "the variable \"Note\" does not hold numbers: a numeric variable was expected"},
        {R"("running": [{"variable": "Easting", "sum": "Northing", "per": "page"}])", R"("page")",
         "one of table, group was expected"},
        {R"("running": [{"variable": "Easting", "sum": "Northing", "per": "group"}])", R"({"variable")",
         "\"per\": \"group\" needs groups: the key \"groups\" was expected in the step"},
        {R"("running": [{"variable": "Area", "rowNumber": true}])", R"("Area")",
         "the variable \"Area\" does not fit the result: a variable of the same measure was expected, such as a length for lengths"},
        {R"("flags": [{"variable": "Area", "text": "!", "of": "Northing", "above": 1}])", R"("Area")",
         "a flag needs a text, or a mark: the variable \"Area\" is neither"},
        {R"("flags": [{"variable": "Note", "of": "Northing", "above": 1}])", R"({"variable")",
         "the key \"text\" with the text of the flag was expected"},
        {R"("flags": [{"variable": "Mark", "text": "!", "of": "Northing", "above": 1}])", R"("!")",
         "the variable \"Mark\" has a mark and no text"},
    };
    expectErrors(rows);
}

TEST(TableShapeError, OfTheOrderInWhichValuesAreSet)
{
    constexpr Row rows[] = {
        {R"("compute": [{"variable": "Area", "product": ["Northing", "Easting"]}], "running": [{"variable": "Easting", "sum": "Northing"}])",
         R"("Easting"]}])",
         "the step sets \"Easting\" only after this: a variable of the data, or one that is set before, was expected"},
        {R"("where": [{"of": "Easting", "above": 1}], "running": [{"variable": "Easting", "sum": "Northing"}])",
         R"("Easting", "above")",
         "the step sets \"Easting\" only after this: a variable of the data, or one that is set before, was expected"},
        {R"("flags": [{"variable": "Note", "text": "!", "of": "Mark", "is": true}, {"variable": "Mark", "of": "Northing", "above": 1}])",
         R"("Mark", "is")",
         "the step sets \"Mark\" only after this: a variable of the data, or one that is set before, was expected"},
        {R"("flags": [{"variable": "Note", "text": "!", "of": "Northing", "beside": "Easting", "above": 1}], "compute": [{"variable": "Area", "product": ["Easting", "Northing"]}], "running": [{"variable": "Northing", "difference": "Easting"}])",
         R"("Northing"]}])",
         "the step sets \"Northing\" only after this: a variable of the data, or one that is set before, was expected"},
        {R"("compute": [{"variable": "Easting", "sum": ["Northing", "Northing"]}], "sort": "Easting")", R"("Easting"})",
         "rows are sorted before \"Easting\" is computed: a variable of the data was expected"},
    };
    expectErrors(rows);
}

TEST(TableShapeError, ATableThatTheTemplateSortsIsNotSortedAgain)
{
    TestJob test;
    test.folder.put("t.xml", pointsWithLengths());
    test.run(jobs::templateJob(R"("p": {"values": []})", R"({"table": "Sorted", "data": "p", "sort": "Number"})"));
    ASSERT_TRUE(test.error);
    EXPECT_EQ(test.error->text,
              QStringLiteral("the template sorts the table \"Sorted\": \"sort\" is for tables that it does not sort"));
}

TEST(TableShapeError, WhatTheTemplateSortsByIsNotSet)
{
    TestJob test;
    test.folder.put("t.xml", pointsWithLengths());
    test.run(jobs::templateJob(R"("p": {"values": []})", R"({"table": "Sorted", "data": "p",
        "flags": [{"variable": "Note", "text": "!", "of": "Northing", "above": 1}], "groups": [{"by": "Note"}]})"));
    ASSERT_TRUE(test.error);
    EXPECT_EQ(test.error->text,
              QStringLiteral("rows are sorted before \"Note\" is computed: a variable of the data was expected"));
}

} // namespace
