#include "JobOutputs.h"
#include "JobRunnerFixture.h"
#include "JobText.h"
#include "PdfReadBack.h"

#include <QBuffer>

#include <gtest/gtest.h>

#include <algorithm>

// What the PDFs of a job say of themselves.

namespace
{

using jobs::templateJob;
using kareport::OutputKind;

/// What a job that is read says of its PDFs, with a report of this title.
kareport::PdfDetails detailsOf(const QByteArray &pdf, const QString &title)
{
    const kareport::Job job = jobtext::jobOf(
        R"({"now": "2024-03-05T14:07:00", "application": "TALVEN Survey", "report": [], "pdf": )" + pdf + '}');
    UReportDoc report(kareport::surroundingsOf(job));
    report.SetTitle(title);
    std::vector<kareport::Output> outputs = {{QStringLiteral("a.pdf"), OutputKind::Pdf},
                                             {QStringLiteral("a.rep"), OutputKind::Report}};
    kareport::describePdfs(job, report, outputs);
    EXPECT_EQ(outputs[1].pdf, nullptr);
    EXPECT_NE(outputs[0].pdf, nullptr);
    return outputs[0].pdf != nullptr ? *outputs[0].pdf : kareport::PdfDetails();
}

TEST(PdfJob, WhatIsNotSaidIsTheReports)
{
    const FixedSurroundings surroundings;
    const kareport::PdfDetails details = detailsOf("{}", QStringLiteral("Stakeout"));
    EXPECT_EQ(details.title, QStringLiteral("Stakeout"));
    EXPECT_EQ(details.author, QString());
    EXPECT_EQ(details.creator, QStringLiteral("TALVEN Survey"));
    EXPECT_EQ(details.created.toString(QStringLiteral("yyyy-MM-dd HH:mm:ss")), QStringLiteral("2024-03-05 14:07:00"));
    EXPECT_EQ(details.language, QString());
    EXPECT_TRUE(details.hasOutline);
    EXPECT_TRUE(details.hasPageLabels);
}

TEST(PdfJob, WhatIsSaidCounts)
{
    const FixedSurroundings surroundings;
    const kareport::PdfDetails details = detailsOf(
        R"({"title": "", "author": "A", "creator": "C", "language": "zh-Hant", "outline": false, "pageLabels": false})",
        QStringLiteral("Stakeout"));
    EXPECT_EQ(details.title, QString()) << "none at all";
    EXPECT_EQ(details.author, QStringLiteral("A"));
    EXPECT_EQ(details.creator, QStringLiteral("C"));
    EXPECT_EQ(details.language, QStringLiteral("zh-Hant"));
    EXPECT_FALSE(details.hasOutline);
    EXPECT_FALSE(details.hasPageLabels);
}

TEST(PdfJob, WithoutTheKeyThereIsNothing)
{
    const FixedSurroundings surroundings;
    const kareport::Job job = jobtext::jobOf(R"({"report": []})");
    EXPECT_EQ(job.pdf, nullptr);
    std::vector<kareport::Output> outputs = {{QStringLiteral("a.pdf"), OutputKind::Pdf}};
    const UReportDoc report(kareport::surroundingsOf(job));
    kareport::describePdfs(job, report, outputs);
    EXPECT_EQ(outputs[0].pdf, nullptr);
}

TEST(PdfJob, TheOutlineHasHeadingsAndTables)
{
    struct Row
    {
        const char *steps;
        const char *outline;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"({"line": "a"})", "", "neither"},
        {R"({"heading": "H"}, {"line": "a"})", "H 1\n", "a heading over lines"},
        {R"({"heading": "H"})", "", "a heading over nothing"},
        {R"({"table": "points", "data": "p"})", "Points 1\n", "a table, as the template writes its name"},
        {R"({"heading": "H", "after": 1}, {"table": "Points", "data": "p"}, {"heading": "I", "after": 1},
            {"newPage": -1}, {"table": "Sorted", "data": "p"}, {"table": "Points", "data": "p"})",
         "H 1\n  Points 1\nI 2\n  Sorted 2\n  Points 2\n", "tables under their headings"},
        {R"({"line": "a"}, {"heading": "H"}, {"line": "b"}, {"newPage": -1}, {"line": "c"})", "H 1\n",
         "a heading begins with what comes next, not with the page that shows it"},
        {R"({"heading": "H"}, {"line": "a"}, {"heading": ""}, {"table": "Points", "data": "p"})", "H 1\nPoints 1\n",
         "an empty heading ends the one before"},
        {R"({"heading": "H", "after": 1}, {"table": "Points", "data": "p", "sort": ["Number"],
            "groups": [{"by": "Number", "heading": "Point {Number}"}]})",
         "H 1\n  Points 1…\n    Point 1 1\n", "the groups of a table, closed at first"},
        {R"({"table": "Points", "data": "p", "sort": ["Number", "Northing"],
            "groups": [{"by": "Number", "heading": "{count} of {Number}"}, {"by": "Northing", "heading": "N  {Northing}"}]},
            {"line": "a"})",
         "Points 1…\n  1 of 1 1…\n    N 5.000 1\n", "groups in groups, one with a heading that needs its rows"},
        {R"({"table": "Points", "data": "p"}, {"clear": true}, {"line": "a"})", "", "what is cleared"},
        {R"({"line": "a"}, {"table": "Points", "data": "p", "before": -1})", "Points 2\n",
         "a page that the table begins"},
    };
    for (const Row &row : rows) {
        jobs::TestJob job;
        job.run(templateJob(R"("p": {"values": [{"Number": "1", "Northing": 5}]})", row.steps));
        ASSERT_FALSE(job.error) << job.error->message().toStdString();
        const kareport::PdfDetails details;
        QBuffer pdf;
        pdf.open(QIODevice::WriteOnly);
        ASSERT_TRUE(job.report().WritePdf(pdf, nullptr, {}, &details)) << row.reason;
        EXPECT_EQ(PdfReadBack(pdf.data()).outline(), QString::fromUtf8(row.outline)) << row.reason;
    }
}

TEST(PdfJob, AHeadingIsInTheOutlineWithoutItsPageNumber)
{
    jobs::TestJob job;
    job.run(R"("title": "T", "options": {"placeholders": true},
        "report": [{"heading": "{title},  page {page} ", "after": 1}, {"line": "a"}])");
    ASSERT_FALSE(job.error);
    const kareport::PdfDetails details;
    QBuffer pdf;
    pdf.open(QIODevice::WriteOnly);
    ASSERT_TRUE(job.report().WritePdf(pdf, nullptr, {}, &details));
    EXPECT_EQ(PdfReadBack(pdf.data()).outline(), QStringLiteral("T, page 1\n")) << "and the 1 is its place";
}

TEST(PdfJob, AnEditedReportKeepsItsOutline)
{
    jobs::TestJob job;
    job.run(templateJob(R"("p": {"values": [{"Number": "1", "Northing": 5}]})",
                        R"({"table": "Points", "data": "p", "after": 3}, {"table": "Sorted", "data": "p"})"));
    ASSERT_FALSE(job.error);
    const auto outline = [&job] {
        const kareport::PdfDetails details;
        QBuffer pdf;
        pdf.open(QIODevice::WriteOnly);
        EXPECT_TRUE(job.report().WritePdf(pdf, nullptr, {}, &details));
        return PdfReadBack(pdf.data()).outline();
    };
    ASSERT_EQ(outline(), QStringLiteral("Points 1\nSorted 1\n"));
    ASSERT_TRUE(job.report().ReplaceText(0, 0, QStringLiteral("x\r\n").repeated(500)));
    // The page continues on further sheets: each entry leads to the one that its rows are on.
    QBuffer sheets;
    sheets.open(QIODevice::WriteOnly);
    ASSERT_TRUE(job.report().WritePdf(sheets, nullptr, {}, nullptr));
    const QStringList pages = PdfReadBack(sheets.data()).pages();
    const auto page =
        std::find_if(pages.begin(), pages.end(), [](const QString &shown) { return shown.contains(u"Pt"); });
    ASSERT_GT(page, pages.begin());
    const qsizetype sheet = page - pages.begin() + 1;
    EXPECT_EQ(outline(), QStringLiteral("Points %1\nSorted %1\n").arg(sheet));
    const QString text = job.report().CopyText();
    const qsizetype heading = text.indexOf(u"Pt"); // of the second table: the first one begins a page without headers
    ASSERT_GT(heading, 0);
    ASSERT_TRUE(job.report().ReplaceText(heading, text.indexOf(u'\n', heading) + 1 - heading, u""));
    EXPECT_EQ(outline(), QStringLiteral("Points %1\n").arg(sheet));
    job.report().SetData(QStringLiteral("another text\r\n"));
    EXPECT_EQ(outline(), QString());
}

} // namespace
