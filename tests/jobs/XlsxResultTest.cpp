#include "CommaLocale.h"
#include "ResultJob.h"
#include "Workbook.h"

#include <gmock/gmock.h>

#include <clocale>

namespace
{

using jobs::ResultJob;
using jobs::templateJob;
using jobs::Workbook;
using testing::HasSubstr;

QByteArray withOutput(const QByteArray &job, const QByteArray &output = R"("p.xlsx")")
{
    return job + R"(, "output": [)" + output + "]";
}

const char *const points =
    R"("p": {"values": [{"Number": "=1+1", "Northing": 12.3456}, {"Number": "_x0041_"}, {"Number": "7", "Northing": -7}]})";
const char *const oneTable = R"({"line": "x", "style": 1}, {"table": "Points", "data": "p"})";

TEST(XlsxResult, NumbersAreNumbersAndTextsAreTexts)
{
    ResultJob job;
    job.run(withOutput(templateJob(points, oneTable, R"("title": "Stakeout", )")));
    const Workbook book(job);
    EXPECT_EQ(book.sheets().join(u'|'), QStringLiteral("Stakeout|Points"));
    EXPECT_EQ(book.cells(0), "A1 s Stakeout\nA3 s x\n");
    EXPECT_EQ(book.cells(1), "A1 s Pt\nB1 s North\nA2 s =1+1\nB2 n 12.346 0.000\nA3 s _x0041_\nA4 s 7\nB4 n -7 0.000\n")
        << "no formula, no escape, and nothing where a value is missing";
    EXPECT_EQ(book.of(1, "frozen"), QStringLiteral("A2"));
    EXPECT_EQ(book.of(1, "filter"), QStringLiteral("A1:B4"));
}

TEST(XlsxResult, ExactNumbersAreThoseOfTheData)
{
    ResultJob job;
    job.run(withOutput(templateJob(points, oneTable), R"({"file": "p.xlsx", "values": "exact"})"));
    EXPECT_THAT(Workbook(job).cells(1), HasSubstr("B2 n 12.3456 0.000\n"));
}

TEST(XlsxResult, StationsAndOffsetsAreNumbersInTheirNotation)
{
    ResultJob job;
    job.run(withOutput(
        templateJob(R"("p": {"values": [{"Chainage": 12345.678}]})", R"({"table": "Stations", "data": "p"})")));
    EXPECT_EQ(Workbook(job).cells(0), "A1 s Station\nA2 n 12345.678 0+000.000\n");
}

TEST(XlsxResult, AllMayBeInOneSheet)
{
    ResultJob job;
    const QByteArray data = QByteArray(points) + R"(, "s": {"values": {"Client": "C", "Area": 12.5, "Bearing": 45.5}})";
    job.run(withOutput(
        templateJob(data, R"({"block": "Site", "data": "s"}, {"table": "Points", "data": "p"}, {"line": "x"})"),
        R"({"file": "p.xlsx", "sheets": "one"})"));
    const Workbook book(job);
    EXPECT_EQ(book.sheets().join(u'|'), QStringLiteral("Title"));
    EXPECT_EQ(book.cells(0), "A1 s Title\nA3 s Client\nB3 s C\nA4 s Area\nB4 n 12.5 0.000\nA5 s Bearing\n"
                             "B5 s N 45\xC2\xB0"
                             "30'00\" E\nA7 s Pt\nB7 s North\nA8 s =1+1\nB8 n 12.346 0.000\n"
                             "A9 s _x0041_\nA10 s 7\nB10 n -7 0.000\nA12 s x\n");
}

TEST(XlsxResult, EachTableHasItsSheet)
{
    ResultJob job;
    job.run(withOutput(templateJob(points, R"({"table": "Points", "data": "p"}, {"table": "Points", "data": "p"})")));
    EXPECT_EQ(Workbook(job).sheets().join(u'|'), QStringLiteral("Points|Points (2)"));
}

TEST(XlsxResult, TheDocumentSaysWhatItIs)
{
    ResultJob job;
    job.run(withOutput(templateJob(points, oneTable, R"("title": "A & B", "application": "TALVEN Survey", )")));
    const Workbook book(job);
    EXPECT_EQ(book.property("title"), QStringLiteral("A & B"));
    EXPECT_EQ(book.property("creator"), QStringLiteral("TALVEN Survey"));
    EXPECT_EQ(book.property("description"), QStringLiteral("Lengths in m, areas in m², angles in °"));
    EXPECT_THAT(book.property("created").toStdString(), HasSubstr("2024-03-05T"));
}

TEST(XlsxResult, TheSameJobIsTheSameBytes)
{
    ResultJob job;
    job.run(withOutput(templateJob(points, oneTable)));
    const std::string first = job.bytes("p.xlsx");
    job.run(withOutput(templateJob(points, oneTable)));
    EXPECT_EQ(job.bytes("p.xlsx") == first, true);
}

TEST(XlsxResult, NumbersDoNotDependOnTheLocale)
{
    const CommaLocale comma;
    if (!comma.isThere()) {
        GTEST_SKIP() << "no locale with a decimal comma can be made";
    }
    ResultJob job;
    job.run(withOutput(templateJob(points, oneTable)));
    EXPECT_EQ(std::setlocale(LC_NUMERIC, nullptr), comma.name()) << "it is as it was";
    EXPECT_THAT(Workbook(job).cells(1), HasSubstr("B2 n 12.346 0.000\n"));
}

TEST(XlsxResult, KeysOfTheWorkbook)
{
    ResultJob job;
    job.run(withOutput(templateJob(points, oneTable), R"({"file": "p.xlsx", "values": "data"})"));
    EXPECT_THAT(job.error.toStdString(), HasSubstr("one of printed, exact"));
    job.run(withOutput(templateJob(points, oneTable), R"({"file": "p.xlsx", "sheets": "two"})"));
    EXPECT_THAT(job.error.toStdString(), HasSubstr("one of tables, one"));
    job.run(withOutput(templateJob(points, oneTable), R"({"file": "p.xlsx", "bearingValue": true})"));
    EXPECT_THAT(job.error.toStdString(), HasSubstr("did you mean \"bearingValues\"?"));
}

} // namespace
