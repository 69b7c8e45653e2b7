#include "ReportSubject.h"

#include "DeskFixture.h"
#include "JobOutputs.h"
#include "ReportSaveName.h"
#include "ReportTextCodec.h"
#include "ReportWindowEntry.h"
#include "SaveAs.h"
#include "SaveDialog.h"
#include "UArchive.h"
#include "UReportWindowDlg.h"

#include <QTemporaryDir>

namespace
{

/// What is left of a text that there was no memory for.
enum class Left
{
    Nothing, ///< it was to take the place of another
    Part     ///< it was to be written after another
};

constexpr Left losses[] = {Left::Nothing, Left::Part};

void loseText(UReportDoc &report, Left left)
{
    const QString text(2'000'000, u'x');
    const qint64 before = report.GetTextLength();
    {
        const FailingAllocation failing(1, 1'000'000, FailingAllocation::Extent::AllAfter);
        if (left == Left::Nothing) {
            report.SetData(text);
        } else {
            EXPECT_FALSE(report.Write(text, 0));
        }
        EXPECT_TRUE(failing.hasFailed());
    }
    ASSERT_TRUE(report.HasLostText());
    ASSERT_EQ(report.GetTextLength(), left == Left::Nothing ? 0 : before);
}

const QString reason = QStringLiteral("memory ran out");

TEST(LostText, IsSavedUnderNoName)
{
    struct Row
    {
        const char *name;
        Shape shape;
        const char *reason;
    };
    const Row rows[] = {
        {"a.rep", {}, "a report file"},
        {"a", {}, "under any name"},
        {"a.rtf", {.hasView = true}, "what a view shows"},
        {"a.rtf", {.isRichText = true, .hasView = true}, "the image"},
        {"a.rtf", {}, "report text under the name of rich text"},
        {"a.pdf", {}, "a PDF"},
    };
    const Surroundings around;
    kareport::setSaveFailure(kareport::sayNotSaved); // as a host that wants it
    for (const Row &row : rows) {
        for (const Left left : losses) {
            for (const bool isThere : {true, false}) {
                for (const bool isModified : {true, false}) {
                    SCOPED_TRACE(testing::Message()
                                 << row.reason << (left == Left::Part ? ", a part" : ", nothing")
                                 << (isThere ? " over a file" : "") << (isModified ? ", modified" : ""));
                    const QTemporaryDir folder;
                    const QString path = folder.filePath(QString::fromUtf8(row.name));
                    if (isThere) {
                        putFile(path, "earlier");
                    }
                    ReportSubject subject(row.shape);
                    UReportDoc &report = subject.report;
                    loseText(report, left);
                    report.SetModifiedFlag(isModified);
                    EXPECT_FALSE(report.OnSaveDocument(path));
                    EXPECT_TRUE(report.GetSaveProblem().contains(reason)) << report.GetSaveProblem().toStdString();
                    const std::size_t said = around.boxes.boxes.size();
                    EXPECT_FALSE(report.DoSave(path, false));
                    ASSERT_EQ(around.boxes.boxes.size(), said + 1);
                    EXPECT_TRUE(around.boxes.boxes.back().text.contains(reason));
                    report.SaveFile(path); // whose answer says nothing
                    EXPECT_EQ(report.IsModified(), isModified);
                    ASSERT_EQ(QFile::exists(path), isThere);
                    EXPECT_TRUE(!isThere || contentOf(path) == "earlier");
                    EXPECT_TRUE(around.launches.all.empty());
                }
            }
        }
    }
    kareport::setSaveFailure({});
}

TEST(LostText, IsWrittenNowhere)
{
    struct Row
    {
        const char *name;
        bool (*write)(ReportSubject &subject);
    };
    const Row rows[] = {
        {"a report file", [](auto &s) { return s.report.WriteText(s.bytes, kareport::LineEnds::ReportFile); }},
        {"plain text", [](auto &s) { return s.report.WriteText(s.bytes, kareport::LineEnds::PlainText); }},
        {"a PDF", [](auto &s) { return s.report.WritePdf(s.bytes); }},
        {"the image", [](auto &s) { return s.report.WriteRichTextFile(s.bytes); }},
        {"an archive",
         [](auto &s) {
             UArchive archive(s.bytes, UArchive::Mode::Storing, QString());
             s.report.Serialize(archive);
             return archive.IsGood();
         }},
        {"a stream",
         [](auto &s) {
             kareport::ReportTextWriter writer(s.bytes, kareport::LineEnds::ReportFile);
             return s.report.EndTextStream(writer);
         }},
    };
    const Surroundings around;
    kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::A4, 600});
    for (const Row &row : rows) {
        for (const bool isRichText : {false, true}) {
            {
                ReportSubject whole({.isRichText = isRichText});
                whole.report.SetPageSize();
                EXPECT_TRUE(row.write(whole)) << row.name << ": it does not work at all";
            }
            for (const Left left : losses) {
                ReportSubject subject({.isRichText = isRichText});
                loseText(subject.report, left);
                EXPECT_FALSE(row.write(subject)) << row.name << (left == Left::Part ? ", a part" : ", nothing");
            }
        }
    }
}

TEST(LostText, IsNotAnOutput)
{
    using kareport::OutputKind;
    const Surroundings around;
    for (const OutputKind kind :
         {OutputKind::Report, OutputKind::Text, OutputKind::RichText, OutputKind::Pdf, OutputKind::RichTextImage})
    {
        for (const Left left : losses) {
            const QTemporaryDir folder;
            const QString path = folder.filePath(QStringLiteral("out"));
            putFile(path, "earlier");
            ReportSubject subject({});
            loseText(subject.report, left);
            kareport::Progress progress(false);
            EXPECT_FALSE(kareport::writeOutput(subject.report, {path, kind}, progress).isWritten())
                << static_cast<int>(kind);
            EXPECT_EQ(contentOf(path), "earlier") << static_cast<int>(kind);
        }
    }
}

/// Answers the questions for a name as the desk does: with a name for a file of the report's own, or an export.
class NamedSaves
{
public:
    explicit NamedSaves(const QString &path)
    {
        kareport::setSaveDialog([path](const kareport::SaveRequest &request) {
            return kareport::askOwnName(request, [&path](const kareport::SaveRequest &) { return path; });
        });
    }
    ~NamedSaves() { kareport::setSaveDialog({}); }
    NamedSaves(const NamedSaves &) = delete;
    NamedSaves &operator=(const NamedSaves &) = delete;
};

TEST(LostText, IsSaidAtTheDeskAndNeverSaved)
{
    for (const char *name : {"a.rep", "a.rtf", "a.pdf"}) {
        for (const Left left : losses) {
            SCOPED_TRACE(testing::Message() << name << (left == Left::Part ? ", a part" : ", nothing"));
            const QTemporaryDir folder;
            const QString path = folder.filePath(QString::fromUtf8(name));
            Desk desk;
            const NamedSaves saves(path);
            UReportDoc *report = CreateReportWindow(QStringLiteral("R"), false, false);
            ASSERT_NE(report, nullptr);
            report->WriteLine(QStringLiteral("before"), 0, 1, 0);
            loseText(*report, left);
            report->SetModifiedFlag(true);
            const auto expectRefused = [&](qsizetype messages) {
                ASSERT_EQ(desk.messages.size(), messages);
                EXPECT_TRUE(desk.messages.back().contains(reason)) << desk.messages.back().toStdString();
                EXPECT_TRUE(report->IsModified());
                EXPECT_TRUE(report->GetPathName().isEmpty());
                EXPECT_FALSE(QFile::exists(path));
                desk.messages.clear();
            };
            EXPECT_FALSE(report->DoSave(QString(), true));
            expectRefused(1);
            dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())->OnSave();
            expectRefused(1);
            desk.answer = MessageAnswer::Yes;
            EXPECT_FALSE(report->SaveModified()) << "closing it would end what is left";
            expectRefused(2);
            desk.answer = MessageAnswer::No;
        }
    }
}

} // namespace
