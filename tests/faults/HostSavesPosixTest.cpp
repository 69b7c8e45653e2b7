#include "FailEachCall.h"

#include "CommandLineJob.h"
#include "Commands.h"
#include "FrameFixture.h"
#include "JobRunnerFixture.h"
#include "NotesFile.h"
#include "OutputFolders.h"

#include <QTemporaryDir>

namespace
{

TEST(HostSaves, ADocumentOfTheHostIsSavedWholeOrIsStillModified)
{
    struct Row
    {
        const char *name;
        bool (*save)(TextDocument &document, const QString &path);
    };
    constexpr Row rows[] = {
        {"OnSaveDocument", [](TextDocument &document, const QString &path) { return document.OnSaveDocument(path); }},
        {"DoSave", [](TextDocument &document, const QString &path) { return document.DoSave(path, false); }},
        {"DoSave, under a new path",
         [](TextDocument &document, const QString &path) {
             document.SetPathName(QStringLiteral("earlier"), false);
             const bool isSaved = document.DoSave(path, true);
             EXPECT_EQ(document.GetPathName(), isSaved ? path : QStringLiteral("earlier"));
             return isSaved;
         }},
        {"DoFileSave",
         [](TextDocument &document, const QString &path) {
             document.SetPathName(path, false);
             return document.DoFileSave();
         }},
        {"SaveModified",
         [](TextDocument &document, const QString &path) {
             const AnsweredMessages messages(MessageAnswer::Yes);
             document.SetPathName(path, false);
             return document.SaveModified();
         }},
    };
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.txt"));
    FrameLog log;
    const TextApplication application(log);
    TextDocument &document = *application.open();
    const QByteArray content(100'000, 'x'); // more than is buffered at once
    document.content = content;
    for (const Row &row : rows) {
        SCOPED_TRACE(row.name);
        failEachCall(
            path, [&] { document.SetModifiedFlag(true); },
            [&] {
                const bool isSaved = row.save(document, path);
                EXPECT_EQ(document.IsModified(), !isSaved);
                return isSaved;
            },
            [&] { EXPECT_TRUE(document.content == content); });
        EXPECT_EQ(contentOf(path), content.toStdString());
    }
}

TEST(HostSaves, NotesAreWholeOrItIsSaid)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("notes.json"));
    kareport::JobNotes notes;
    for (int i = 0; i < 500; ++i) { // more than is buffered at once
        notes.add({kareport::JobNote::Kind::WideValue,
                   {QStringLiteral("job.json"), std::nullopt, QStringLiteral("values of a column, %1").arg(i)}});
    }
    ASSERT_GT(notes.toJson().size(), 32'000);
    failEachCall(
        path, [] { testing::internal::CaptureStderr(); },
        [&] {
            const bool isWritten = kareport::writeNotesFile(notes, path, kareport::OutputFolders(false));
            const std::string said = testing::internal::GetCapturedStderr();
            EXPECT_EQ(said.empty(), isWritten);
            EXPECT_TRUE(isWritten || said.find(path.toStdString() + "\" could not be written: ") != std::string::npos)
                << said;
            return isWritten;
        },
        [] {});
    EXPECT_EQ(contentOf(path), notes.toJson().toStdString());
}

TEST(HostSaves, AJobWhoseNotesCannotBeWrittenDoesNotEndAsDone)
{
    const FixedSurroundings surroundings;
    const JobFolder folder;
    folder.put("t.xml", jobs::pointsTemplate());
    folder.put("job.json", jobs::fixedFront +
                               jobs::templateJob(R"("points": {"values": [{"Number": "1", "Unknown": "x"}]})",
                                                 R"({"table": "Points", "data": "points"})") +
                               "}");
    kareport::RenderCommand command;
    command.jobs = {folder.path("job.json")};
    command.outputs = {folder.path("a.rep")};
    command.notes = folder.path("notes.json");
    command.quiet = true;
    const auto run = [&] {
        kareport::CommandLineJob job(command, kareport::JsonSource::read(folder.path("job.json")));
        kareport::Progress progress(false);
        return job.run(progress);
    };
    testing::internal::CaptureStderr();
    ASSERT_EQ(run(), kareport::exitDone);
    const std::string whole = contentOf(folder.path("notes.json"));
    const std::string report = contentOf(folder.path("a.rep"));
    ASSERT_NE(whole.find("Unknown"), std::string::npos) << whole;
    int notesFailed = 0;
    for (const FailingFiles::Call call : {FailingFiles::Call::Write, FailingFiles::Call::Rename}) {
        qint64 number = 1;
        for (bool hasFailed = true; hasFailed && !HasFailure(); ++number) {
            putFile(folder.path("notes.json"), "earlier");
            putFile(folder.path("a.rep"), "earlier");
            auto status = kareport::exitDone;
            {
                const FailingFiles failing(call, number);
                status = run();
                hasFailed = failing.hasFailed();
            }
            const std::string notes = contentOf(folder.path("notes.json"));
            const std::string text = contentOf(folder.path("a.rep"));
            EXPECT_EQ(status != kareport::exitDone, hasFailed) << number;
            EXPECT_TRUE(notes == whole || notes == "earlier") << number << ": " << notes;
            EXPECT_TRUE(text == report || text == "earlier") << number << ": " << text;
            EXPECT_EQ(notes == whole && text == report, !hasFailed) << number;
            notesFailed += hasFailed && text == report ? 1 : 0;
        }
        EXPECT_GT(number, 2);
    }
    testing::internal::GetCapturedStderr();
    EXPECT_GE(notesFailed, 2) << "the notes alone";
}

TEST(HostSaves, ANewJobIsThereWithAllItsFilesOrNotAtAll)
{
    const QTemporaryDir folder;
    kareport::NewCommand command;
    command.folder = folder.filePath(QStringLiteral("survey"));
    command.quiet = true;
    const QDir made(command.folder);
    int failed = 0;
    for (const FailingFiles::Call call : {FailingFiles::Call::Write, FailingFiles::Call::ShortWrite}) {
        bool hasFailed = true;
        for (qint64 number = 1; hasFailed && !HasFailure(); ++number) {
            SCOPED_TRACE(std::string(failingCallNames[static_cast<int>(call)]) + " " + std::to_string(number));
            testing::internal::CaptureStderr();
            auto status = kareport::exitDone;
            {
                const FailingFiles failing(call, number);
                status = command.run();
                hasFailed = failing.hasFailed();
            }
            const std::string said = testing::internal::GetCapturedStderr();
            EXPECT_EQ(status, hasFailed ? kareport::exitOutput : kareport::exitDone) << said;
            EXPECT_EQ(made.exists(), !hasFailed) << "nothing is left of it";
            EXPECT_EQ(said.find("could not be written") != std::string::npos, hasFailed) << said;
            EXPECT_EQ(said.find(made.path().toStdString()) != std::string::npos, hasFailed) << said;
            failed += hasFailed ? 1 : 0;
        }
        EXPECT_EQ(made.entryList(QDir::Files).size(), 3) << "the template, the data and the job";
        EXPECT_TRUE(QDir(command.folder).removeRecursively());
    }
    EXPECT_GE(failed, 6) << "each of the files, each way";
}

} // namespace
