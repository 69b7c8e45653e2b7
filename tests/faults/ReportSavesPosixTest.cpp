#include "FailingFiles.h"

#include "CommandLineJob.h"
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

using Call = FailingFiles::Call;

constexpr Call calls[] = {Call::Write, Call::ShortWrite, Call::Flush, Call::Rename};
constexpr const char *callNames[] = {"write", "short write", "flush", "rename"};

/// Lets a save fail at each of its calls in turn.
/// @param prepare  is called before each
/// @param save     saves over a file that holds "earlier". @return whether it says that it did
/// @param failed   is called after each that has failed
template <typename Prepare, typename Save, typename Failed>
void failEachCall(const QString &path, Prepare prepare, Save save, Failed failed)
{
    QString folder = QFileInfo(path).absolutePath();
    for (const Call call : calls) {
        // A second wait for the same bytes, which Qt adds, fails on no disk: they are there.
        const qint64 last = call == Call::Flush ? 1 : 1000;
        qint64 number = 1;
        for (bool hasFailed = true; hasFailed && number <= last; ++number) {
            SCOPED_TRACE(std::string(callNames[static_cast<int>(call)]) + " " + std::to_string(number));
            putFile(path, "earlier");
            const auto names = QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
            prepare();
            bool isSaved = false;
            {
                const FailingFiles failing(call, number);
                isSaved = save();
                hasFailed = failing.hasFailed();
            }
            EXPECT_EQ(isSaved, !hasFailed);
            EXPECT_EQ(contentOf(path) == "earlier", hasFailed) << "the earlier file is whole, or the new one is there";
            EXPECT_EQ(QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), names)
                << "nothing is left beside it";
            if (hasFailed) {
                failed();
            }
            if (testing::Test::HasFailure()) {
                return;
            }
        }
        EXPECT_GT(number, call == Call::Flush ? 1 : 2) << callNames[static_cast<int>(call)] << ": it is never called";
    }
}

QString longText()
{
    // More than is buffered at once.
    return reportLines(QStringLiteral("a line of a report \u6E2C\n").repeated(10000));
}

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
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    ShownReport shown(longText());
    putFile(path, "earlier");
    shown.report.SetModifiedFlag(true);
    const FailingFiles failing(Call::Write, 1);
    EXPECT_EQ(shown.report.SaveFile(path), 1);
    EXPECT_TRUE(failing.hasFailed());
    EXPECT_EQ(contentOf(path), "earlier");
    EXPECT_TRUE(shown.report.IsModified());
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
        const FailingFiles failing(Call::Write, 1);
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
    const FailingFiles failing(Call::Rename, 1);
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

} // namespace
