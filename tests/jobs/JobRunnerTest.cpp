#include "JobRunnerFixture.h"
#include "JobText.h"
#include "PageHeader.h"
#include "Preferences.h"

#include <QtGlobal>

namespace
{

using jobs::templateJob;
using jobs::TestJob;

/// The header of a first page with the lines that follow it.
QString firstHeader(const QString &title)
{
    return headerOf(title, 1) + QStringLiteral("\n\n\n\n");
}

TEST(JobRunner, TheGivenTitleWinsOverTheTemplates)
{
    struct Row
    {
        const char *job;
        const char *title;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("report": [{"line": "a"}])", "", "no title at all"},
        {R"("title": "Stakeout", "report": [{"line": "a"}])", "Stakeout", "the given title"},
        {R"("template": {"file": "t.xml", "name": "T"}, "report": [{"line": "a"}])", "Title", "the template's title"},
        {R"("title": "Stakeout", "template": {"file": "t.xml", "name": "T"}, "report": [{"line": "a"}])", "Stakeout",
         "the given title is set again after the template's"},
        {R"("title": "", "template": {"file": "t.xml", "name": "T"}, "report": [{"line": "a"}])", "",
         "an empty title is one that was given"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.run(row.job);
        EXPECT_EQ(job.text(), firstHeader(QString::fromUtf8(row.title)) + QStringLiteral("a\n")) << row.reason;
    }
}

TEST(JobRunner, TheApplicationIsBeforeTheTitle)
{
    TestJob job;
    job.run(R"("title": "Stakeout", "application": "TALVEN Survey", "report": [{"line": "a"}])");
    const QString front = QStringLiteral("TALVEN Survey - Stakeout ");
    const QString date = QStringLiteral("Mar 05, 2024  02:07PM").rightJustified(80 - (front.size() - 1) - 20);
    EXPECT_EQ(job.text(), front + date + QStringLiteral("    Page:  1\n\n\n\na\n"));
}

TEST(JobRunner, TheHeaderIsBuiltForThePage)
{
    TestJob job;
    job.runWhole(R"({"now": "2024-12-31T00:05:00", "page": {"linesPerPage": 72, "charsPerRow": 60}, "title": "T",
        "report": [{"line": "a"}]})");
    EXPECT_EQ(job.text(), QStringLiteral("TALVEN - T ") +
                              QStringLiteral("Dec 31, 2024  12:05AM").rightJustified(60 - 10 - 20) +
                              QStringLiteral("    Page:  1\n\n\n\na\n"));
}

TEST(JobRunner, StepsRunInOrder)
{
    struct Row
    {
        const char *job;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"([])", "", "nothing to do"},
        {R"([{"line": "a"}, {"line": "b"}])", "a\nb\n", "one line end after each"},
        {R"([{"line": "a", "after": 0}, {"line": "b"}])", "ab\n", "an open line"},
        {R"([{"line": "a"}, {"line": "b", "before": 1, "after": 2}, {"line": "c"}])", "a\n\nb\n\nc\n", "blank lines"},
        {R"([{"line": "a", "before": 3}])", "a\n", "blank lines before are dropped at the top of a page"},
        {R"([{"line": "a"}, {"lineFeed": 2}, {"line": "b"}])", "a\n\n\nb\n", "line feeds"},
        {R"([{"line": "a"}, {"lineFeed": 0}, {"lineFeed": -1}, {"line": "b"}])", "a\nb\n", "no line feeds"},
        {R"([{"line": "a"}, {"newPage": 0}, {"line": "b"}])", "a\nb\n", "there is room on the page"},
        {R"([{"line": "a"}, {"newPage": -1}, {"line": "b"}])", "a\n\n\n\n\n\n\n\n\n\nb\n",
         "a page break on a page of 10 lines"},
        {R"([{"line": "a"}, {"newPage": 8}, {"line": "b"}])", "a\n\n\n\n\n\n\n\n\n\nb\n",
         "8 lines do not fit any more"},
        {R"([{"line": "a"}, {"newPage": 7}, {"line": "b"}])", "a\nb\n", "7 lines fit"},
        {R"([{"line": "a"}, {"clear": true}, {"line": "b"}])", "b\n", "cleared"},
        {R"([{"line": "a"}, {"clear": true}])", "", "cleared at the end"},
        {R"([{"line": "\u00e4\ud834\udd1e\u6e2c"}])", "\xC3\xA4\xF0\x9D\x84\x9E\xE6\xB8\xAC\n", "Unicode"},
        {R"([{"line": ""}])", "\n", "an empty line"},
        {R"([{"line": "a", "style": 1}])", "a\n", "the style is not part of the text"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.runWhole(QByteArray(R"({"header": false, "page": {"linesPerPage": 10, "charsPerRow": 80}, "report": )") +
                     row.job + "}");
        EXPECT_EQ(job.text(), QString::fromUtf8(row.expected)) << row.reason;
    }
}

TEST(JobRunner, AHeadingIsUnderThePageHeader)
{
    TestJob job;
    job.run(R"("title": "S", "report": [{"heading": "Points", "after": 2}, {"line": "a"}, {"newPage": -1},
        {"line": "b"}])");
    const QString heading = QStringLiteral("\n\n\n\nPoints\n\n");
    // Header and heading end in line 7, "a" in line 8: 64 lines and one more run the page out.
    EXPECT_EQ(job.text(), headerOf(QStringLiteral("S"), 1) + heading + QStringLiteral("a\n") + QString(65, u'\n') +
                              headerOf(QStringLiteral("S"), 2) + heading + QStringLiteral("b\n"));
}

const char *const twoPoints =
    R"("p": {"values": [{"Number": "1", "Northing": 12.5}, {"Number": "2A", "Northing": 0}]})";

TEST(JobRunner, OptionsApplyToTables)
{
    struct Row
    {
        const char *options;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"{}", "x\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n", "the template's own separator"},
        {R"({"zeroBlank": true})", "x\nPt   |    North\n\n1    |   12.500\n2A   |         \n", "zeros are blank"},
        {R"({"writeTableName": true})", "x\n\nPoints\n\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n",
         "the table's name between blank lines"},
        {R"({"separator": ";"})", "x\nPt   ;    North\n\n1    ;   12.500\n2A   ;    0.000\n",
         "a text of one character"},
        {R"({"separator": 59})", "x\nPt   ;    North\n\n1    ;   12.500\n2A   ;    0.000\n", "a character code"},
        {R"({"separator": " "})", "x\nPt        North\n\n1        12.500\n2A        0.000\n", "a blank"},
        {R"({"separator": 9})", "x\nPt\tNorth\n\n1\t12.500\n2A\t0.000\n", "a tab: labels and values are trimmed"},
        {R"({"excel": true})", "x\nPt\tNorth\n\n1\t12.500\n2A\t0.000\n", "the Excel format has tabs"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.run(templateJob(twoPoints, R"({"line": "x"}, {"table": "Points", "data": "p"})",
                            QByteArray(R"("options": )") + row.options + ", "));
        EXPECT_EQ(job.text(), QString::fromUtf8(row.expected)) << row.reason;
    }
}

TEST(JobRunner, TheExcelFormatTurnsTheHeaderOff)
{
    TestJob job;
    job.run(R"("options": {"excel": true}, "header": true, "report": [{"line": "a"}])");
    EXPECT_EQ(job.text(), QStringLiteral("a\n"));
}

TEST(JobRunner, HashesStandForWhatDoesNotFit)
{
    const char *const data = R"("p": {"values": [{"Number": "123456", "Northing": 12345678}]})";
    const char *const steps = R"({"line": "x"}, {"table": "Points", "data": "p"})";
    TestJob job;
    job.run(templateJob(data, steps, R"("options": {"printHash": true}, )"));
    EXPECT_EQ(job.text(), QStringLiteral("x\nPt   |    North\n\n#####|#########\n"));
    job.run(templateJob(data, steps));
    EXPECT_EQ(job.text(), QStringLiteral("x\nPt   |    North\n\n123456|12345678.000\n")) << "the next job has its own";
}

TEST(JobRunner, ThePreferencesOfWhoRunsAJobDoNotMatter)
{
    TestJob job;
    WriteProfileString(QString(), QStringLiteral("ReportPrintHash"), QStringLiteral("1"));
    job.run(templateJob(R"("p": {"values": [{"Number": "123456"}]})", R"({"block": "Point", "data": "p"})"));
    EXPECT_EQ(job.text(), QStringLiteral("Pt|123456\n"));
}

/// Profile entries that are only read.
class UntouchedProfile : public kareport::ProfileStore
{
public:
    QString read(const QString & /*section*/, const QString & /*entry*/, const QString &fallback) const override
    {
        return fallback;
    }
    void write(const QString & /*section*/, const QString &entry, const QString & /*value*/) override
    {
        ADD_FAILURE() << entry.toStdString() << " is written";
    }
};

TEST(JobRunner, TheProgramAroundAJobStaysAsItIs)
{
    const FixedSurroundings surroundings;
    kareport::setProfileStore(std::make_unique<UntouchedProfile>());
    const QString start = GetStartPathName();
    const auto source = jobtext::sourceOf(R"({"application": "TALVEN Job", "now": "1999-12-31T23:59:00",
        "page": {"paper": "A3", "resolution": 300, "orientation": "landscape", "margins": [1, 2, 3, 4], "fontSize": 13},
        "options": {"printHash": true}, "report": [{"line": "a"}, {"line": "b"}]})");
    const auto job = kareport::readJob(source);
    ASSERT_EQ(kareport::errorOf(job), nullptr);
    UReportDoc report(kareport::surroundingsOf(std::get<kareport::Job>(job)));
    kareport::Progress progress(false);
    kareport::JobRunner runner(std::get<kareport::Job>(job), source, progress);
    int asked = 0;
    runner.stopWhen([&] {
        ++asked;
        EXPECT_EQ(kareport::defaultPrinter().paper, kareport::PaperSize::A4);
        EXPECT_EQ(kareport::currentTime().date().year(), 2024);
        EXPECT_EQ(GetApplicationTitle(), QStringLiteral("TALVEN"));
        EXPECT_EQ(GetStartPathName(), start);
        EXPECT_TRUE(IsReportPrinterSetToPortrait());
        return false;
    });
    EXPECT_FALSE(runner.run(report));
    EXPECT_GE(asked, 2) << "after each step";
    EXPECT_TRUE(textOf(report).startsWith(QStringLiteral("TALVEN Job - "))) << textOf(report).toStdString();
    EXPECT_TRUE(textOf(report).contains(QStringLiteral("Dec 31, 1999  11:59PM")));
    EXPECT_EQ(report.GetPageSize(), QSize(4961, 3508));
    EXPECT_EQ(report.GetMargins(), QMargins(1, 2, 3, 4));
    EXPECT_EQ(report.GetFontSize(), 13U);
    kareport::setProfileStore(kareport::makeMemoryProfile());

    report.SetHeader();
    report.Clear();
    report.NewPage(-1);
    EXPECT_TRUE(textOf(report).startsWith(QStringLiteral("TALVEN Job - "))) << "what it was made with holds on";
}

TEST(JobRunner, WhatHeldForTheReportBeforeTheJobHoldsAgain)
{
    const FixedSurroundings program;
    const auto source = jobtext::sourceOf(R"({"application": "TALVEN Job", "now": "1999-12-31T23:59:00",
        "page": {"linesPerPage": 72, "charsPerRow": 80, "margins": [1, 2, 3, 4], "fontSize": 13},
        "options": {"placeholders": true}, "report": [{"line": "{application}"}]})");
    const auto job = kareport::readJob(source);
    ASSERT_EQ(kareport::errorOf(job), nullptr);
    kareport::Progress progress(false);
    kareport::JobRunner runner(std::get<kareport::Job>(job), source, progress);
    const auto firstLine = [&runner](UReportDoc &report) {
        EXPECT_FALSE(runner.run(report));
        EXPECT_TRUE(textOf(report).contains(QStringLiteral("\r\nTALVEN Job\r\n"))) << textOf(report).toStdString();
        report.Clear();
        report.SetHeader();
        report.WriteLine(QStringLiteral("{application}"), -1, 1, 0);
        EXPECT_TRUE(textOf(report).contains(QStringLiteral("\r\n{application}\r\n"))) << "no placeholder any more";
        return textOf(report).section(QStringLiteral(" - "), 0, 0);
    };

    UReportDoc programs;
    EXPECT_EQ(firstLine(programs), QStringLiteral("TALVEN")) << "the program's own";
    EXPECT_FALSE(programs.GetSurroundings());

    kareport::ReportSurroundings surroundings;
    surroundings.application = QStringLiteral("TALVEN Host");
    UReportDoc hosts(surroundings);
    EXPECT_EQ(firstLine(hosts), QStringLiteral("TALVEN Host"));
    EXPECT_EQ(hosts.GetMargins(), QMargins(1, 2, 3, 4)) << "its pages were made with them";
    EXPECT_EQ(hosts.GetFontSize(), 13U);
}

TEST(JobRunner, AReportOfAProgramWithPreferencesIsMadeAsTheJobSays)
{
    TestJob job;
    const char *const json = R"({"now": "2024-03-05T14:07:00", "page": {"paper": "A4"}, "report": [{"line": "a"}]})";
    job.runWhole(json);
    const QString expected = job.text();
    const int lines = job.report().GetLinesPerPage();
    WriteProfileString(QString(), QStringLiteral("Report Margins"), QStringLiteral("5000, 5000, 5000, 5000"));
    SetReportFontSize(20);
    SetReportPrinterSetToPortrait(false);
    const auto source = jobtext::sourceOf(json);
    const auto read = kareport::readJob(source);
    ReportApplication application;
    UReportDoc &report = *application.create(QString());
    ASSERT_NE(report.GetLinesPerPage(), lines);
    kareport::Progress progress(false);
    EXPECT_FALSE(kareport::JobRunner(std::get<kareport::Job>(read), source, progress).run(report));
    EXPECT_EQ(textOf(report), reportLines(expected));
    EXPECT_EQ(report.GetLinesPerPage(), lines);
    EXPECT_EQ(report.GetMargins(), QMargins(1000, 1000, 1200, 2000));
    EXPECT_EQ(report.GetFontSize(), 8U);
}

TEST(JobRunner, TheChainageLabelIsInTheHeading)
{
    TestJob job;
    const char *const data = R"("p": {"values": {"Chainage": "12+345.678"}})";
    const char *const steps = R"({"line": "x"}, {"table": "Stations", "data": "p"})";
    job.run(templateJob(data, steps));
    EXPECT_EQ(job.text(), QStringLiteral("x\n    Station\n\n  12+345.678\n"))
        << "the label takes the place of the word Chainage, whose blanks stay";
    job.run(templateJob(data, steps, R"("options": {"chainageLabel": "Km"}, )"));
    EXPECT_EQ(job.text(), QStringLiteral("x\n    Km\n\n  12+345.678\n"));
}

TEST(JobRunner, TableStepsTakeTheirLines)
{
    TestJob job;
    job.run(templateJob(twoPoints,
                        R"({"line": "x"}, {"table": "Points", "data": "p", "before": 1, "after": 2, "headingAfter": 1},
        {"line": "y"}, {"block": "Point", "data": "p", "before": 2, "after": 1}, {"line": "z"})"));
    EXPECT_EQ(job.text(), QStringLiteral("x\n\nPt   |    North\n1    |   12.500\n2A   |    0.000\n\n\ny\n\n\n"
                                         "Pt|1\nNorth|12.500\n\nz\n"));
}

TEST(JobRunner, TheJobsOwnTemplateFileWinsOverAnInstalledOne)
{
    struct Row
    {
        bool own;
        bool installed;
        const char *title;
        const char *reason;
    };
    constexpr Row rows[] = {{true, true, "Own", "both are there"},
                            {true, false, "Own", "only the job's"},
                            {false, true, "Installed", "only the installed one"}};
    for (const Row &row : rows) {
        TestJob job;
        const TemplateFolders folders;
        if (row.own) {
            job.folder.put("same.xml", jobs::pointsTemplate("Own"));
        }
        if (row.installed) {
            folders.putIntoLibrary(jobs::pointsTemplate("Installed"), "same.xml");
        }
        job.run(R"("template": {"file": "same.xml", "name": "T"}, "report": [{"line": "a"}])");
        EXPECT_EQ(job.text(), firstHeader(QString::fromUtf8(row.title)) + QStringLiteral("a\n")) << row.reason;
    }
}

TEST(JobRunner, TheDateIsTheJobsOrTheBuilds)
{
    struct Row
    {
        const char *now;
        const char *epoch;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("now": "2024-03-05T14:07:00", )", nullptr, "Mar 05, 2024  02:07PM", "the job's time"},
        {R"("now": "2024-03-05T14:07:00", )", "0", "Mar 05, 2024  02:07PM", "the job's time before the build's"},
        {"", "1709647620", "Mar 05, 2024  02:07PM", "the build's time, in UTC"},
        {"", "0", "Jan 01, 1970  12:00AM", "the first second"},
    };
    const QByteArray before = qgetenv("SOURCE_DATE_EPOCH");
    for (const Row &row : rows) {
        if (row.epoch != nullptr) {
            qputenv("SOURCE_DATE_EPOCH", row.epoch);
        } else {
            qunsetenv("SOURCE_DATE_EPOCH");
        }
        TestJob job;
        job.runWhole(QByteArray("{") + row.now +
                     R"("page": {"linesPerPage": 72, "charsPerRow": 80}, "report": [{"line": "a"}]})");
        EXPECT_TRUE(job.text().contains(QString::fromUtf8(row.expected)))
            << row.reason << ": " << job.text().toStdString();
    }
    qunsetenv("SOURCE_DATE_EPOCH");
    TestJob job;
    kareport::fixTime(QDateTime(QDate(2031, 2, 3), QTime(4, 5)));
    job.runWhole(R"({"page": {"linesPerPage": 72, "charsPerRow": 80}, "report": [{"line": "a"}]})");
    EXPECT_TRUE(job.text().contains(QStringLiteral("Feb 03, 2031  04:05AM")))
        << "without either the host's clock is read";
    if (!before.isNull()) {
        qputenv("SOURCE_DATE_EPOCH", before);
    }
}

TEST(JobRunner, MeasuresTheBuiltInPage)
{
    struct Row
    {
        const char *page;
        QSize size;
        const char *reason;
    };
    const Row rows[] = {
        {"{}", {4961, 7016}, "A4 at 600 dots per inch"},
        {R"({"orientation": "landscape"})", {7016, 4961}, "A4 across"},
        {R"({"paper": "Letter", "resolution": 300})", {2550, 3300}, "8.5 by 11 inches"},
        {R"({"paper": "Legal", "resolution": 100})", {850, 1400}, "8.5 by 14 inches"},
        {R"({"linesPerPage": 3, "charsPerRow": 7})", {4961, 7016}, "the page is there although it is not measured"},
    };
    for (const Row &row : rows) {
        TestJob job;
        job.runWhole(QByteArray(R"({"report": [], "page": )") + row.page + "}");
        ASSERT_FALSE(job.error) << row.reason << job.text().toStdString();
        EXPECT_EQ(job.report().GetPageSize(), row.size) << row.reason;
        EXPECT_GT(job.report().GetLinesPerPage(), 1) << row.reason;
    }
}

TEST(JobRunner, FiguresOfThePageOverrideWhatIsMeasured)
{
    TestJob job;
    job.runWhole(R"({"report": [], "page": {"fontSize": 8}})");
    const int lines = job.report().GetLinesPerPage();
    const int chars = job.report().GetCharsPerRow();
    job.runWhole(R"({"report": [], "page": {"fontSize": 8, "linesPerPage": 33}})");
    EXPECT_EQ(job.report().GetLinesPerPage(), 33);
    EXPECT_EQ(job.report().GetCharsPerRow(), chars);
    job.runWhole(R"({"report": [], "page": {"fontSize": 8, "charsPerRow": 44}})");
    EXPECT_EQ(job.report().GetLinesPerPage(), lines);
    EXPECT_EQ(job.report().GetCharsPerRow(), 44);
    job.runWhole(R"({"report": [], "page": {"fontSize": 16}})");
    EXPECT_LT(job.report().GetLinesPerPage(), lines);
    EXPECT_LT(job.report().GetCharsPerRow(), chars);
    EXPECT_EQ(job.report().GetFontSize(), 16U);
    job.runWhole(R"({"report": [], "page": {"fontSize": 8, "margins": [0, 5000, 0, 5000], "fontName": "Courier"}})");
    EXPECT_EQ(job.report().GetMargins(), QMargins(0, 5000, 0, 5000));
    EXPECT_EQ(job.report().GetFontName(), QStringLiteral("Courier"));
}

} // namespace
