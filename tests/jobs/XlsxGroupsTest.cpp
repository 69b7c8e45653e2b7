#include "LayersJob.h"
#include "ResultJob.h"
#include "Workbook.h"

#include <gmock/gmock.h>

namespace
{

using jobs::ResultJob;
using jobs::Workbook;
using testing::HasSubstr;
using testing::Not;

/// Runs a step over the five rows of two layers.
void runStep(ResultJob &job, const QByteArray &step, const QByteArray &output, const QByteArray &data = jobs::fiveRows,
             const QByteArray &more = {})
{
    job.folder.put("t.xml", jobs::layersTemplate());
    job.run(jobs::templateJob(data, "{" + step + "}", more) + R"(, "output": [)" + output + "]");
}

QString warningsOf(const ResultJob &job)
{
    return job.warnings.at("p.xlsx").join(u'|');
}

const char *const grouped = R"("table": "Sorted", "data": "v",
    "groups": [{"by": "Layer", "heading": "Layer {Layer}", "totals": [{"label": "Sum", "sum": ["Volume", "Area"]},
        {"label": "Mean", "mean": "Volume", "max": "Area"}, {"count": ["Number", "Area"]}]}],
    "totals": [{"label": "Total", "sum": ["Volume", "Area"]}], "rounding": "printed")";

TEST(XlsxGroups, HeadingsAndTotalsAreRows)
{
    ResultJob job;
    runStep(job, grouped, R"("p.xlsx")");
    const Workbook book(job);
    EXPECT_THAT(book.cells(0), HasSubstr("A2 s Layer A\nA3 s A\nB3 s 1\nC3 n 0.1 0.000\nD3 n 1 0.000\n"));
    EXPECT_THAT(book.cells(0), HasSubstr("A6 s Sum\nC6 n 0.6 0.000\nD6 n 6 0.000\n"
                                         "A7 s Mean\nC7 n 0.2 0.000\nD7 n 3 0.000\n"
                                         "B8 n 3 0\nD8 n 3 0\nA9 s Layer B\n"))
        << "a count is a number under a text as well";
    EXPECT_THAT(book.cells(0), HasSubstr("A15 s Total\nC15 n 3.6 0.000\nD15 n 15 0.000\n"));
    EXPECT_EQ(book.of(0, "frozen"), QStringLiteral("A2"));
    EXPECT_EQ(book.of(0, "filter"), QStringLiteral("A1:D11")) << "without the totals after the last row";
    EXPECT_EQ(book.of(0, "widths"), QStringLiteral("8 6 11 10")) << "of the fields, with room beside them";
    EXPECT_EQ(book.of(0, "repeated"), QStringLiteral("Sorted!$1:$1")) << "on every sheet of paper";
}

TEST(XlsxGroups, TotalsAreFormulasWhereTheyAreAskedFor)
{
    ResultJob job;
    runStep(job, grouped, R"({"file": "p.xlsx", "totals": "formulas"})");
    const std::string cells = Workbook(job).cells(0);
    EXPECT_THAT(cells, HasSubstr("C6 f SUBTOTAL(9,C3:C5) = 0.6\nD6 f SUBTOTAL(9,D3:D5) = 6\n"));
    EXPECT_THAT(cells, HasSubstr("C7 f SUBTOTAL(1,C3:C5) = 0.2\nD7 f SUBTOTAL(4,D3:D5) = 3\n"));
    EXPECT_THAT(cells, HasSubstr("B8 n 3 0\nD8 f SUBTOTAL(2,D3:D5) = 3\n")) << "a count of texts is a value";
    EXPECT_THAT(cells, HasSubstr("C15 f SUBTOTAL(9,C3:C11) = 3.6\n")) << "which passes over the totals of groups";
    EXPECT_EQ(warningsOf(job),
              QStringLiteral("2 totals are values: a formula would show other digits, or does not reach their rows"));
}

TEST(XlsxGroups, AFormulaThatWouldShowOtherDigitsIsAValue)
{
    const QByteArray halves =
        R"("v": {"values": [{"Number": "1", "Volume": 0.0006}, {"Number": "2", "Volume": 0.0006}]})";
    const auto cells = [&](const char *rounding, const char *values, const char *total) {
        ResultJob job;
        runStep(job,
                QByteArray(R"("table": "Free", "data": "v", "rounding": ")") + rounding + R"(", "totals": [{")" +
                    total + R"(": "Volume"}])",
                R"({"file": "p.xlsx", "totals": "formulas", "values": ")" + QByteArray(values) + "\"}", halves);
        const std::string all = Workbook(job).cells(0);
        return all.substr(all.find("C4 "));
    };
    EXPECT_EQ(cells("exact", "printed", "sum"), "C4 n 0.001 0.000\n") << "two cells of 0.001 are 0.002";
    EXPECT_EQ(cells("printed", "printed", "sum"), "C4 f SUBTOTAL(9,C2:C3) = 0.002\n");
    EXPECT_EQ(cells("exact", "exact", "sum"), "C4 f SUBTOTAL(9,C2:C3) = 0.0012\n");
    EXPECT_EQ(cells("printed", "exact", "sum"), "C4 n 0.002 0.000\n");
    EXPECT_EQ(cells("exact", "printed", "max"), "C4 f SUBTOTAL(4,C2:C3) = 0.001\n");
}

TEST(XlsxGroups, AFormulaAddsNoTotalThatIsAValue)
{
    ResultJob job;
    // The mean of 0.002 and 0.003 is a tie: as a value it would be in the sum of the table.
    runStep(job, R"("table": "Sorted", "data": "v", "rounding": "printed",
        "groups": [{"by": "Layer", "totals": [{"mean": "Volume"}]}], "totals": [{"sum": "Volume", "min": "Area"}])",
            R"({"file": "p.xlsx", "totals": "formulas"})",
            R"("v": {"values": [{"Layer": "A", "Number": "1", "Volume": 0.002, "Area": 1},
            {"Layer": "A", "Number": "2", "Volume": 0.003, "Area": 2}, {"Layer": "B", "Number": "3", "Volume": 1}]})");
    const std::string cells = Workbook(job).cells(0);
    EXPECT_THAT(cells, HasSubstr("C4 n 0.002 0.000\n"));
    EXPECT_THAT(cells, HasSubstr("C7 n 1.005 0.000\nD7 f SUBTOTAL(5,D2:D5) = 1\n"));
}

TEST(XlsxGroups, OneSheetOfOneTableKeepsItsHeadingInView)
{
    ResultJob job;
    runStep(job, grouped, R"({"file": "p.xlsx", "sheets": "one"})");
    const Workbook book(job);
    EXPECT_EQ(book.of(0, "frozen"), QStringLiteral("A5"));
    EXPECT_EQ(book.of(0, "filter"), QString());
    ResultJob two;
    runStep(two, R"("table": "Free", "data": "v"}, {"table": "Free", "data": "v")",
            R"({"file": "p.xlsx", "sheets": "one"})");
    EXPECT_EQ(Workbook(two).of(0, "frozen"), QString()) << "of two tables no heading is that of all rows";
}

TEST(XlsxGroups, ExactZerosKeepTheirNumber)
{
    ResultJob job;
    runStep(job, R"("table": "Free", "data": "v")", R"({"file": "p.xlsx", "values": "exact"})",
            R"("v": {"values": [{"Number": "1", "Volume": -0.0004, "Area": 0}, {"Number": "2"}]})",
            R"("options": {"zeroBlank": true}, )");
    const std::string cells = Workbook(job).cells(0);
    EXPECT_THAT(cells, HasSubstr("C2 n -0.0004 \"-\"0.000;\"-\"0.000\n"));
    EXPECT_THAT(cells, HasSubstr("D2 n 0 ;;;\n")) << "a zero that shows as blanks is one";
    EXPECT_THAT(cells, Not(HasSubstr("D3"))) << "what is missing is none";
}

TEST(XlsxGroups, BearingsHaveTheirDegreesBesideThem)
{
    const QByteArray data =
        R"("v": {"units": {"angle": "deg"}, "values": [{"Number": "1", "Bearing": 45.5}, {"Number": "2"}]})";
    ResultJob job;
    runStep(job, R"("table": "Angles", "data": "v")", R"({"file": "p.xlsx", "bearingValues": true})", data);
    const std::string cells = Workbook(job).cells(0);
    EXPECT_THAT(cells, HasSubstr("C1 s Bearing\nD1 s Bearing (\xC2\xB0)\n"));
    EXPECT_THAT(cells, HasSubstr("C2 s N 45\xC2\xB0"
                                 "30'00\" E\nD2 n 45."));
    EXPECT_THAT(cells, Not(HasSubstr("C3"))) << "a bearing that is missing is none to the north";
    ResultJob block;
    block.run(
        jobs::templateJob(R"("s": {"values": {"Client": "C", "Bearing": 45.5}})", R"({"block": "Site", "data": "s"})") +
        R"(, "output": [{"file": "p.xlsx", "bearingValues": true}])");
    EXPECT_THAT(Workbook(block).cells(0), HasSubstr("30'00\" E\nC4 n 45."));
}

TEST(XlsxGroups, ALongTextIsCutWithItsEscapes)
{
    ResultJob job;
    runStep(job, R"("table": "Free", "data": "v")", R"("p.xlsx")",
            R"("v": {"values": [{"Number": ")" + QByteArray("_x0041_").repeated(10'000) + R"("}]})");
    const std::string cells = Workbook(job).cells(0);
    const std::size_t start = cells.find("B2 s ");
    ASSERT_NE(start, std::string::npos);
    const std::string text = cells.substr(start + 5, cells.find('\n', start) - start - 5);
    EXPECT_EQ(text, std::string(QByteArray("_x0041_").repeated(10'000).constData(), text.size()))
        << "a beginning of it";
    EXPECT_EQ(text.size(), 17'641U) << "13 characters in the file for 7 of the text";
    EXPECT_EQ(warningsOf(job), QStringLiteral("1 texts are longer than a cell of a workbook holds, and are cut"));
}

} // namespace
