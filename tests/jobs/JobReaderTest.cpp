#include "JobReader.h"
#include "DataKind.h"

#include "JobFolder.h"

#include <QDir>

#include "JobText.h"

#include <gtest/gtest.h>

namespace
{

using kareport::Job;
using kareport::OutputKind;

using jobtext::folder;
using jobtext::jobOf;

TEST(JobReader, EveryKeyButReportIsOptional)
{
    const Job job = jobOf(R"({"report": []})");
    EXPECT_FALSE(job.title);
    EXPECT_EQ(job.application, QStringLiteral("TALVEN"));
    EXPECT_TRUE(job.header);
    EXPECT_FALSE(job.now);
    EXPECT_EQ(job.page.printer.source, kareport::PrinterSource::BuiltIn);
    EXPECT_EQ(job.page.printer.paper, kareport::PaperSize::A4);
    EXPECT_EQ(job.page.printer.resolution, 600);
    EXPECT_TRUE(job.page.portrait);
    EXPECT_FALSE(job.page.margins);
    EXPECT_FALSE(job.page.fontName);
    EXPECT_FALSE(job.page.fontSize);
    EXPECT_FALSE(job.page.linesPerPage);
    EXPECT_FALSE(job.page.charsPerRow);
    EXPECT_FALSE(job.reportTemplate);
    EXPECT_FALSE(job.options.zeroBlank);
    EXPECT_FALSE(job.options.writeTableName);
    EXPECT_FALSE(job.options.printHash);
    EXPECT_FALSE(job.options.excel);
    EXPECT_FALSE(job.options.chainageLabel);
    EXPECT_FALSE(job.options.separator);
    EXPECT_TRUE(job.data.isEmpty());
    EXPECT_TRUE(job.steps.empty());
    EXPECT_TRUE(job.outputs.empty());
}

TEST(JobReader, ReadsPageAndOptions)
{
    const Job job = jobOf(R"({"report": [], "title": "", "application": "TALVEN Survey", "header": false,
        "now": "2024-03-05T14:07:00",
        "page": {"paper": "Letter", "orientation": "landscape", "resolution": 300, "margins": [1, 2, 3, 4],
                 "fontName": "Mono", "fontSize": 9, "linesPerPage": 1, "charsPerRow": 1, "printer": "default"},
        "options": {"zeroBlank": true, "writeTableName": true, "printHash": true, "chainageLabel": "", "separator": 0,
                    "excel": true}})");
    EXPECT_EQ(job.title, QString()) << "an empty title is a title";
    EXPECT_TRUE(job.title.has_value());
    EXPECT_EQ(job.application, QStringLiteral("TALVEN Survey"));
    EXPECT_FALSE(job.header);
    EXPECT_EQ(job.now, QDateTime(QDate(2024, 3, 5), QTime(14, 7)));
    EXPECT_EQ(job.page.printer.source, kareport::PrinterSource::SystemOrBuiltIn);
    EXPECT_EQ(job.page.printer.paper, kareport::PaperSize::Letter);
    EXPECT_EQ(job.page.printer.resolution, 300);
    EXPECT_FALSE(job.page.portrait);
    EXPECT_EQ(job.page.margins, QMargins(1, 2, 3, 4)) << "left, top, right, bottom";
    EXPECT_EQ(job.page.fontName, QStringLiteral("Mono"));
    EXPECT_EQ(job.page.fontSize, 9);
    EXPECT_EQ(job.page.linesPerPage, 1);
    EXPECT_EQ(job.page.charsPerRow, 1);
    EXPECT_TRUE(job.options.zeroBlank);
    EXPECT_TRUE(job.options.writeTableName);
    EXPECT_TRUE(job.options.printHash);
    EXPECT_TRUE(job.options.excel);
    EXPECT_EQ(job.options.chainageLabel, QString());
    EXPECT_EQ(job.options.separator, u'\0');
}

TEST(JobReader, ASeparatorIsACodeOrATextOfOneCharacter)
{
    struct Row
    {
        const char *separator;
        char16_t expected;
    };
    constexpr Row rows[] = {{"124", u'|'}, {"\"|\"", u'|'}, {"9", u'\t'},     {"\"\\t\"", u'\t'},
                            {"32", u' '},  {"\"9\"", u'9'}, {"255", u'\xFF'}, {"\"\xC2\xB7\"", u'\xB7'}};
    for (const Row &row : rows) {
        const QByteArray json = QByteArray(R"({"report": [], "options": {"separator": )") + row.separator + "}}";
        EXPECT_EQ(jobOf(json).options.separator, row.expected) << row.separator;
    }
}

TEST(JobReader, TheJobsOwnTemplateFileComesBeforeAnInstalledOne)
{
    const JobFolder own;
    const JobFolder installed;
    own.put("both.xml", "");
    installed.put("both.xml", "");
    installed.put("installed.xml", "");
    struct Row
    {
        const char *name;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {"both.xml", own.path("both.xml"), "both folders have it"},
        {"installed.xml", installed.path("installed.xml"), "the job's folder does not have it"},
        {"none.xml", own.path("none.xml"), "neither has it: it is missed beside the job"},
    };
    for (const Row &row : rows) {
        const QByteArray json = QByteArray(R"({"report": [], "template": {"name": "T", "file": ")") + row.name + "\"}}";
        const auto source = kareport::JsonSource::fromBytes(own.path("job.json"), json);
        const auto job =
            kareport::readJob(std::get<kareport::JsonSource>(source), {.templateFolder = installed.path()});
        ASSERT_EQ(kareport::errorOf(job), nullptr) << row.reason;
        EXPECT_EQ(std::get<Job>(job).reportTemplate->file, row.expected) << row.reason;
        EXPECT_EQ(std::get<Job>(job).reportTemplate->name, QStringLiteral("T")) << row.reason;
    }
}

TEST(JobReader, StepsHaveDefaults)
{
    const Job job = jobOf(R"({"template": {"file": "t.xml", "name": "T"}, "data": {"d": {"values": []}}, "report": [
        {"heading": "H"}, {"line": "L"}, {"lineFeed": 3}, {"newPage": -1}, {"block": "B", "data": "d"},
        {"table": "T", "data": "d"}, {"clear": true}]})");
    ASSERT_EQ(job.steps.size(), 7U);
    const auto heading = std::get<Job::Heading>(job.steps[0].action);
    EXPECT_EQ(heading.text, QStringLiteral("H"));
    EXPECT_EQ(heading.before, 0);
    EXPECT_EQ(heading.after, 0);
    const auto line = std::get<Job::Line>(job.steps[1].action);
    EXPECT_EQ(line.text, QStringLiteral("L"));
    EXPECT_EQ(line.before, 0);
    EXPECT_EQ(line.after, 1) << "a line ends unless said";
    EXPECT_EQ(line.style, 0);
    EXPECT_EQ(std::get<Job::LineFeed>(job.steps[2].action).count, 3);
    EXPECT_EQ(std::get<Job::NewPage>(job.steps[3].action).linesNeeded, -1);
    const auto block = std::get<Job::Block>(job.steps[4].action);
    EXPECT_EQ(block.name, QStringLiteral("B"));
    EXPECT_EQ(block.data, QStringLiteral("d"));
    EXPECT_EQ(block.before, 0);
    EXPECT_EQ(block.after, 0);
    const auto table = std::get<Job::Table>(job.steps[5].action);
    EXPECT_EQ(table.name, QStringLiteral("T"));
    EXPECT_EQ(table.data, QStringLiteral("d"));
    EXPECT_EQ(table.before, 0);
    EXPECT_EQ(table.after, 0);
    EXPECT_EQ(table.headingAfter, -1);
    EXPECT_TRUE(std::holds_alternative<Job::Clear>(job.steps[6].action));
}

TEST(JobReader, StepsTakeTheirNumbers)
{
    const Job job = jobOf(R"({"template": {"file": "t.xml", "name": "T"}, "data": {"d": {"values": {}}}, "report": [
        {"heading": "", "before": 1, "after": 2}, {"line": "", "before": 3, "after": 0, "style": 1},
        {"block": "B", "data": "d", "before": 4, "after": 5},
        {"table": "T", "data": "d", "before": 6, "after": 7, "headingAfter": 8}]})");
    ASSERT_EQ(job.steps.size(), 4U);
    const auto heading = std::get<Job::Heading>(job.steps[0].action);
    EXPECT_EQ(heading.before * 10 + heading.after, 12);
    const auto line = std::get<Job::Line>(job.steps[1].action);
    EXPECT_EQ(line.before * 100 + line.after * 10 + line.style, 301);
    const auto block = std::get<Job::Block>(job.steps[2].action);
    EXPECT_EQ(block.before * 10 + block.after, 45);
    const auto table = std::get<Job::Table>(job.steps[3].action);
    EXPECT_EQ(table.before * 100 + table.after * 10 + table.headingAfter, 678);
}

TEST(JobReader, AStyleIsAnyNumberOf32Bits)
{
    const Job job = jobOf(R"({"report": [{"line": "", "style": 2147483647}, {"line": "", "style": -2147483648}]})");
    ASSERT_EQ(job.steps.size(), 2U);
    EXPECT_EQ(std::get<Job::Line>(job.steps[0].action).style, 2147483647);
    EXPECT_EQ(std::get<Job::Line>(job.steps[1].action).style, -2147483647 - 1);
}

/// The files of a data set.
QString filesOf(const Job &job, const char *set)
{
    return job.data[QString::fromUtf8(set)].source->files().join(u' ');
}

TEST(JobReader, PathsAreRelativeToTheJobFile)
{
    const QString elsewhere = QDir::rootPath() + QStringLiteral("other/p.csv");
    const Job job = jobOf(R"({"report": [], "output": ["a.rep", "sub/b.TXT", "-", {"file": "c", "as": "text"},
        {"file": "d.txt", "as": "rep"}], "data": {"near": {"csv": "in/p.csv"}, "far": {"csv": ")" +
                          elsewhere.toUtf8() + R"(", "delimiter": "\t"}, "here": {"values": []}}})");
    ASSERT_EQ(job.outputs.size(), 5U);
    EXPECT_EQ(job.outputs[0].file, folder + QStringLiteral("/a.rep"));
    EXPECT_EQ(job.outputs[0].kind, OutputKind::Report);
    EXPECT_EQ(job.outputs[1].file, folder + QStringLiteral("/sub/b.TXT"));
    EXPECT_EQ(job.outputs[1].kind, OutputKind::Text) << "case does not matter in an ending";
    EXPECT_TRUE(job.outputs[2].isStandardOutput());
    EXPECT_EQ(job.outputs[2].kind, OutputKind::Text);
    EXPECT_EQ(job.outputs[3].file, folder + QStringLiteral("/c"));
    EXPECT_EQ(job.outputs[3].kind, OutputKind::Text);
    EXPECT_EQ(job.outputs[4].kind, OutputKind::Report) << "what is said wins over the ending";
    EXPECT_EQ(filesOf(job, "near"), folder + QStringLiteral("/in/p.csv"));
    EXPECT_EQ(filesOf(job, "far"), elsewhere);
    EXPECT_EQ(filesOf(job, "here"), QString());
}

} // namespace
