#include "JobNotes.h"

#include "GeoPackageFile.h"
#include "JobRunnerFixture.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>

#include <gtest/gtest.h>

namespace
{

using jobs::templateJob;
using jobs::TestJob;

/// The notes of a job, without the folder of its files.
std::string notesOf(const TestJob &job)
{
    QStringList notes;
    for (const kareport::JobNote &note : job.notes.said()) {
        notes.append(note.message().remove(job.folder.path() + u'/'));
    }
    return notes.join(u'\n').toStdString();
}

void putData(const TestJob &job)
{
    job.folder.put("good.csv", "Number,Northing\n1,12.5\n");
    job.folder.put("misspelt.csv", "Number,Nrothing\n1,12.5\n");
    job.folder.put("wide.csv", "Number,Northing\n123456,1\n");
    job.folder.put("more.csv", "Number,Northing,\"Code\"\n1,12.5,x\n");
    job.folder.put("pnez.csv", "1,12.5,3,4\n");
    job.folder.put("empty.csv", "Number,Northing\n1,\n");
    job.folder.put("infinite.csv", "Number,Northing\n1,-INF\n");
    job.folder.put("twice.csv", "Number,Northing,N\n1,12.5,13\n");
    job.folder.put("points.json",
                   "[{\"Number\": 1,\n  \"Code\": 5, \"Northing\": 1},\n {\"Number\": 2, \"Northing\": 2}]");
    geo::runSql(job.folder.path("points.db"), "CREATE TABLE points (Number TEXT, Code TEXT, Northing REAL)");
}

/// The step that a job of `runStep` has is here in its line.
const char *const tableStep = R"({"table": "Points", "data": "p"})";

TEST(JobNotes, SayWhatDoesNotComeTogether)
{
    struct Row
    {
        const char *set;
        const char *step;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("csv": "good.csv")", tableStep, "", "all fits"},
        {R"("csv": "misspelt.csv")", tableStep,
         "misspelt.csv:1:8: note: the column \"Nrothing\" is not a variable of the dictionary \"Survey\": did you mean "
         "\"Northing\"?\n"
         "job.json:1:#: note: no column fills the field \"Northing\" of the table \"Points\": did you mean "
         "\"Nrothing\"?",
         "a misspelt column: its rows show 0"},
        {R"("csv": "more.csv")", tableStep,
         "more.csv:1:17: note: the column \"Code\" is not a variable of the dictionary \"Survey\"", "one more column"},
        {R"("csv": "more.csv")", R"({"table": "Points", "data": "p"}, {"table": "Sorted", "data": "p"})",
         "more.csv:1:17: note: the column \"Code\" is not a variable of the dictionary \"Survey\"", "said once"},
        {R"("csv": "more.csv", "columns": ["Number", "Northing", "Cod"])", tableStep,
         "job.json:1:#: note: the column \"Cod\" is not a variable of the dictionary \"Survey\"",
         "a name that the job gives has its place there"},
        {R"("csv": "pnez.csv", "header": false, "order": "PNEZ")", tableStep,
         "job.json:1:#: note: the column \"Elevation\" is not a variable of the dictionary \"Survey\"",
         "a name of an order has the place of the order"},
        {R"("values": [{"Number": "1"}, {"Number": "2", "Nortihng": 2}])", tableStep,
         "job.json:1:#: note: the column \"Nortihng\" is not a variable of the dictionary \"Survey\": did you mean "
         "\"Northing\"?\n"
         "job.json:1:#: note: no column fills the field \"Northing\" of the table \"Points\": did you mean "
         "\"Nortihng\"?",
         "a key of values"},
        {R"("values": {"Number": "1"})", R"({"block": "Point", "data": "p"})",
         "job.json:1:#: note: no column fills the field \"Northing\" of the block \"Point\"", "a block"},
        {R"("values": {"Number": "1", "Northing": null})", R"({"block": "Point", "data": "p"})",
         "job.json:1:#: note: the field \"Northing\" of the block \"Point\" has no value: its line is left out",
         "a key without a value is one, and a number that does not show"},
        {R"("values": {"Number": null, "Northing": 1})", R"({"block": "Point", "data": "p"})", "",
         "a text that is missing is not a reason"},
        {R"("json": "points.json")", tableStep,
         "points.json:2:3: note: the column \"Code\" is not a variable of the dictionary \"Survey\"",
         "keys that show with the rows"},
        {R"("csv": "twice.csv", "columns": {"Northing": "N"})", tableStep, "",
         "a variable that is read from another column, as the job says"},
        {R"("sqlite": "points.db", "table": "points")", tableStep,
         "points.db: note: the column \"Code\" is not a variable of the dictionary \"Survey\"",
         "a database has no place"},
    };
    for (const Row &row : rows) {
        TestJob job;
        putData(job);
        job.run(templateJob(QByteArray(R"("p": {)") + row.set + "}", row.step));
        EXPECT_FALSE(job.error) << row.reason << ": " << job.text().toStdString();
        QString notes = QString::fromStdString(notesOf(job));
        notes.replace(QRegularExpression(QStringLiteral("job\\.json:1:\\d+")), QStringLiteral("job.json:1:#"));
        EXPECT_EQ(notes.toStdString(), row.expected) << row.reason;
    }
}

TEST(JobNotes, SayWhichFieldsHaveNoVariable)
{
    struct Row
    {
        const char *field; ///< in place of the field of Northing
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Nortihng",
         "t.xml:1:#: note: the field \"Nortihng\" of the table \"Points\" is not a variable of the dictionary "
         "\"Survey\": did you mean \"Northing\"?",
         "misspelt: it would show 0 in every row"},
        {"Gradient",
         "t.xml:1:#: note: the field \"Gradient\" of the table \"Points\" is not a variable of the dictionary "
         "\"Survey\"",
         "nothing near"},
        {"FILLER", "", "blanks are what is wanted"},
        {"NORTHING", "", "names count without their case"},
    };
    for (const Row &row : rows) {
        TestJob job;
        putData(job);
        QByteArray content = jobs::pointsTemplate();
        const QByteArray was = markup::element("VariableName", "Northing") + markup::element("Label", "North");
        ASSERT_TRUE(content.contains(was));
        content.replace(content.indexOf(was), was.size(),
                        markup::element("VariableName", row.field) + markup::element("Label", "North"));
        job.folder.put("t.xml", content);
        job.run(templateJob(R"("p": {"csv": "good.csv"})", tableStep));
        EXPECT_FALSE(job.error) << row.reason << ": " << job.text().toStdString();
        QString notes = QString::fromStdString(notesOf(job));
        if (*row.expected != 0) {
            const qsizetype place = content.indexOf("<VariableName>" + QByteArray(row.field)) + 1;
            EXPECT_TRUE(notes.startsWith(QStringLiteral("t.xml:1:%1: ").arg(place))) << notes.toStdString();
        }
        notes.replace(QRegularExpression(QStringLiteral("t\\.xml:1:\\d+")), QStringLiteral("t.xml:1:#"));
        EXPECT_EQ(notes.toStdString(), row.expected) << row.reason;
        job.run(R"("strict": true, )" + templateJob(R"("p": {"csv": "good.csv"})", tableStep));
        EXPECT_EQ(job.error.has_value(), *row.expected != 0) << row.reason << ": an error of a strict job";
    }
}

TEST(JobNotes, SayWhichValuesDoNotShowAsTheyAre)
{
    struct Row
    {
        const char *csv;
        const char *options;
        const char *expected;
        const char *first; ///< what the line of the first such value begins with
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Number,Northing\n12345,12345.678\n1,0\n", "", "", "", "all fit to the last character"},
        {"Number,Northing\n1,2\n123456,3\n1234567,4\n", "",
         "2 values are wider than the field \"Number\" of the table \"Points\", the first one in row 2, line 5 of the "
         "report",
         "123456|", "wider than the column, which keeps them whole"},
        {"Number,Northing\n1,2\n123456,3\n", R"("options": {"printHash": true}, )",
         "1 value is wider than the field \"Number\" of the table \"Points\" and shows as #, in row 2, line 5 of the "
         "report",
         "#####|", "replaced"},
        {"Number,Northing\n123456,2\n", R"("options": {"excel": true}, )", "", "",
         "a spreadsheet has no columns to fit"},
        {"Number,Northing\n1,\n2,5\n,\n", "",
         "2 values of the field \"Northing\" of the table \"Points\" are missing and show as 0, the first one in row 1, "
         "line 4 of the report",
         "1    |", "a missing text shows as none and is not a reason"},
        {"Number,Northing\n1,\n", R"("options": {"zeroBlank": true}, )", "", "", "blanks are not an elevation"},
        {"Number,Northing\n1,2\n2,NAN\n3,-INF\n", "",
         "2 values of the field \"Northing\" of the table \"Points\" are infinite or not a number, the first one in row "
         "2, line 5 of the report",
         "2    |", "no elevation either"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("p.csv", row.csv);
        job.run(
            templateJob(R"("p": {"csv": "p.csv"})", R"({"line": "x"}, {"table": "Points", "data": "p"})", row.options));
        EXPECT_FALSE(job.error) << row.reason;
        QString notes = QString::fromStdString(notesOf(job));
        notes.remove(QRegularExpression(QStringLiteral("job\\.json:1:\\d+: note: ")));
        EXPECT_EQ(notes.toStdString(), row.expected) << row.reason;
        if (!job.notes.said().empty()) {
            const kareport::JobNote note = job.notes.said().front();
            EXPECT_TRUE(job.text()
                            .section(u'\n', int(note.line) - 1, int(note.line) - 1)
                            .startsWith(QLatin1StringView(row.first)))
                << row.reason << "\n"
                << job.text().toStdString();
        }
    }
}

TEST(JobNotes, CompareVariablesAndNotTheirIdentifiers)
{
    using namespace markup;
    const QByteArray table =
        output("Table", "Points", "D", {field("Code", "Code", "5"), field("Elevation", "H", "9.3")});
    const QByteArray dictionary = element(
        "Dictionary",
        element("DictionaryName", "D") +
            element("VariableList", joined({variable(3, "Code", "TEXT"), variable(3, "Elevation", "ELEVATION")})));
    TestJob job;
    job.folder.put("t.xml",
                   element("ReportTemplate", element("Name", "T") + element("Title", "t") + element("Tables", table) +
                                                 element("Dictionaries", dictionary) +
                                                 element("Options", separatorOption("124"))));
    job.folder.put("p.csv", "Code\nx\n");
    job.run(templateJob(R"("p": {"csv": "p.csv"})", tableStep));
    EXPECT_FALSE(job.error) << job.text().toStdString();
    QString notes = QString::fromStdString(notesOf(job));
    notes.remove(QRegularExpression(QStringLiteral("job\\.json:1:\\d+: note: ")));
    EXPECT_EQ(notes.toStdString(), "no column fills the field \"Elevation\" of the table \"Points\"")
        << "the text of another variable is not a number";
    job.folder.put("p.csv", "Code,Elevation\nx,\n,5\n");
    job.run(templateJob(R"("p": {"csv": "p.csv"})", tableStep));
    EXPECT_TRUE(job.text().startsWith(QStringLiteral("x    |    0.000\n"))) << job.text().toStdString();
    notes = QString::fromStdString(notesOf(job));
    notes.remove(QRegularExpression(QStringLiteral("job\\.json:1:\\d+: note: ")));
    EXPECT_EQ(
        notes.toStdString(),
        "1 value of the field \"Elevation\" of the table \"Points\" is missing and shows as 0, in row 1, line 1 of "
        "the report")
        << "a zero that is not in the data";
}

TEST(JobNotes, NameTheVariableThatShowsInsteadOfAnother)
{
    using namespace markup;
    const QByteArray table =
        output("Table", "Points", "D", {field("Ground", "Ground", "9.3"), field("Elevation", "H", "9.3")});
    const QByteArray dictionary = element(
        "Dictionary", element("DictionaryName", "D") +
                          element("VariableList",
                                  joined({variable(3, "Ground", "ELEVATION"), variable(3, "Elevation", "ELEVATION")})));
    TestJob job;
    job.folder.put("t.xml",
                   element("ReportTemplate", element("Name", "T") + element("Title", "t") + element("Tables", table) +
                                                 element("Dictionaries", dictionary) +
                                                 element("Options", separatorOption("124"))));
    job.folder.put("p.csv", "Ground\n5\n");
    job.run(templateJob(R"("p": {"csv": "p.csv"})", tableStep));
    EXPECT_FALSE(job.error) << job.text().toStdString();
    QString notes = QString::fromStdString(notesOf(job));
    notes.remove(QRegularExpression(QStringLiteral("job\\.json:1:\\d+: note: ")));
    EXPECT_EQ(notes.toStdString(),
              "no column fills the field \"Elevation\" of the table \"Points\"; \"Ground\" has the same "
              "ID and shows there");
}

TEST(JobNotes, SayWhichSortKeysAreNoVariables)
{
    using namespace markup;
    struct Row
    {
        const char *key;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"NUMBER", "", "names count without their case"},
        {"Nubmer",
         "the sort key \"Nubmer\" of the table \"Points\" is not a variable of the dictionary \"Survey\": did you mean "
         "\"Number\"?",
         "misspelt"},
        {"Gradient", "the sort key \"Gradient\" of the table \"Points\" is not a variable of the dictionary \"Survey\"",
         "nothing near"},
    };
    for (const Row &row : rows) {
        const QByteArray content = surveyTemplate(
            output("Table", "Points", "Survey", {field("Number", "Pt", "5"), field("Northing", "North", "9.3")},
                   {"Northing", row.key}),
            "", separatorOption("124"));
        TestJob job;
        job.folder.put("t.xml", content);
        job.folder.put("p.csv", "Number,Northing\n2,2\n1,2\n3,1\n");
        job.run(templateJob(R"("p": {"csv": "p.csv"})", tableStep));
        EXPECT_FALSE(job.error) << row.reason << ": " << job.text().toStdString();
        const QString place =
            QStringLiteral("t.xml:1:%1: note: ").arg(content.indexOf("<VariableName>" + QByteArray(row.key)) + 1);
        EXPECT_EQ(notesOf(job), *row.expected != 0 ? place.toStdString() + row.expected : "") << row.reason;
        if (*row.expected != 0) {
            ASSERT_FALSE(job.notes.said().empty()) << row.reason;
            EXPECT_EQ(job.notes.said().front().kind, kareport::JobNote::Kind::UnknownSortKey);
            EXPECT_TRUE(job.text().contains(QStringLiteral("3    |    1.000"))) << job.text().toStdString();
            EXPECT_LT(job.text().indexOf(QStringLiteral("\n2    |")), job.text().indexOf(QStringLiteral("\n1    |")))
                << "the key before it counts, as ever";
        }
        job.run(R"("strict": true, )" + templateJob(R"("p": {"csv": "p.csv"})", tableStep));
        EXPECT_EQ(job.error.has_value(), *row.expected != 0) << row.reason << ": an error of a strict job";
    }
}

TEST(JobNotes, SayWhatABlockDoesNotShow)
{
    struct Row
    {
        const char *values;
        const char *options;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"({"Number": "1", "Northing": 2})", "", "", "all shows"},
        {R"({"Number": "123456", "Northing": 2})", "", "", "a block has no columns that a wide value would move"},
        {R"({"Number": "123456", "Northing": 2})", R"("options": {"printHash": true}, )",
         "1 value is wider than the field \"Number\" of the block \"Point\" and shows as #, in row 1, line 2 of the report",
         "nothing of it shows"},
        {R"({"Number": "1", "Northing": "INF"})", "",
         "1 value of the field \"Northing\" of the block \"Point\" is infinite or not a number, in row 1, line 3 of the "
         "report",
         "no elevation"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.run(templateJob(QByteArray(R"("p": {"values": )") + row.values + "}",
                            R"({"line": "x"}, {"block": "Point", "data": "p"})", row.options));
        EXPECT_FALSE(job.error) << row.reason << ": " << job.text().toStdString();
        QString notes = QString::fromStdString(notesOf(job));
        notes.remove(QRegularExpression(QStringLiteral("job\\.json:1:\\d+: note: ")));
        EXPECT_EQ(notes.toStdString(), row.expected) << row.reason << "\n" << job.text().toStdString();
    }
}

TEST(JobNotes, NumbersThatShowAsBlanksAreInTheirFileAlone)
{
    TestJob job;
    job.folder.put("p.csv", "Number,Northing\n1,2\n2,\n3,\n");
    job.run(templateJob(R"("p": {"csv": "p.csv", "units": {"length": "m"}})", tableStep,
                        R"("strict": true, "options": {"zeroBlank": true}, )"));
    EXPECT_FALSE(job.error) << job.text().toStdString();
    EXPECT_EQ(notesOf(job), "") << "blanks were asked for";
    ASSERT_EQ(job.notes.all().size(), 1U);
    const kareport::JobNote &note = job.notes.all().front();
    EXPECT_EQ(note.kind, kareport::JobNote::Kind::BlankValue);
    EXPECT_EQ(note.values, 2U);
    EXPECT_EQ(note.firstRow, 2U);
}

TEST(JobNotes, LinesOfABlockThatAreLeftOutAsBlanksAreInTheirFileAlone)
{
    TestJob job;
    job.folder.put("p.csv", "Number,Northing\n1,\n");
    job.run(templateJob(R"("p": {"csv": "p.csv", "units": {"length": "m"}})", R"({"block": "Point", "data": "p"})",
                        R"("strict": true, "options": {"zeroBlank": true}, )"));
    EXPECT_FALSE(job.error) << job.text().toStdString();
    EXPECT_EQ(notesOf(job), "") << "a number that is missing was not to show";
    ASSERT_EQ(job.notes.all().size(), 1U);
    const kareport::JobNote &note = job.notes.all().front();
    EXPECT_EQ(note.kind, kareport::JobNote::Kind::BlankValue);
    EXPECT_EQ(note.values, 1U);
    EXPECT_EQ(note.dataPlace->line, 2);
    EXPECT_EQ(note.dataPlace->column, 3);
}

TEST(JobNotes, AreBounded)
{
    TestJob job;
    QByteArray header = "Number,Northing";
    for (int i = 0; i < 150'000; ++i) {
        header += ",x" + QByteArray::number(i, 36);
    }
    job.folder.put("p.csv", header + "\n");
    job.run(templateJob(R"("p": {"csv": "p.csv"})", tableStep));
    EXPECT_FALSE(job.error) << job.text().toStdString();
    ASSERT_EQ(job.notes.said().size(), 101U);
    EXPECT_EQ(job.notes.said().back().about.text.toStdString(),
              "149900 more columns are not variables of the dictionary \"Survey\"");
    EXPECT_EQ(job.notes.said()[99].about.place->column, header.indexOf(",x2r,") + 2) << "places are those of the names";
}

TEST(JobNotes, DataWithoutARowHasNoMistake)
{
    for (const char *set : {R"("json": "none.json")", R"("values": [])", R"("csv": "none.csv")"}) {
        TestJob job;
        job.folder.put("none.json", " [ ] ");
        job.folder.put("none.csv", "Number,Northing\n");
        job.run(templateJob(QByteArray(R"("p": {)") + set + "}", tableStep, "\"strict\": true, "));
        EXPECT_FALSE(job.error) << set << job.text().toStdString();
        EXPECT_EQ(notesOf(job), "") << set;
    }
}

TEST(JobNotes, ValuesHaveTheirPlaceInTheData)
{
    struct Row
    {
        const char *set;
        const char *table;
        const char *expected; ///< file, line and column of the first value that is missing
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("csv": "p.csv")", "Points", "p.csv:4:3", "the empty cell"},
        {R"("csv": "p.csv")", "Sorted", "p.csv:6:3", "of the first row in the order that is printed"},
        {R"("csv": "p.csv", "skip": 1, "header": false, "order": "PN")", "Points", "p.csv:4:3", "without a header row"},
        {R"("csv": "other.csv", "columns": {"Northing": "N"})", "Points", "other.csv:3:4", "a column that was chosen"},
        {R"("json": "p.json")", "Points", "p.json:2:29", "a key without a value"},
        {R"("json": "none.json")", "Points", "none.json:2:1", "a row without the key"},
        {R"("values": [{"Number": 1, "Northing": 5}, {"Number": 2, "Northing": null}])", "Points", "job.json:1:#",
         "in the job"},
        {R"("sqlite": "points.db", "table": "points")", "Points", "points.db", "a database has no lines"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.folder.put("p.csv", "Number,Northing\n9,5\n8,5\n7,\n3,4\n1,\n");
        job.folder.put("other.csv", "Number,N\n1,5\n\xC3\xA4x,\n");
        job.folder.put("p.json", "[{\"Number\": 1, \"Northing\": 2},\n {\"Number\": 1, \"Northing\" : null}]");
        job.folder.put("none.json", "{\"Number\": 1, \"Northing\": 2}\n{\"Number\": 1}\n");
        geo::runSql(job.folder.path("points.db"),
                    "CREATE TABLE points (Number TEXT, Northing REAL); INSERT INTO points VALUES (1, 5), (2, NULL)");
        job.run(templateJob(QByteArray(R"("p": {)") + row.set + "}",
                            QByteArray(R"({"table": ")") + row.table + R"(", "data": "p"})"));
        ASSERT_FALSE(job.error) << row.reason << job.text().toStdString();
        ASSERT_EQ(job.notes.said().size(), 1U) << row.reason << notesOf(job);
        const kareport::JobNote note = job.notes.said().front();
        QString place = note.dataFile.section(u'/', -1);
        if (note.dataPlace) {
            place += QStringLiteral(":%1:%2").arg(note.dataPlace->line).arg(note.dataPlace->column);
        }
        place.replace(QRegularExpression(QStringLiteral("job\\.json:1:\\d+")), QStringLiteral("job.json:1:#"));
        EXPECT_EQ(place.toStdString(), row.expected) << row.reason;
    }
}

TEST(JobNotes, APlaceIsFoundFarBehind)
{
    QByteArray csv = "Number,Northing\n";
    for (int i = 0; i < 30'000; ++i) {
        csv += QByteArray::number(i) + (i == 25'000 ? ",\n" : ",1\n");
    }
    TestJob job;
    job.folder.put("p.csv", csv);
    job.run(templateJob(R"("p": {"csv": "p.csv"})", tableStep));
    ASSERT_EQ(job.notes.said().size(), 1U);
    EXPECT_EQ(job.notes.said().front().firstRow, 25'001U);
    ASSERT_TRUE(job.notes.said().front().dataPlace);
    EXPECT_EQ(job.notes.said().front().dataPlace->line, 25'002);
    EXPECT_EQ(job.notes.said().front().dataPlace->column, 7);
}

TEST(JobNotes, AreErrorsInAStrictJob)
{
    struct Row
    {
        const char *set;
        bool isWrong;
        const char *reason;
        const char *step = tableStep;
        const char *more = "";
    };
    constexpr const char *pointBlock = R"({"block": "Point", "data": "p"})";
    constexpr const char *totalStep = R"({"table": "Points", "data": "p", "totals": [{"max": "Northing"}]})";
    constexpr const char *zeroBlank = R"("options": {"zeroBlank": true}, )";
    constexpr Row rows[] = {
        {R"("csv": "good.csv")", false, "nothing to note"},
        {R"("csv": "misspelt.csv")", true, "known before the rows are read"},
        {R"("json": "points.json")", true, "known after them"},
        {R"("csv": "wide.csv")", true, "a value that does not fit"},
        {R"("csv": "empty.csv")", true, "a number that is missing"},
        {R"("csv": "infinite.csv")", true, "a number that is not finite"},
        {R"("csv": "empty.csv")", true, "a number that is missing, in no line of a block", pointBlock},
        {R"("csv": "empty.csv")", false, "a number that shows as blanks, as it was asked for", tableStep, zeroBlank},
        {R"("csv": "empty.csv")", true, "the same, in no total", totalStep, zeroBlank},
        {R"("csv": "good.csv")", false, "a total of all values", totalStep, zeroBlank},
    };
    for (const Row &row : rows) {
        for (const bool isStrict : {true, false}) {
            TestJob job;
            putData(job);
            job.run(templateJob(QByteArray(R"("p": {)") + row.set + "}", row.step,
                                QByteArray(row.more) + (isStrict ? R"("strict": true, )" : R"("strict": false, )")));
            EXPECT_EQ(job.error.has_value(), row.isWrong && isStrict) << row.reason;
            if (job.error) {
                EXPECT_EQ(job.error->message(), job.notes.said().front().about.message()) << row.reason;
            }
        }
    }
}

TEST(JobNotes, NameTheUnitsThatWereNotSaid)
{
    struct Row
    {
        const char *units;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "m2 deg", "both defaults"},
        {R"(, "units": {"length": "m"})", "m2 deg", "a unit that no number has"},
        {R"(, "units": {"area": "m2"})", "deg", "the default itself may be said"},
        {R"(, "units": {"area": "ha", "angle": "dms"})", "", "all are said"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.run(templateJob(QByteArray(R"("s": {"values": {"Client": "C", "Area": 1, "Bearing": "N45-0-0E"})") +
                                row.units + "}",
                            R"({"block": "Site", "data": "s"})", "\"strict\": true, "));
        EXPECT_FALSE(job.error) << row.reason << ": no reason for an error";
        QStringList keys;
        for (const kareport::JobNote &note : job.notes.all()) {
            EXPECT_FALSE(note.isToBeSaid()) << row.reason;
            keys.append(note.about.text.section(QStringLiteral(": "), 1).section(u' ', 0, 0));
        }
        EXPECT_EQ(keys.join(u' ').toStdString(), row.expected) << row.reason;
    }
}

TEST(JobNotes, AreWrittenAsJson)
{
    kareport::JobNotes notes;
    EXPECT_EQ(notes.toJson().simplified(), "[ ]");
    const kareport::JobNote note = {
        kareport::JobNote::Kind::UnknownColumn,
        {QStringLiteral("p.csv"), kareport::TextPlace{3, 7}, QStringLiteral("Gr\u00F6\u00DFe")}};
    notes.add(note);
    notes.add(note);
    notes.add({kareport::JobNote::Kind::UnfilledField, {QStringLiteral("j.json"), std::nullopt, QStringLiteral("b")}});
    const QJsonArray list = QJsonDocument::fromJson(notes.toJson()).array();
    ASSERT_EQ(list.size(), 2) << "a note is kept once";
    const QJsonObject first = list[0].toObject();
    EXPECT_EQ(first[QStringLiteral("kind")].toString(), QStringLiteral("unknown-column"));
    EXPECT_EQ(first[QStringLiteral("file")].toString(), QStringLiteral("p.csv"));
    EXPECT_EQ(first[QStringLiteral("line")].toInt(), 3);
    EXPECT_EQ(first[QStringLiteral("column")].toInt(), 7);
    EXPECT_EQ(first[QStringLiteral("text")].toString(), QStringLiteral("Gr\u00F6\u00DFe"));
    const QJsonObject second = list[1].toObject();
    EXPECT_EQ(second[QStringLiteral("kind")].toString(), QStringLiteral("unfilled-field"));
    EXPECT_FALSE(second.contains(QStringLiteral("line"))) << "no place is not a line";
}

} // namespace
