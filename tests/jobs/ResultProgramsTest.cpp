#include "RandomTable.h"
#include "ResultJob.h"

#include <gmock/gmock.h>

#include <QCryptographicHash>
#include <QDir>
#include <QProcess>
#include <QStandardPaths>
#include <QUrl>

// What other people's programs make of workbooks and web pages.

namespace
{

using jobs::RandomTable;
using jobs::ResultJob;
using testing::HasSubstr;

struct Outcome
{
    int status = -1;
    QByteArray out;
};

Outcome runOther(const QString &program, const QStringList &arguments)
{
    QProcess process;
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(program, arguments);
    const bool isEnded = process.waitForFinished(200'000) && process.exitStatus() == QProcess::NormalExit;
    return {isEnded ? process.exitCode() : -1, process.readAll()};
}

class XlsxOffice : public testing::Test
{
protected:
    void SetUp() override
    {
        office_ = QStandardPaths::findExecutable(QStringLiteral("soffice"));
        if (office_.isEmpty()) {
            GTEST_SKIP() << "no soffice is installed, which would read what is written";
        }
        // The package is the system's: another Python that is found first need not have it.
        const QString python = QStringLiteral("/usr/bin/python3");
        if (runOther(python, {QStringLiteral("-c"), QStringLiteral("import openpyxl")}).status != 0) {
            GTEST_SKIP() << "no openpyxl is installed, which would read what is written";
        }
    }

    void toCsv(const ResultJob &job)
    {
        const QString profile = QUrl::fromLocalFile(job.folder.path("profile")).toString();
        const Outcome run =
            runOther(office_, {QStringLiteral("-env:UserInstallation=") + profile, QStringLiteral("--headless"),
                               QStringLiteral("--convert-to"),
                               QStringLiteral("csv:Text - txt - csv (StarCalc):44,34,76,1,,0,false,true"),
                               QStringLiteral("--outdir"), job.folder.path("out"), job.folder.path("p.xlsx")});
        ASSERT_EQ(run.status, 0) << run.out.constData();
    }

private:
    QString office_;
};

TEST_F(XlsxOffice, EveryNumberShowsAsItIsPrinted)
{
    for (const quint64 seed : {1U, 2U, 3U}) {
        RandomTable table(seed);
        ResultJob job;
        job.folder.put("t.xml", table.wholeTemplateFile());
        table.chooseUnits(3);
        job.folder.put("in.csv", table.csv(300));
        job.run(table.job("csv", "in.csv", R"("p.xlsx", {"file": "p.csv", "values": "printed"})"));
        ASSERT_EQ(job.error.toStdString(), "");
        for (const char *name : {"p.xlsx", "p.csv"}) {
            job.folder.put(name, QByteArray::fromStdString(job.bytes(name)));
        }
        ASSERT_NO_FATAL_FAILURE(toCsv(job));
        const Outcome run =
            runOther(QStringLiteral(KAREPORT_TEST_DIR "/support/compare-workbook.py"),
                     {job.folder.path("p.xlsx"), job.folder.path("p.csv"), job.folder.path("out/p.csv")});
        EXPECT_EQ(run.status, 0) << "seed " << seed << "\n" << run.out.left(4000).constData();
    }
}

class HtmlBrowser : public testing::Test
{
protected:
    void SetUp() override
    {
        browser_ = QStandardPaths::findExecutable(QStringLiteral("chromium"));
        if (browser_.isEmpty()) {
            GTEST_SKIP() << "no chromium is installed, which would open what is written";
        }
        QByteArray rows;
        for (int i = 0; i < 300; ++i) {
            rows += QByteArray(i == 0 ? "" : ",") + R"({"Number": "<i>)" + QByteArray::number(i) +
                    R"(", "Northing": )" + QByteArray::number((i * 7919) % 300) + "}";
        }
        job_.run(jobs::templateJob(R"("p": {"values": [)" + rows + "]}", R"({"table": "Points", "data": "p"})") +
                 R"(, "output": ["p.html"])");
        ASSERT_EQ(job_.error.toStdString(), "");
        page_ = job_.bytes("p.html");
    }

    Outcome browse(const QStringList &arguments) const
    {
        const QString page = QUrl::fromLocalFile(job_.folder.path("p.html")).toString();
        return runOther(browser_,
                        QStringList{QStringLiteral("--headless"), QStringLiteral("--no-sandbox"),
                                    QStringLiteral("--disable-gpu"), QStringLiteral("--disable-dev-shm-usage"),
                                    QStringLiteral("--user-data-dir=") + job_.folder.path("profile")} +
                            arguments + QStringList{page});
    }
    /// Opens a page with a script of the test in it.
    Outcome runScript(std::string page, const std::string &script) const
    {
        // The page's own rules let no other script in: they are told of this one, and hold for the page's own.
        const QByteArray hash = QCryptographicHash::hash(QByteArray::fromStdString(script), QCryptographicHash::Sha256);
        page.insert(page.find("script-src ") + 11, "'sha256-" + hash.toBase64().toStdString() + "' ");
        page.insert(page.find("</body>"), "<script>" + script + "</script>");
        putPage(page);
        return browse({QStringLiteral("--dump-dom")});
    }
    void putPage(const std::string &page) const { job_.folder.put("p.html", QByteArray::fromStdString(page)); }

    ResultJob job_;
    std::string page_;

private:
    QString browser_;
};

TEST_F(HtmlBrowser, CellsAreWhatTheReportPrintsAndSortByTheirValues)
{
    const std::string script =
        "const of = (row, column) => document.querySelector('tbody').rows[row].cells[column].textContent;"
        "const seen = [document.querySelectorAll('tbody tr').length, of(0, 0), of(1, 1)];"
        "document.querySelectorAll('thead [role=button]')[1].click();"
        "seen.push(of(0, 1), of(299, 1));"
        "document.querySelectorAll('thead [role=button]')[1].dispatchEvent(new KeyboardEvent('keydown', {key: 'Enter'}));"
        "seen.push(of(0, 1), document.querySelectorAll('th')[1].getAttribute('aria-sort'));"
        "document.title = seen.join('|');";
    const Outcome run = runScript(page_, script);
    EXPECT_THAT(run.out.toStdString(),
                HasSubstr("<title>300|&lt;i&gt;0|119.000|0.000|299.000|299.000|descending</title>"));
}

TEST_F(HtmlBrowser, TotalsStayUnderTheirGroups)
{
    job_.run(jobs::templateJob(R"("p": {"values": [{"Number": "1", "Northing": 1}, {"Number": "2", "Northing": 5},
        {"Number": "1", "Northing": 3}, {"Number": "2", "Northing": 9}]})",
                               R"({"table": "Points", "data": "p", "sort": "Number", "groups": [{"by": "Number",
        "heading": "Point {Number}", "totals": [{"label": "{count} rows", "sum": "Northing"}]}],
        "totals": [{"label": "All", "sum": "Northing"}]})") +
             R"(, "output": ["p.html"])");
    ASSERT_EQ(job_.error.toStdString(), "");
    const std::string script =
        "const label = document.querySelectorAll('thead [role=button]')[1];"
        "label.click(); label.click();"
        "document.title = document.querySelector('caption').textContent + '|' + [...document.querySelectorAll('tbody tr')]"
        ".map(row => [...row.cells].map(cell => cell.textContent.trim()).join(' ')).join('|');";
    const Outcome run = runScript(job_.bytes("p.html"), script);
    EXPECT_THAT(run.out.toStdString(),
                HasSubstr("<title>Points|Point 1|1 3.000|1 1.000|2 rows 4.000|Point 2|2 9.000|2 5.000|2 rows 14.000|"
                          "All 18.000</title>"));
}

TEST_F(HtmlBrowser, InfiniteNumbersAreTheGreatestAndTheLeast)
{
    job_.run(jobs::templateJob(R"("p": {"values": [{"Number": "1", "Northing": 5}, {"Number": "2", "Northing": "INF"},
        {"Number": "3", "Northing": -3}, {"Number": "4", "Northing": "-INF"}]})",
                               R"({"table": "Points", "data": "p"})") +
             R"(, "output": ["p.html"])");
    ASSERT_EQ(job_.error.toStdString(), "");
    const std::string script =
        "document.querySelectorAll('thead [role=button]')[1].click();"
        "document.title = [...document.querySelectorAll('tbody tr')].map(row => row.cells[0].textContent).join('');";
    const Outcome run = runScript(job_.bytes("p.html"), script);
    EXPECT_THAT(run.out.toStdString(), HasSubstr("<title>4312</title>"));
}

TEST_F(HtmlBrowser, ItsOwnRulesLetItsOwnScriptRun)
{
    putPage(page_);
    const Outcome run = browse({QStringLiteral("--dump-dom"), QStringLiteral("--enable-logging=stderr")});
    EXPECT_THAT(run.out.toStdString(), HasSubstr("&lt;i&gt;0"));
    EXPECT_THAT(run.out.toStdString(), testing::Not(HasSubstr("Content Security Policy")));
}

TEST_F(HtmlBrowser, EverySheetOfPaperHasTheHeading)
{
    putPage(page_);
    const QString pdf = job_.folder.path("p.pdf");
    browse({QStringLiteral("--print-to-pdf=") + pdf, QStringLiteral("--no-pdf-header-footer")});
    const Outcome text = runOther(QStringLiteral("pdftotext"), {pdf, QStringLiteral("-")});
    ASSERT_EQ(text.status, 0) << text.out.constData();
    const auto pages = text.out.count('\f');
    EXPECT_GT(pages, 3);
    EXPECT_EQ(text.out.count("North"), pages);
}

} // namespace
