#include "FailEachCall.h"

#include "CommandLineJob.h"
#include "Commands.h"
#include "FrameFixture.h"
#include "JobOutputs.h"
#include "JobRunnerFixture.h"
#include "ReplaceFile.h"
#include "ReportTextCodec.h"
#include "ViewFixture.h"

#include <QDir>

#include <string>

namespace
{

TEST(ReportSaves, WhenTheSystemFailsTheEarlierFileIsWholeAndTheReportIsStillModified)
{
    struct Row
    {
        const char *name;
        bool (*save)(UReportDoc &report, const QString &path);
    };
    constexpr Row rows[] = {
        {"a.rep", [](UReportDoc &report, const QString &path) { return report.OnSaveDocument(path); }},
        {"a.rtf", [](UReportDoc &report, const QString &path) { return report.OnSaveDocument(path); }},
        {"a.pdf", [](UReportDoc &report, const QString &path) { return report.OnSaveDocument(path); }},
        {"a.rep", [](UReportDoc &report, const QString &path) { return report.DoSave(path, false); }},
        {"a.rtf", [](UReportDoc &report, const QString &path) { return report.DoSave(path, false); }},
        {"a.pdf", [](UReportDoc &report, const QString &path) { return report.DoSave(path, false); }},
    };
    const QTemporaryDir folder;
    ShownReport shown(longText());
    shown.open();
    shown.report.SetPageSize();
    for (const Row &row : rows) {
        SCOPED_TRACE(row.name);
        const QString path = folder.filePath(QString::fromUtf8(row.name));
        failEachCall(
            path, [&] { shown.report.SetModifiedFlag(true); }, [&] { return row.save(shown.report, path); },
            [&] {
                EXPECT_TRUE(shown.report.IsModified());
                EXPECT_EQ(shown.report.GetTextLength(), longText().size());
                EXPECT_EQ(shown.report.SaveFile(QString()), 0);
            });
    }
}

TEST(ReportSaves, SaveFileGoesOnEitherWay)
{
    const QTemporaryDir folder;
    ShownReport shown(longText());
    shown.open();
    shown.report.SetPageSize();
    for (const char *name : {"a.rep", "a.rtf", "a.pdf"}) {
        SCOPED_TRACE(name);
        const QString path = folder.filePath(QString::fromUtf8(name));
        failEachCall(
            path, [&] { shown.report.SetModifiedFlag(true); },
            [&] {
                EXPECT_EQ(shown.report.SaveFile(path), 1);
                return shown.report.GetSaveProblem().isEmpty();
            },
            [&] {
                EXPECT_TRUE(shown.report.IsModified());
                EXPECT_EQ(shown.report.GetTextLength(), longText().size());
            });
    }
}

TEST(ReportSaves, AnOutputOfTheCommandLineIsWholeOrNotWritten)
{
    using kareport::OutputKind;
    struct Row
    {
        const char *name;
        OutputKind kind;
    };
    constexpr Row rows[] = {
        {"a.rep", OutputKind::Report}, {"a.txt", OutputKind::Text},          {"a.rtf", OutputKind::RichText},
        {"a.pdf", OutputKind::Pdf},    {"a.rtf", OutputKind::RichTextImage},
    };
    const QTemporaryDir folder;
    ShownReport shown;
    shown.report.SetPageSize();
    shown.report.SetRTFDataFlag(true);
    ASSERT_TRUE(shown.report.Write(longText(), 0));
    for (const Row &row : rows) {
        SCOPED_TRACE(row.name);
        const QString path = folder.filePath(QString::fromUtf8(row.name));
        kareport::OutputResult result;
        failEachCall(
            path, [] {},
            [&] {
                kareport::Progress progress(false);
                result = kareport::writeOutput(shown.report, {path, row.kind}, progress);
                return result.isWritten();
            },
            [&] {
                EXPECT_TRUE(result.problem->contains(QStringLiteral("could not be written")))
                    << result.problem->toStdString();
            });
    }
}

TEST(ReportSaves, AFullDiskIsSaidInTheSystemsWords)
{
    using kareport::OutputKind;
    const QTemporaryDir folder;
    ShownReport shown(longText());
    shown.report.SetPageSize();
    for (const OutputKind kind : {OutputKind::Report, OutputKind::Text, OutputKind::RichText, OutputKind::Pdf}) {
        const FailingFiles failing(FailingFiles::Call::Write, 1);
        kareport::Progress progress(false);
        const auto result = kareport::writeOutput(shown.report, {folder.filePath(QStringLiteral("a")), kind}, progress);
        EXPECT_TRUE(failing.hasFailed());
        EXPECT_TRUE(result.problem.value_or(QString()).contains(QStringLiteral("No space left on device")))
            << static_cast<int>(kind) << ": " << result.problem.value_or(QString()).toStdString();
    }
}

TEST(ReportSaves, AFileThatCannotTakeItsPlaceIsSaidInTheSystemsWords)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    const ShownReport shown(longText());
    putFile(path, "earlier");
    QString problem;
    const FailingFiles failing(FailingFiles::Call::Rename, 1);
    EXPECT_FALSE(kareport::replaceFile(
        path, [&shown](QIODevice &device) { return shown.report.WriteText(device, kareport::LineEnds::ReportFile); },
        &problem));
    EXPECT_TRUE(failing.hasFailed());
    EXPECT_TRUE(problem.contains(QStringLiteral("Permission denied"))) << problem.toStdString();
}

TEST(ReportSaves, AJobThatGoesStraightToItsFileIsWholeOrNotWritten)
{
    const FixedSurroundings surroundings;
    const JobFolder folder;
    QByteArray steps = R"({"line": "a line of a report"})";
    for (int i = 0; i < 12; ++i) {
        steps += "," + steps;
    }
    folder.put("job.json", jobs::fixedFront + QByteArray(R"("header": false, "report": [)") + steps + "]}");
    for (const char *name : {"a.rep", "a.txt"}) {
        SCOPED_TRACE(name);
        const QString path = folder.path(name);
        putFile(path, "earlier");
        kareport::RenderCommand command;
        command.jobs = {folder.path("job.json")};
        command.outputs = {path};
        command.quiet = true;
        failEachCall(
            path, [] {},
            [&] {
                kareport::CommandLineJob job(command, kareport::JsonSource::read(folder.path("job.json")));
                kareport::Progress progress(false);
                return job.run(progress) == kareport::exitDone;
            },
            [] {});
    }
}

TEST(ReportSaves, AConvertedReportIsWholeOrNotWritten)
{
    const FixedSurroundings surroundings;
    const JobFolder folder;
    const int lines = testSize(2'000, 5'000);
    folder.put("in.rep", "\xEF\xBB\xBF" + QByteArray("a line of a report\r\r\n").repeated(lines));
    folder.put("in.rtf", "{\\rtf1 " + QByteArray("a line of a report\\par\r\n").repeated(lines) + '}');
    for (const char *in : {"in.rep", "in.rtf"}) {
        for (const char *out : {"a.rep", "a.txt", "a.rtf", "a.pdf"}) {
            SCOPED_TRACE(std::string(in) + " to " + out);
            kareport::ConvertCommand command;
            command.input = folder.path(in);
            command.output = folder.path(out);
            command.quiet = true;
            int count = 0;
            failEachCall(
                command.output, [] {}, [&] { return command.run(count, nullptr) == kareport::exitDone; },
                [&] { EXPECT_EQ(command.run(count, nullptr), kareport::exitDone) << "another try"; });
        }
    }
}

} // namespace
