#include "LayersJob.h"

#include <gtest/gtest.h>

namespace
{

using jobs::run;
using jobs::TestJob;

TEST(GroupJob, WritesHeadingsAndTotals)
{
    TestJob test;
    const QString text = run(test, R"("table": "Sorted", "data": "v",
        "groups": [{"by": "Layer", "heading": "Layer {Layer}", "totals": [
            {"label": "{count} points", "sum": ["Volume", "Area"]}, {"label": "Mean", "mean": "Area"}]}],
        "totals": [{"label": "Total", "sum": ["Volume", "Area"]}])");
    EXPECT_EQ(text.toStdString(), "-\n"
                                  "Layer |Pt  |   Volume|    Area\n\n"
                                  "Layer A\n"
                                  "A     |1   |    0.100|   1.000\n"
                                  "A     |2   |    0.200|   2.000\n"
                                  "A     |5   |    0.300|   3.000\n"
                                  "      |    |---------|--------\n"
                                  "3 points   |    0.600|   6.000\n"
                                  "Mean  |    |         |   2.000\n"
                                  "Layer B\n"
                                  "B     |3   |    2.000|   4.000\n"
                                  "b     |4   |    1.000|   5.000\n"
                                  "      |    |---------|--------\n"
                                  "2 points   |    3.000|   9.000\n"
                                  "Mean  |    |         |   4.500\n"
                                  "      |    |---------|--------\n"
                                  "Total |    |    3.600|  15.000\n");
    EXPECT_TRUE(test.notes.said().empty()) << "the data has no reason for a note";
}

TEST(GroupJob, PutsTotalsIntoHeadings)
{
    TestJob test;
    const QString text = run(test, R"("table": "Sorted", "data": "v",
        "groups": [{"by": "Layer", "heading": "{Layer}: {count}, {sum:Volume} m3, {max:Area} {areaUnit}, {{x}"}])");
    EXPECT_EQ(text.toStdString(), "-\n"
                                  "Layer |Pt  |   Volume|    Area\n\n"
                                  "A: 3, 0.600 m3, 3.000 m², {x}\n"
                                  "A     |1   |    0.100|   1.000\n"
                                  "A     |2   |    0.200|   2.000\n"
                                  "A     |5   |    0.300|   3.000\n"
                                  "B: 2, 3.000 m3, 5.000 m², {x}\n"
                                  "B     |3   |    2.000|   4.000\n"
                                  "b     |4   |    1.000|   5.000\n");
}

TEST(GroupJob, NestsGroups)
{
    TestJob test;
    const QByteArray data = R"("v": {"values": [
        {"Site": "N", "Layer": "A", "Number": "1", "Volume": 1}, {"Site": "N", "Layer": "A", "Number": "2", "Volume": 2},
        {"Site": "N", "Layer": "B", "Number": "3", "Volume": 4}, {"Site": "S", "Layer": "B", "Number": "4", "Volume": 8}]})";
    const QString text = run(test, R"("table": "Free", "data": "v", "sort": ["Site", "Layer"],
        "groups": [{"by": ["Site"], "heading": "Site {Site}, {sum:Volume}", "totals": [{"label": "{Site}", "sum": "Volume"}]},
                   {"by": "Layer", "before": 1, "heading": "{Site}/{Layer}", "totals": [{"label": "{Layer}", "count": "Volume"}]}])",
                             data);
    EXPECT_EQ(text.toStdString(), "-\n"
                                  "Layer |Pt  |   Volume|    Area\n\n"
                                  "Site N, 7.000\n"
                                  "\n"
                                  "N/A\n"
                                  "A     |1   |    1.000|   0.000\n"
                                  "A     |2   |    2.000|   0.000\n"
                                  "      |    |---------|        \n"
                                  "A     |    |        2|        \n"
                                  "\n"
                                  "N/B\n"
                                  "B     |3   |    4.000|   0.000\n"
                                  "      |    |---------|        \n"
                                  "B     |    |        1|        \n"
                                  "      |    |---------|        \n"
                                  "N     |    |    7.000|        \n"
                                  "Site S, 8.000\n"
                                  "\n"
                                  "S/B\n"
                                  "B     |4   |    8.000|   0.000\n"
                                  "      |    |---------|        \n"
                                  "B     |    |        1|        \n"
                                  "      |    |---------|        \n"
                                  "S     |    |    8.000|        \n")
        << "a layer of the same name in another site is another group";
}

TEST(GroupJob, BlankLinesAreBetweenGroups)
{
    TestJob test;
    const QString text =
        run(test, R"("table": "Sorted", "data": "v", "groups": [{"by": "Layer", "heading": "{Layer}", "before": 2}])");
    EXPECT_EQ(text.toStdString(), "-\n"
                                  "Layer |Pt  |   Volume|    Area\n\n"
                                  "A\n"
                                  "A     |1   |    0.100|   1.000\n"
                                  "A     |2   |    0.200|   2.000\n"
                                  "A     |5   |    0.300|   3.000\n"
                                  "\n\n"
                                  "B\n"
                                  "B     |3   |    2.000|   4.000\n"
                                  "b     |4   |    1.000|   5.000\n")
        << "not under the heading of the table";
}

TEST(GroupJob, ShowsTheRowsThatFulfilConditions)
{
    const struct
    {
        const char *where;
        const char *numbers;
        const char *reason;
    } rows[] = {
        {R"({"of": "Volume", "above": 0.2})", "345", "above"},
        {R"({"of": "Volume", "below": 0.2})", "1", "below"},
        {R"({"of": "Area", "outside": 3})", "34", "outside"},
        {R"({"of": "Layer", "is": "a"})", "125", "one text, in any case"},
        {R"({"of": "Number", "is": ["1", 4]})", "14", "several"},
        {R"({"of": "Layer", "isNot": "B"})", "125", "none of them"},
        {R"({"of": "Note", "exists": true})", "", "no row has it"},
        {R"({"of": "Note", "exists": false})", "12345", "all lack it"},
        {R"({"of": "Volume", "above": 0.1}, {"of": "Layer", "is": "A"})", "25", "both"},
    };
    for (const auto &row : rows) {
        TestJob test;
        const QString text =
            run(test, R"("table": "Free", "data": "v", "sort": "Number", "where": [)" + QByteArray(row.where) + ']');
        QString numbers;
        for (const QString &line : text.split(u'\n').sliced(1)) {
            numbers += line.section(u'|', 1, 1).trimmed();
        }
        EXPECT_EQ(numbers, QStringLiteral("Pt") + QString::fromLatin1(row.numbers)) << row.reason;
    }
}

TEST(GroupJob, ComputesAndFlags)
{
    TestJob test;
    const QByteArray data = R"("v": {"units": {"length": "m"}, "values": [
        {"Number": "1", "Length": 12.345, "Width": 12.33}, {"Number": "2", "Length": 2, "Width": 2.5},
        {"Number": "3", "Length": 4}]})";
    const QString text = run(test, R"("table": "Wide", "data": "v",
        "compute": [{"variable": "Step", "difference": ["Length", "Width"]}, {"variable": "Area", "product": ["Length", "Width"]}],
        "running": [{"variable": "Row", "rowNumber": true}],
        "flags": [{"variable": "Mark", "of": "Length", "beside": "Width", "outside": 0.015},
                  {"variable": "Note", "text": "low", "of": "Step", "below": 0},
                  {"variable": "Note", "text": "high", "of": "Step", "above": 0.01}],
        "totals": [{"sum": ["Step", "Area"], "max": "Row"}])",
                             data);
    EXPECT_EQ(text.toStdString(), "-\n"
                                  "Pt |  Length|   Width|    Step|    Area|M|Note|Row\n\n"
                                  "1  |  12.345|  12.330|   0.015| 152.214| |high|  1\n"
                                  "2  |   2.000|   2.500|  -0.500|   5.000|*|low |  2\n"
                                  "3  |   4.000|   0.000|   0.000|   0.000| |    |  3\n"
                                  "   |        |        |--------|--------| |    |---\n"
                                  "   |        |        |  -0.485| 157.214| |    |  3\n");
    QStringList notes;
    for (const auto &note : test.notes.said()) {
        notes.append(note.about.text);
    }
    EXPECT_TRUE(notes.contains(
        QStringLiteral("1 value of the variable \"Step\" is missing and in no total of the table \"Wide\", in row 3")))
        << notes.join(u'\n').toStdString();
}

TEST(GroupJob, RunsOverRows)
{
    TestJob test;
    const QString text = run(test, R"("table": "Sorted", "data": "v", "groups": [{"by": "Layer"}],
        "running": [{"variable": "Area", "sum": "Length", "per": "group"}])");
    EXPECT_TRUE(text.contains(u"does not fit the result")) << "a sum of lengths is no area: " << text.toStdString();
    const QByteArray data = R"("v": {"values": [{"Number": "1", "Length": 0.1}, {"Number": "2", "Length": 0.2},
        {"Number": "2", "Length": 0.4}]})";
    const QString shown = run(test, R"("table": "Wide", "data": "v", "sort": "Number", "groups": [{"by": "Number"}],
        "running": [{"variable": "Width", "sum": "Length"}, {"variable": "Step", "difference": "Length"},
                    {"variable": "Note", "rowNumber": true, "per": "group"}])",
                              data);
    EXPECT_EQ(shown.toStdString(), "-\n"
                                   "Pt |  Length|   Width|    Step|    Area|M|Note|Row\n\n"
                                   "1  |   0.100|   0.100|   0.000|   0.000| |1   |  0\n"
                                   "2  |   0.200|   0.300|   0.100|   0.000| |1   |  0\n"
                                   "2  |   0.400|   0.700|   0.200|   0.000| |2   |  0\n");
}

TEST(GroupJob, AddsWhatIsPrintedWhereItIsAskedTo)
{
    const QByteArray data = R"("v": {"units": {"length": "m"}, "values": [
        {"Number": "1", "Length": 0.1}, {"Number": "2", "Length": 0.1}, {"Number": "3", "Length": 0.1},
        {"Number": "4", "Length": 0.1}]})";
    const auto total = [&](const char *rounding) {
        TestJob test;
        const QString text =
            run(test, R"("table": "Wide", "data": "v", "totals": [{"sum": "Length"}])" + QByteArray(rounding), data,
                R"("settings": {"lengthUnit": "usft"}, )");
        return text.trimmed().section(u'\n', -1).section(u'|', 1, 1).trimmed();
    };
    EXPECT_EQ(total(""), QStringLiteral("1.312")) << "0.4 m are 1.31233 US ft";
    EXPECT_EQ(total(R"(, "rounding": "exact")"), QStringLiteral("1.312"));
    EXPECT_EQ(total(R"(, "rounding": "printed")"), QStringLiteral("1.312")) << "four times 0.328";
    TestJob test;
    const QByteArray halves = R"("v": {"values": [{"Number": "1", "Area": 0.0006}, {"Number": "2", "Area": 0.0006}]})";
    const QString exact = run(test, R"("table": "Wide", "data": "v", "totals": [{"sum": "Area"}])", halves);
    EXPECT_TRUE(exact.trimmed().section(u'\n', -1).contains(u"0.001")) << exact.toStdString();
    const QString printed =
        run(test, R"("table": "Wide", "data": "v", "totals": [{"sum": "Area"}], "rounding": "printed")", halves);
    EXPECT_TRUE(printed.trimmed().section(u'\n', -1).contains(u"0.002")) << printed.toStdString();
}

TEST(GroupJob, BetweenTabsTotalsAreInTheirColumns)
{
    const QByteArray step =
        R"({"line": "-"}, {"table": "Sorted", "data": "v", "groups": [{"by": "Layer", "heading": "Layer {Layer}",
        "totals": [{"label": "{count} points", "sum": ["Volume", "Area"]}, {"label": "Layers", "count": "Layer"}]}],
        "totals": [{"label": "Mean", "mean": "Area"}]})";
    for (const bool isForm : {false, true}) { // of the template's separator, or of the option
        TestJob test;
        test.folder.put("t.xml", jobs::layersTemplate(isForm ? "124" : "9"));
        test.run(jobs::templateJob(jobs::fiveRows, step, isForm ? R"("options": {"excel": true}, )" : ""));
        EXPECT_EQ(test.text().toStdString(), "-\n"
                                             "Layer\tPt\tVolume\tArea\n\n"
                                             "Layer A\n"
                                             "A\t1\t0.100\t1.000\n"
                                             "A\t2\t0.200\t2.000\n"
                                             "A\t5\t0.300\t3.000\n"
                                             "3 points\t\t0.600\t6.000\n"
                                             "Layers\n"
                                             "3\t\t\t\n"
                                             "Layer B\n"
                                             "B\t3\t2.000\t4.000\n"
                                             "b\t4\t1.000\t5.000\n"
                                             "2 points\t\t3.000\t9.000\n"
                                             "Layers\n"
                                             "2\t\t\t\n"
                                             "Mean\t\t\t3.000\n")
            << isForm;
    }
}

TEST(GroupJob, LeavesJobsAloneThatDoNotAsk)
{
    TestJob test;
    const QString plain = run(test, R"("table": "Sorted", "data": "v")");
    TestJob grouped;
    EXPECT_EQ(run(grouped, R"("table": "Sorted", "data": "v", "groups": [{"by": "Layer"}])"), plain)
        << "groups without heading and totals show nothing";
    TestJob exact;
    EXPECT_EQ(run(exact, R"("table": "Sorted", "data": "v", "totals": [], "pageTotals": [], "where": [])"), plain);
}

TEST(GroupJob, SaysWhatIsInNoTotal)
{
    TestJob test;
    const QByteArray data =
        R"("v": {"values": [{"Number": "1", "Length": 1}, {"Number": "2"}, {"Number": "3", "Length": "INF"},
        {"Number": "4", "Length": "NAN"}, {"Number": "5", "Length": 2}]})";
    const QString text = run(test, R"("table": "Wide", "data": "v",
        "totals": [{"sum": "Length"}, {"mean": "Length"}, {"count": "Length"}, {"max": "Length", "count": "Note"}])",
                             data);
    EXPECT_TRUE(text.endsWith(u"   |   3.000|        |        |        | |    |   \n"
                              "   |   1.500|        |        |        | |    |   \n"
                              "   |       2|        |        |        | |    |   \n"
                              "   |   2.000|        |        |        | |   0|   \n"))
        << text.toStdString();
    std::vector<std::string> notes;
    for (const auto &note : test.notes.said()) {
        if (note.kind == kareport::JobNote::Kind::NotInTotal) {
            notes.push_back(note.about.text.toStdString());
        }
    }
    const std::vector<std::string> expected = {
        "1 value of the variable \"Length\" is missing and in no total of the table \"Wide\", in row 2",
        "2 values of the variable \"Length\" are infinite or not a number and in no total of the table \"Wide\", the "
        "first one in row 3"};
    EXPECT_EQ(notes, expected) << "a text that is only counted is not a reason for one";
}

} // namespace
