#include "COneViewPane.h"
#include "DeskFixture.h"

#include "CrashFolder.h"
#include "FrameFixture.h"
#include "Recovery.h"
#include "ReportCommandIds.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "ReportViewWidget.h"
#include "UReportView.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

using kareport::KeptReport;
using kareport::Recovery;

UReportDoc *makeReport(const QString &title, const QString &text, bool isModified = true)
{
    UReportDoc *report = CreateReport(title, false, false, nullptr, 0, nullptr);
    report->SetData(text);
    report->UpdateAllViews(nullptr);
    report->SetModifiedFlag(isModified);
    return report;
}

/// A rich text whose formats are in its view, with a letter typed into it.
UReportDoc *editedRichText()
{
    UReportDoc *report = makeReport(QStringLiteral("R"), QStringLiteral("{\\rtf1 {\\b bold}}"));
    QTest::keyClick(&dynamic_cast<UReportView *>(report->GetViews().front())->GetEdit(), Qt::Key_X);
    return report;
}

/// Starts a desk, has something done there, keeps what is open, and ends the program as a crash does.
/// @param work  is given the desk and what keeps its reports
template <typename Work>
void crashAfter(const CrashFolder &folder, const Work &work)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    auto recovery = std::make_unique<Recovery>(folder.path());
    work(desk, *recovery);
    recovery->keep();
    folder.crash(std::move(recovery));
}

TEST(Recovery, WhatWasOpenComesBackAfterACrash)
{
    const JobFolder files;
    files.put("saved.rep", "TALVEN saved\r\r\n");
    files.put("edited.rep", "TALVEN old\r\r\n");
    const CrashFolder folder;
    const QString text = QStringLiteral("a\r\n\u00E9 \u4E2D \U0001F600\r\nlast without an end");
    crashAfter(folder, [&](Desk &desk, Recovery &recovery) {
        EXPECT_TRUE(recovery.leftReports().empty());
        makeReport(QStringLiteral("Traverse"), text);
        makeReport(QStringLiteral("Untouched"), QString(), false);
        ASSERT_TRUE(desk.frame->OpenFile(files.path("saved.rep")));
        ASSERT_TRUE(desk.frame->OpenFile(files.path("edited.rep")));
        Desk::reports().back()->WriteLine(QStringLiteral("new"), 0, 1, 0);
    });
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery recovery(folder.path());
    const std::vector<KeptReport> left = recovery.leftReports();
    ASSERT_EQ(left.size(), 3U) << "an empty report that was never written into is nothing to bring back";
    EXPECT_EQ(left[0].title, QStringLiteral("Traverse"));
    EXPECT_EQ(left[1].path, files.path("saved.rep"));
    EXPECT_TRUE(left[1].textFile.isEmpty()) << "its own file holds all of it";
    EXPECT_EQ(left[2].path, files.path("edited.rep"));

    const UReportDoc *unsaved = kareport::reopenReport(left[0]);
    ASSERT_NE(unsaved, nullptr);
    EXPECT_EQ(unsaved->CopyText(), text) << "to the character";
    EXPECT_EQ(unsaved->GetTitle(), QStringLiteral("Traverse"));
    EXPECT_TRUE(unsaved->IsModified()) << "closing it asks";
    EXPECT_TRUE(unsaved->GetPathName().isEmpty());
    const UReportDoc *saved = kareport::reopenReport(left[1]);
    ASSERT_NE(saved, nullptr);
    EXPECT_FALSE(saved->IsModified());
    const UReportDoc *edited = kareport::reopenReport(left[2]);
    ASSERT_NE(edited, nullptr);
    EXPECT_TRUE(edited->CopyText().endsWith(QStringLiteral("new\r\n")));
    EXPECT_EQ(edited->GetPathName(), files.path("edited.rep")) << "saving it goes to its file";
    EXPECT_TRUE(edited->IsModified());
    EXPECT_EQ(files.bytesOf("edited.rep"), "TALVEN old\r\r\n") << "which is only written by saving";

    recovery.discardLeft();
    EXPECT_TRUE(Recovery(folder.path()).leftReports().empty());
}

TEST(Recovery, PagesComeBack)
{
    const JobFolder files;
    const CrashFolder folder;
    std::vector<qint64> starts;
    crashAfter(folder, [&](Desk &, Recovery &) {
        UReportDoc *report = makeReport(QStringLiteral("R"), QString());
        report->FixPage(7, 80);
        for (int page = 0; page < 4; ++page) {
            report->NewPage(-1);
            report->WriteLine(QStringLiteral("line of a page without header"), 0, 1, 0);
        }
        report->ReplaceText(report->GetPageStarts().at(2), 0, u"x\r\nno longer full pages");
        starts = report->GetPageStarts();
    });
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery recovery(folder.path());
    ASSERT_EQ(recovery.leftReports().size(), 1U);
    const UReportDoc *report = kareport::reopenReport(recovery.leftReports()[0]);
    ASSERT_NE(report, nullptr);
    EXPECT_EQ(report->GetPageStarts(), starts);
    EXPECT_EQ(report->GetLinesPerPage(), 7);
    EXPECT_TRUE(report->IsPageFixed());
    EXPECT_EQ(report->GetPages().size(), 4U);
    auto *view = dynamic_cast<UReportView *>(report->GetViews().front());
    EXPECT_EQ(static_cast<kareport::ReportViewWidget *>(view->GetWidget())->pageCount(), 4);
    recovery.discardLeft();
}

TEST(Recovery, FormatsOfAnEditedRichTextComeBack)
{
    const CrashFolder folder;
    crashAfter(folder, [](Desk &, Recovery &) { editedRichText(); });
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery recovery(folder.path());
    ASSERT_EQ(recovery.leftReports().size(), 1U);
    const UReportDoc *report = kareport::reopenReport(recovery.leftReports().front());
    ASSERT_NE(report, nullptr);
    const kareport::ReportEdit &edit = dynamic_cast<UReportView *>(report->GetViews().front())->GetEdit();
    EXPECT_EQ(edit.toPlainText().trimmed(), QStringLiteral("xbold"));
    QTextCursor cursor(edit.document());
    cursor.setPosition(3);
    EXPECT_EQ(cursor.charFormat().fontWeight(), QFont::Bold);
}

// Formats are in the view alone: when that is closed, the report is the text that its other views show. What was kept
// before would bring back another one.
TEST(Recovery, FormatsGoWithTheViewThatHasThem)
{
    const CrashFolder folder;
    QString text;
    crashAfter(folder, [&](Desk &desk, Recovery &recovery) {
        UReportDoc *report = editedRichText();
        auto *formatted = dynamic_cast<UReportView *>(report->GetViews().front());
        recovery.keep();
        ASSERT_TRUE(formatted->ShowsFormats());
        desk.frame->OnCommand(kareport::windowNewCommand);
        ASSERT_EQ(report->GetViews().size(), 2U);
        dynamic_cast<COneViewPane *>(formatted->GetParentPane())->GetDock()->close();
        QCoreApplication::processEvents();
        ASSERT_EQ(report->GetViews().size(), 1U);
        ASSERT_FALSE(dynamic_cast<UReportView *>(report->GetViews().front())->ShowsFormats());
        text = report->CopyText();
    });
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery recovery(folder.path());
    ASSERT_EQ(recovery.leftReports().size(), 1U);
    const UReportDoc *report = kareport::reopenReport(recovery.leftReports().front());
    ASSERT_NE(report, nullptr);
    EXPECT_EQ(report->CopyText(), text);
    recovery.discardLeft();
}

TEST(Recovery, AReportHasTheNameThatTheUserKnows)
{
    struct Row
    {
        kareport::KeptReport kept;
        const char *name;
        const char *reason;
    };
    const Row rows[] = {
        {{QStringLiteral("Stakeout"), QStringLiteral("/road/a.rep"), QString()}, "Stakeout", "its title"},
        {{QString(), QStringLiteral("/road/a.rep"), QString()}, "/road/a.rep", "opened from a file"},
        {{QString(), QString(), QStringLiteral("1.txt")}, "Untitled", "neither"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(row.kept.name(), QString::fromUtf8(row.name)) << row.reason;
    }
}

TEST(Recovery, OnlyTheUserCanReadWhatIsKept)
{
    const CrashFolder folder;
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery recovery(folder.path());
    makeReport(QStringLiteral("R"), QStringLiteral("secret"));
    recovery.keep();
    constexpr auto others = QFile::ReadGroup | QFile::ReadOther | QFile::ExeGroup | QFile::ExeOther;
    EXPECT_FALSE(QFile::permissions(folder.path() + u'/' + folder.programs().value(0)) & others);
}

TEST(Recovery, ARegularEndLeavesNothing)
{
    const CrashFolder folder;
    Desk desk;
    desk.answer = MessageAnswer::No;
    {
        Recovery recovery(folder.path());
        makeReport(QStringLiteral("R"), QStringLiteral("text"));
        recovery.keep();
        EXPECT_EQ(folder.programs().size(), 1);
    }
    EXPECT_TRUE(folder.programs().isEmpty());
}

TEST(Recovery, AProgramThatStillRunsKeepsItsOwn)
{
    const CrashFolder folder;
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery first(folder.path());
    makeReport(QStringLiteral("R"), QStringLiteral("text"));
    first.keep();
    Recovery second(folder.path());
    EXPECT_TRUE(second.leftReports().empty());
    second.discardLeft();
    EXPECT_EQ(folder.programs().size(), 2);
}

TEST(Recovery, TextsAreWrittenOnceAndGoWithTheirReports)
{
    const CrashFolder folder;
    Desk desk;
    desk.answer = MessageAnswer::No;
    Recovery recovery(folder.path());
    UReportDoc *report = makeReport(QStringLiteral("R"), QStringLiteral("text"));
    recovery.keep();
    const QString program = folder.programs().value(0);
    const QString file = folder.path() + u'/' + program + QStringLiteral("/1");
    ASSERT_EQ(contentOf(file), "text");
    QFile::remove(file);
    recovery.keep();
    EXPECT_FALSE(QFile::exists(file)) << "the text is the one that was written before";
    report->ReplaceText(0, 1, u"T");
    recovery.keep();
    EXPECT_EQ(contentOf(file), "Text") << "a change of the same length is a change";
    report->WriteLine(QStringLiteral("!"), 0, 0, 0);
    recovery.keep();
    EXPECT_EQ(contentOf(file), "Text!");
    report->SetModifiedFlag(false);
    recovery.keep();
    EXPECT_FALSE(QFile::exists(file)) << "what is saved need not be kept";
    report->SetModifiedFlag(true);
    recovery.keep();
    recovery.forget(report);
    report->OnCloseDocument();
    recovery.keep();
    EXPECT_EQ(folder.files(program).filter(QRegularExpression(QStringLiteral("^[0-9]+$"))), QStringList());
}

TEST(Recovery, SpoiledFilesAreNotReports)
{
    struct Row
    {
        const char *list;
        std::size_t count;
        const char *reason;
    };
    for (const Row &row : {Row{"", 0, "an empty list"}, Row{"[{", 0, "a list that was cut off"},
                           Row{"{}", 0, "no list"}, Row{"[1, null, \"x\"]", 3, "entries without anything"},
                           Row{R"([{"title": "T", "text": "../../etc/passwd"}])", 1, "a text from elsewhere"}})
    {
        const CrashFolder folder;
        QDir().mkpath(folder.path() + QStringLiteral("/crashed"));
        putFile(folder.path() + QStringLiteral("/crashed/reports.json"), row.list);
        Desk desk;
        Recovery recovery(folder.path());
        EXPECT_EQ(recovery.leftReports().size(), row.count) << row.reason;
        for (const KeptReport &kept : recovery.leftReports()) {
            EXPECT_EQ(kareport::reopenReport(kept), nullptr) << row.reason;
        }
    }
}

/// Files of others, which nothing may happen to.
class ForeignFiles
{
public:
    ForeignFiles()
    {
        QDir(folder_.path()).mkdir(QStringLiteral("album"));
        for (const char *name : {"1", "lock", "reports.json", "letter", "album/1"}) {
            putFile(at(name), "mine");
        }
    }

    QString path() const { return folder_.path(); }
    QString at(const char *name) const { return folder_.filePath(QLatin1String(name)); }
    void expectWhole(const char *reason) const
    {
        EXPECT_EQ(QDir(path()).entryList(QDir::AllEntries | QDir::NoDotAndDotDot).size(), 5) << reason;
        for (const char *name : {"1", "lock", "reports.json", "letter", "album/1"}) {
            EXPECT_EQ(contentOf(at(name)), "mine") << name << ": " << reason;
        }
    }

private:
    QTemporaryDir folder_;
};

const QString programName = QStringLiteral("0a1b2c3d-0000-4000-8000-00000000000");

TEST(Recovery, LinksAreNotFollowedAndForeignFoldersAreLeftAlone)
{
    const CrashFolder folder;
    const ForeignFiles foreign;
    QDir().mkpath(folder.path() + QStringLiteral("/photos/2024"));
    putFile(folder.path() + QStringLiteral("/photos/2024/1"), "mine");
    putFile(folder.path() + QStringLiteral("/photos/1"), "mine");
    QFile::link(foreign.path(), folder.path() + QStringLiteral("/link"));
    QFile::link(foreign.path(), folder.path() + u'/' + programName + u'1');
    // A folder of a program that crashed, with links among its files.
    const QString crashed = folder.path() + u'/' + programName + u'2';
    QDir().mkpath(crashed);
    putFile(crashed + QStringLiteral("/reports.json"), R"([{"title": "T", "text": "1"}, {"title": "U", "text": "2"}])");
    QFile::link(foreign.at("1"), crashed + QStringLiteral("/1"));
    putFile(crashed + QStringLiteral("/2"), "text");
    // One whose list is a link.
    const QString linked = folder.path() + u'/' + programName + u'3';
    QDir().mkpath(linked);
    QFile::link(foreign.at("reports.json"), linked + QStringLiteral("/reports.json"));
    putFile(linked + QStringLiteral("/1"), "text");
    Desk desk;
    desk.answer = MessageAnswer::No;
    {
        Recovery recovery(folder.path());
        const std::vector<KeptReport> left = recovery.leftReports();
        ASSERT_EQ(left.size(), 2U);
        EXPECT_EQ(kareport::reopenReport(left[0]), nullptr) << "its text is a link to a file of another user";
        EXPECT_NE(kareport::reopenReport(left[1]), nullptr);
        EXPECT_EQ(recovery.unreadableFolders(), QStringList{linked});
        foreign.expectWhole("read");
        recovery.keep();
        recovery.discardLeft();
    }
    foreign.expectWhole("thrown away");
    EXPECT_EQ(contentOf(folder.path() + QStringLiteral("/photos/2024/1")), "mine");
    EXPECT_EQ(QDir(folder.path() + QStringLiteral("/photos")).entryList(QDir::AllEntries | QDir::NoDotAndDotDot),
              QStringList({QStringLiteral("1"), QStringLiteral("2024")}))
        << "not even a lock was put into it";
    EXPECT_FALSE(QFile::exists(crashed)) << "the program's own folder has gone";
    EXPECT_EQ(contentOf(linked + QStringLiteral("/1")), "text");
}

TEST(Recovery, OnlyWhatAProgramWroteIsRemoved)
{
    struct Row
    {
        QString folder;
        const char *file;
        bool stays;
        const char *reason;
    };
    const Row rows[] = {
        {programName + u'4', "1", false, "a text of the list"},
        {programName + u'4', "7", false, "a text whose list was not written any more: its name says whose it is"},
        {programName + u'4', "1.aB3dEf", false, "what was being written when the program was killed"},
        {programName + u'4', "reports.json.aB3dEf", false, "the list, likewise"},
        {programName + u'4', "letter", true, "no name of ours"},
        {programName + u'4', "1.rep", true, "no name of ours"},
        {programName + u'4', "-1", true, "no name of ours"},
        {programName + u'4', "album/1", true, "a folder in the folder"},
        {QStringLiteral("1 copy"), "1", false, "a folder that was renamed has a list"},
        {QStringLiteral("1 copy"), "7", true, "there, what the list does not name may be anybody's"},
    };
    for (const Row &row : rows) {
        const CrashFolder folder;
        const QString crashed = folder.path() + u'/' + row.folder;
        QDir().mkpath(crashed + QStringLiteral("/album"));
        QDir().rmdir(crashed + (QByteArray(row.file).startsWith("album") ? QString() : QStringLiteral("/album")));
        putFile(crashed + QStringLiteral("/reports.json"), R"([{"title": "T", "text": "1"}])");
        const QString file = crashed + u'/' + QLatin1String(row.file);
        putFile(file, "content");
        Desk desk;
        {
            Recovery recovery(folder.path());
            ASSERT_EQ(recovery.leftReports().size(), 1U) << row.reason;
            recovery.discardLeft();
        }
        EXPECT_EQ(QFile::exists(file), row.stays) << row.file << ": " << row.reason;
        EXPECT_EQ(QFile::exists(crashed), row.stays) << row.file << ": " << row.reason;
        EXPECT_FALSE(QFile::exists(crashed + QStringLiteral("/reports.json"))) << row.file << ": " << row.reason;
    }
}

TEST(Recovery, AFolderWhoseListCannotBeReadIsKeptAndSaid)
{
    struct Row
    {
        const char *list; ///< null for none
        const char *text; ///< null for none
        bool isSaid;
        const char *reason;
    };
    for (const Row &row : {Row{"", "text", true, "an empty list"}, Row{"[{", "text", true, "a list that was cut off"},
                           Row{"{}", "text", true, "no list"}, Row{nullptr, "text", true, "the list has gone"},
                           Row{nullptr, nullptr, false, "the program ended before it had anything to keep"},
                           Row{"[]", nullptr, false, "nothing was open"}})
    {
        const CrashFolder folder;
        const QString crashed = folder.path() + u'/' + programName + u'5';
        QDir().mkpath(crashed);
        if (row.list != nullptr) {
            putFile(crashed + QStringLiteral("/reports.json"), row.list);
        }
        if (row.text != nullptr) {
            putFile(crashed + QStringLiteral("/1"), row.text);
        }
        {
            Desk desk;
            Recovery recovery(folder.path());
            EXPECT_EQ(recovery.unreadableFolders(), row.isSaid ? QStringList{crashed} : QStringList()) << row.reason;
            EXPECT_TRUE(recovery.leftReports().empty()) << row.reason;
            recovery.discardLeft();
        }
        EXPECT_EQ(QFile::exists(crashed), row.isSaid) << row.reason;
        EXPECT_EQ(QFile::exists(crashed + QStringLiteral("/1")), row.isSaid) << row.reason;
    }
}

TEST(Recovery, ALinkInItsOwnFolderIsReplacedAndNotWrittenThrough)
{
    const CrashFolder folder;
    const ForeignFiles foreign;
    Desk desk;
    desk.answer = MessageAnswer::No;
    auto recovery = std::make_unique<Recovery>(folder.path());
    const QString own = folder.path() + u'/' + folder.programs().value(0);
    QFile::link(foreign.at("1"), own + QStringLiteral("/1"));
    QFile::link(foreign.at("reports.json"), own + QStringLiteral("/reports.json"));
    makeReport(QStringLiteral("R"), QStringLiteral("secret"));
    EXPECT_TRUE(recovery->keep());
    EXPECT_EQ(contentOf(own + QStringLiteral("/1")), "secret");
    foreign.expectWhole("written");
    // The folder is exchanged for a link while the program runs.
    QDir().rename(own, own + u'x');
    QFile::link(foreign.path(), own);
    Desk::reports().front()->WriteLine(QStringLiteral("more"), 0, 1, 0);
    EXPECT_FALSE(recovery->keep());
    recovery.reset();
    QFile::remove(own);
    foreign.expectWhole("ended");
}

TEST(Recovery, ATextThatCouldNotBeOpenedAgainStaysOnTheDisk)
{
    struct Row
    {
        const char *list;
        bool isLost;
        bool isKept;
        const char *reason;
    };
    for (const Row &row :
         {Row{R"([{"title": "T", "text": "1"}])", false, false, "it is open again"},
          Row{R"([{"title": "T", "text": "1"}])", true, true, "it is nowhere else"},
          Row{R"([{"title": "T", "text": "2"}])", true, false, "there is no such text, and nothing to keep"},
          Row{R"([{"title": "T", "path": "/no/such/file"}])", true, false, "it had no text of its own"}})
    {
        const CrashFolder folder;
        const QString program = folder.path() + u'/' + programName + u'8';
        QDir().mkpath(program);
        putFile(program + QStringLiteral("/reports.json"), row.list);
        putFile(program + QStringLiteral("/1"), "text");
        {
            Recovery recovery(folder.path());
            ASSERT_EQ(recovery.leftReports().size(), 1U) << row.reason;
            recovery.discardLeft(row.isLost ? recovery.leftReports() : std::vector<KeptReport>());
        }
        EXPECT_EQ(QFile::exists(program + QStringLiteral("/1")), row.isKept) << row.reason;
        EXPECT_EQ(Recovery(folder.path()).leftReports().size(), row.isKept ? 1U : 0U) << row.reason;
    }
}

} // namespace
