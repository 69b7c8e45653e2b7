#include "SaveAs.h"

#include "DeskApplication.h"
#include "DeskFixture.h"
#include "FileSizeLimit.h"
#include "JobFolder.h"
#include "PdfReadBack.h"
#include "SaveDialog.h"
#include "UReportWindowDlg.h"

#include <QFileDialog>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTimer>

#include <gtest/gtest.h>

namespace
{

using kareport::SaveRequest;

const QStringList kinds = {QStringLiteral("*.rtf"), QStringLiteral("*.rep"), QStringLiteral("*.pdf"),
                           QStringLiteral("*")};

TEST(SaveAs, TheEndingFollowsTheKind)
{
    struct Row
    {
        const char *typed;
        const char *kind;
        const char *name;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"/road/plan", "*.rtf", "/road/plan.rtf", "no ending"},
        {"/road/plan", "*.rep", "/road/plan.rep", "no ending"},
        {"/road/plan", "*", "/road/plan", "all files: as it was typed"},
        {"/road/plan.rtf", "*.rtf", "/road/plan.rtf", "its own"},
        {"/road/plan.RTF", "*.rtf", "/road/plan.RTF", "in any case"},
        {"/road/plan.rep", "*.rtf", "/road/plan.rep", "an ending that names another kind says more than the list"},
        {"/road/plan.Pdf", "*.rtf", "/road/plan.Pdf", "likewise"},
        {"/road/plan 2.1", "*.rtf", "/road/plan 2.1.rtf", "no kind has this ending"},
        {"/road/plan.txt", "*", "/road/plan.txt", "all files: as it was typed"},
        {"/road/plan.", "*.pdf", "/road/plan.pdf", "the dot alone"},
        {"/road.rtf/plan", "*.rep", "/road.rtf/plan.rep", "a folder's ending does not count"},
        {"/road/rtf", "*.rtf", "/road/rtf.rtf", "without the dot it is not an ending"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::withEndingOf(QLatin1String(row.typed), QLatin1String(row.kind), kinds),
                  QLatin1String(row.name))
            << row.typed << ' ' << row.kind << ": " << row.reason;
    }
}

/// The desk with its own dialogs, whose save dialog is answered by typed names, one for each time that it is shown.
class SavingDesk : public Desk
{
public:
    SavingDesk()
    {
        kareport::installDialogs(&*frame);
        kareport::setMessageBox([this](const kareport::Message &message) {
            messages.append(message.text);
            const bool isQuestion = message.buttons != MessageButtons::Ok;
            return isQuestion && !answers.isEmpty() ? answers.takeFirst() : answer;
        });
        QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { type(); });
        timer_.start(1);
    }
    ~SavingDesk()
    {
        timer_.stop();
        kareport::setSaveDialog({});
        answer = MessageAnswer::No;
    }

    QStringList typed;
    QString kind; ///< that is chosen; empty for the one that is offered
    QList<MessageAnswer> answers;

private:
    void type()
    {
        auto *dialog = qobject_cast<QFileDialog *>(QApplication::activeModalWidget());
        if (dialog == nullptr) {
            return;
        }
        if (typed.isEmpty()) {
            dialog->reject();
            return;
        }
        auto *field = dialog->findChild<QLineEdit *>(QStringLiteral("fileNameEdit"));
        if (!field->hasFocus()) {
            // A user types where the keyboard is. A text that is set elsewhere selects the file that it names, and the
            // dialog then shows the selected file's name without its folder.
            dialog->activateWindow();
            field->setFocus();
            return;
        }
        if (!kind.isEmpty()) {
            dialog->selectNameFilter(kind);
        }
        field->setText(typed.takeFirst());
        QTest::keyClick(field, Qt::Key_Return);
    }

    QTimer timer_;
};

/// A report with a line that is not saved.
UReportDoc *newReport(const QString &line = QStringLiteral("line"))
{
    UReportDoc *report = CreateReport(QStringLiteral("R"), false, false, nullptr, 0, nullptr);
    report->WriteLine(line, 0, 1, 0);
    report->UpdateAllViews(nullptr);
    return report;
}

TEST(SaveAs, ATypedNameGetsTheEndingThatTheDialogShows)
{
    struct Row
    {
        const char *opened; ///< null for a new report
        const char *kind;   ///< null for the one that is offered
        const char *typed;
        const char *saved;
        const char *reason;
    };
    const Row rows[] = {
        {nullptr, nullptr, "out", "out.rep", "a new report is offered as a report file"},
        {"in.rtf", nullptr, "out", "out.rtf", "what was opened as rich text is offered as rich text"},
        {"in.rtf", nullptr, "out.rep", "out.rep", "the user may name another kind"},
        {"in.rtf", "Report Files (*.rep)", "out", "out.rep", "or choose it"},
        {nullptr, "RTF Files (*.rtf)", "out 2.1", "out 2.1.rtf", "a number is not an ending"},
        {nullptr, "All Files (*)", "out", "out", "all files: as it was typed"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        folder.put("in.rtf", "{\\rtf1 text}");
        SavingDesk desk;
        if (row.opened != nullptr) {
            ASSERT_TRUE(desk.frame->OpenFile(folder.path(row.opened)));
        }
        UReportDoc *report = row.opened != nullptr ? Desk::reports().front() : newReport();
        desk.typed = {folder.path(row.typed)};
        desk.kind = QLatin1String(row.kind);
        EXPECT_TRUE(report->DoSave(QString(), true)) << row.reason;
        EXPECT_EQ(report->GetPathName(), folder.path(row.saved)) << row.reason;
        EXPECT_TRUE(QFile::exists(folder.path(row.saved))) << row.reason;
        EXPECT_TRUE(desk.messages.isEmpty()) << row.reason;
    }
}

TEST(SaveAs, AFileIsOnlyReplacedWhenTheUserSaysSo)
{
    const JobFolder folder;
    folder.put("a.rep", "earlier");
    SavingDesk desk;
    const UReportDoc *report = newReport();
    desk.typed = {folder.path("a"), folder.path("b")};
    desk.answers = {MessageAnswer::No};
    EXPECT_TRUE(Desk::reports().front()->DoSave(QString(), true));
    EXPECT_EQ(folder.bytesOf("a.rep"), "earlier");
    EXPECT_EQ(report->GetPathName(), folder.path("b.rep")) << "asked again";
    ASSERT_EQ(desk.messages.size(), 1) << "of the name with its ending";
    EXPECT_TRUE(desk.messages.front().contains(folder.path("a.rep")));
    desk.typed = {folder.path("a")};
    desk.answers = {MessageAnswer::Yes};
    EXPECT_TRUE(Desk::reports().front()->DoSave(QString(), true));
    EXPECT_NE(folder.bytesOf("a.rep"), "earlier");
}

TEST(SaveAs, AFolderThatIsNotThereIsSaidAndAskedForAgain)
{
    const JobFolder folder;
    SavingDesk desk;
    const UReportDoc *report = newReport();
    desk.typed = {folder.path("plan/a"), folder.path("b")};
    EXPECT_TRUE(Desk::reports().front()->DoSave(QString(), true));
    EXPECT_EQ(report->GetPathName(), folder.path("b.rep"));
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(folder.path("plan"))) << desk.messages.front().toStdString();
}

TEST(SaveAs, APdfIsAnExport)
{
    const JobFolder folder;
    folder.put("own.rep", "\xEF\xBB\xBFTALVEN\r\r\n");
    for (const char *own : {"", "own.rep"}) {
        SavingDesk desk;
        UReportDoc *report = nullptr;
        if (*own != 0) {
            ASSERT_TRUE(desk.frame->OpenFile(folder.path(own)));
            report = Desk::reports().front();
            report->WriteLine(QStringLiteral("more"), 0, 1, 0);
        } else {
            report = newReport();
        }
        const QString path = report->GetPathName();
        const QString title = report->GetTitle();
        const QStringList recent = UApplication::Get()->GetRecentFileList();
        desk.typed = {folder.path("out.PDF")};
        desk.answers = {MessageAnswer::Yes};
        report->DoSave(QString(), true);
        EXPECT_TRUE(folder.bytesOf("out.PDF").startsWith("%PDF-"));
        EXPECT_EQ(report->GetPathName(), path) << "it never becomes the report's own file";
        EXPECT_EQ(report->GetTitle(), title);
        EXPECT_TRUE(report->IsModified()) << "the report itself is not saved";
        EXPECT_EQ(UApplication::Get()->GetRecentFileList(), recent);
    }
}

TEST(SaveAs, APdfMayHaveAnOutline)
{
    struct Row
    {
        const char *kind; ///< that is chosen
        const char *title;
        const char *outline;
        const char *reason;
    };
    const Row rows[] = {
        {nullptr, "", "", "a name alone: the pages alone"},
        {"PDF (*.pdf)", "", "", "the plain kind"},
        {"PDF with outline and page numbers (*.pdf)", "R", "Points 1\n", "the other one"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        SavingDesk desk;
        UReportDoc *report = newReport();
        report->AnnounceEntry(1, QStringLiteral("Points"));
        report->WriteLine(QStringLiteral("1 5.000"), 0, 1, 0);
        desk.kind = QLatin1String(row.kind);
        desk.typed = {folder.path("out.pdf")};
        report->DoSave(QString(), true);
        const PdfReadBack pdf(folder.bytesOf("out.pdf"));
        EXPECT_EQ(pdf.info("Title"), QLatin1String(row.title)) << row.reason;
        EXPECT_EQ(pdf.info("Creator"), row.kind != nullptr && *row.outline != 0 ? QStringLiteral("TALVEN") : QString())
            << row.reason;
        EXPECT_EQ(pdf.outline(), QString::fromUtf8(row.outline)) << row.reason;
        EXPECT_TRUE(report->IsModified()) << row.reason;
    }
}

TEST(SaveAs, AClosingReportIsNotSavedByAnExport)
{
    const QTemporaryDir folder;
    SavingDesk desk;
    UReportDoc *report = newReport();
    desk.typed = {folder.filePath(QStringLiteral("a.pdf"))};
    desk.answers = {MessageAnswer::Yes};
    EXPECT_FALSE(report->SaveModified()) << "the text would be gone";
    EXPECT_TRUE(QFile::exists(folder.filePath(QStringLiteral("a.pdf"))));
    EXPECT_TRUE(report->IsModified());
}

TEST(SaveAs, TheReportWindowExportsLikewise)
{
    const JobFolder folder;
    folder.put("a.json", lineJob());
    SavingDesk desk;
    desk.keepReportWindows();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    UReportDoc *report = Desk::reports().front();
    auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    desk.typed = {folder.path("out.pdf")};
    SetLastOpenDir(QDir::root().filePath(QStringLiteral("a.rep")), QStringLiteral("LastOpenDirectoryReport"));
    window->OnSave();
    EXPECT_TRUE(folder.bytesOf("out.pdf").startsWith("%PDF-"));
    EXPECT_TRUE(report->IsModified());
    EXPECT_EQ(QDir(GetInitialOpenDir(QStringLiteral("LastOpenDirectoryReport"))),
              QFileInfo(folder.path("out.pdf")).dir())
        << "the next dialog begins there";
    desk.typed = {folder.path("out.rep")};
    window->OnSave();
    EXPECT_FALSE(report->IsModified());
}

TEST(SaveAs, AHostThatAsksForItselfSavesAPdfAsItsOwn)
{
    const QTemporaryDir folder;
    Desk desk;
    UReportDoc *report = newReport();
    kareport::setSaveDialog([&folder](const SaveRequest &request) -> std::optional<QString> {
        EXPECT_NE(request.document, nullptr);
        return folder.filePath(QStringLiteral("a.pdf"));
    });
    EXPECT_TRUE(report->DoSave(QString(), true));
    EXPECT_EQ(report->GetPathName(), folder.filePath(QStringLiteral("a.pdf")));
    EXPECT_FALSE(report->IsModified());
    kareport::setSaveDialog({});
}

TEST(SaveAs, AFailedSaveSaysWhy)
{
    struct Row
    {
        const char *name;
        void (*spoil)(UReportDoc &report);
        const char *message;
        const char *reason;
    };
    const Row rows[] = {
        {"a.pdf", [](UReportDoc &report) { report.SetMargins(QMargins(20000, 1000, 20000, 1000)); },
         "margins leave no room", "no other folder would help"},
        {"a.pdf", [](UReportDoc &report) { report.Clear(); }, "the report is empty", "readers refuse an empty PDF"},
        {"a.pdf", [](UReportDoc &report) { report.SetData(QStringLiteral("{\\rtf1\\ansi}")); }, "the report is empty",
         "rich text that shows nothing"},
        {"gone/a.pdf", [](UReportDoc &) {}, "No such file or directory", "a folder that is not there"},
        {"gone/a.rep", [](UReportDoc &) {}, "No such file or directory", "for a report file as well"},
        {"gone/a.rtf", [](UReportDoc &) {}, "No such file or directory", "and for rich text"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        SavingDesk desk;
        UReportDoc *report = newReport();
        row.spoil(*report);
        kareport::setSaveDialog([&](const SaveRequest &request) {
            return kareport::askOwnName(request, [&](const SaveRequest &) { return folder.path(row.name); });
        });
        EXPECT_FALSE(report->DoSave(QString(), true)) << row.reason;
        ASSERT_EQ(desk.messages.size(), 1) << row.reason;
        EXPECT_TRUE(desk.messages.front().contains(QLatin1String(row.message)))
            << row.reason << ": " << desk.messages.front().toStdString();
        EXPECT_TRUE(desk.messages.front().contains(folder.path(row.name))) << row.reason;
        EXPECT_FALSE(QFile::exists(folder.path(row.name))) << row.reason;
        EXPECT_TRUE(report->GetPathName().isEmpty()) << row.reason;
    }
}

TEST(SaveAs, AFullDiskIsSaid)
{
    for (const char *name : {"a.pdf", "a.rep", "a.rtf"}) {
        const JobFolder folder;
        SavingDesk desk;
        UReportDoc *report = newReport(QString(100000, u'x'));
        desk.typed = {folder.path(name)};
        {
            const FileSizeLimit full(4096);
            EXPECT_FALSE(report->DoSave(QString(), true)) << name;
        }
        ASSERT_EQ(desk.messages.size(), 1) << name;
        EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("File too large")))
            << name << ": " << desk.messages.front().toStdString();
        EXPECT_TRUE(report->IsModified()) << name;
    }
}

TEST(SaveAs, CharactersThatNoFaceHasAreSaid)
{
    const JobFolder folder;
    SavingDesk desk;
    UReportDoc *report = newReport(QStringLiteral("a \uE123 b"));
    desk.typed = {folder.path("a.pdf")};
    report->DoSave(QString(), true);
    EXPECT_TRUE(folder.bytesOf("a.pdf").startsWith("%PDF-"));
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("U+E123"))) << desk.messages.front().toStdString();
    desk.messages.clear();
    UReportDoc *plain = newReport();
    desk.typed = {folder.path("b.pdf")};
    plain->DoSave(QString(), true);
    EXPECT_TRUE(desk.messages.isEmpty()) << "nothing is said where all is well";
}

TEST(SaveAs, AFileThatIsOpenAsAnotherReportIsNotReplaced)
{
    const JobFolder folder;
    const QByteArray content = "\xEF\xBB\xBFTALVEN other\r\r\n";
    folder.put("other.rep", content);
    ASSERT_TRUE(QFile::link(folder.path("other.rep"), folder.path("link.rep")));
    SavingDesk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("other.rep")));
    UReportDoc *report = newReport();
    desk.typed = {folder.path("other.rep"), folder.path("link.rep"), folder.path("mine.rep")};
    EXPECT_TRUE(report->DoSave(QString(), true)) << "the dialog comes back for another name";
    ASSERT_EQ(desk.messages.size(), 2);
    EXPECT_TRUE(desk.messages[0].contains(QStringLiteral("is open as another report")))
        << desk.messages[0].toStdString();
    EXPECT_TRUE(desk.messages[1].contains(QStringLiteral("is open as another report")))
        << "by whatever name: " << desk.messages[1].toStdString();
    EXPECT_EQ(folder.bytesOf("other.rep"), content);
    EXPECT_EQ(report->GetPathName(), folder.path("mine.rep"));

    desk.messages.clear();
    desk.typed = {folder.path("mine.rep")};
    desk.answers = {MessageAnswer::Yes};
    EXPECT_TRUE(report->DoSave(QString(), true)) << "its own file is only asked about";
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages[0].contains(QStringLiteral("already")));
}

} // namespace
