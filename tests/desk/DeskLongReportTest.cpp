#include "ActivePaneFixture.h"
#include "DeskFixture.h"
#include "FrameFixture.h"
#include "Recovery.h"
#include "ReportCommandIds.h"
#include "ReportEdit.h"
#include "ReportWindowEntry.h"
#include "SaveAs.h"
#include "SaveDialog.h"
#include "SavedReports.h"
#include "TestSize.h"
#include "TextFile.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "WorkAside.h"

#include <QTemporaryDir>
#include <QTextDocument>
#include <QTimer>

#include <gtest/gtest.h>

#include <filesystem>

namespace
{

constexpr int lineCount = 200'000; // more than are read in a moment

QByteArray longFile(int lines = lineCount, const char *first = "TALVEN first line")
{
    QByteArray content = "\xEF\xBB\xBF" + QByteArray(first) + "\r\r\n";
    for (int line = 1; line < lines; ++line) {
        content += "line " + QByteArray::number(line) + " of a report that takes a moment to be read\r\r\n";
    }
    return content;
}

/// Its text as a report has it.
QString textOfFile(const QByteArray &content)
{
    return QString::fromUtf8(content.sliced(3)).replace(QStringLiteral("\r\r\n"), QStringLiteral("\n"));
}

/// Does something while the file that is opened next is read: as soon as the event loop runs.
template <typename Act>
void meanwhile(Act act)
{
    QTimer::singleShot(0, act);
}

bool isShownWhole(const UReportDoc &report)
{
    return QTest::qWaitFor([&report] { return !editOf(report).isLoading(); }, 60'000);
}

TEST(DeskLongReport, IsReadWhileTheWindowsAnswer)
{
    const JobFolder folder;
    const QByteArray content = longFile();
    folder.put("a.rep", content);
    Desk desk;
    bool hasAnswered = false;
    meanwhile([&] { hasAnswered = Desk::reports().empty(); });
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    EXPECT_TRUE(hasAnswered) << "before the report was there";
    ASSERT_EQ(Desk::reports().size(), 1U);
    const UReportDoc &report = *Desk::reports().front();
    EXPECT_TRUE(Desk::textOf(report) == textOfFile(content));
    EXPECT_FALSE(report.IsModified());
    EXPECT_EQ(report.GetPathName(), folder.path("a.rep"));
    EXPECT_EQ(report.GetLineCount(), lineCount);
    EXPECT_TRUE(editOf(report).isLoading()) << "the window shows its beginning";
    EXPECT_TRUE(editOf(report).isReadOnly());
    ASSERT_TRUE(isShownWhole(report));
    EXPECT_TRUE(editOf(report).windowText() == report.CopyText());
    EXPECT_EQ(UApplication::Get()->GetRecentFileList(), QStringList(folder.path("a.rep")));
    EXPECT_TRUE(desk.messages.isEmpty());
}

TEST(DeskLongReport, IsWholeForWhateverNeedsItWhileItIsShownInPieces)
{
    const JobFolder folder;
    const QByteArray content = longFile(testSize(60'000, lineCount));
    folder.put("a.rep", content);
    Desk desk;
    for (const char *name : {"b.rep", "b.rtf", "b.pdf"}) {
        ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
        UReportDoc &report = *Desk::reports().front();
        ASSERT_TRUE(editOf(report).isLoading());
        QTest::keyClicks(&editOf(report), QStringLiteral("x"));
        EXPECT_FALSE(report.IsModified()) << "nothing can be typed yet";
        EXPECT_TRUE(report.OnSaveDocument(folder.path(name)));
        EXPECT_FALSE(editOf(report).isLoading()) << name << ": who saves a report sees what is saved";
        EXPECT_TRUE(editOf(report).windowText() == report.CopyText()) << name;
        report.OnCloseDocument();
    }
    EXPECT_TRUE(folder.bytesOf("b.rep") == content);
    EXPECT_GT(folder.bytesOf("b.rtf").size(), content.size());
    EXPECT_TRUE(folder.bytesOf("b.pdf").startsWith("%PDF-"));
}

TEST(DeskLongReport, IsWholeWhenItIsExported)
{
    const JobFolder folder;
    folder.put("a.rep", longFile(60'000));
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    UReportDoc &report = *Desk::reports().front();
    ASSERT_TRUE(editOf(report).isLoading());
    kareport::setSaveDialog([&folder](const kareport::SaveRequest &request) {
        return kareport::askOwnName(request, [&](const kareport::SaveRequest &) { return folder.path("b.pdf"); });
    });
    report.DoSave(QString(), true);
    kareport::setSaveDialog({});
    EXPECT_TRUE(folder.bytesOf("b.pdf").startsWith("%PDF-"));
    EXPECT_FALSE(editOf(report).isLoading());
    EXPECT_TRUE(editOf(report).windowText() == report.CopyText());
}

/// Ticks from the event loop as often as it can.
class Ticks
{
public:
    explicit Ticks(const UReportDoc &report)
    {
        QObject::connect(&timer_, &QTimer::timeout, &timer_,
                         [this, &report] { whileLoading += editOf(report).isLoading() ? 1 : 0; });
        timer_.start(0);
    }

    int whileLoading = 0; ///< of them while the report's view was not whole

private:
    QTimer timer_;
};

TEST(DeskLongReport, ThatWasMadeOpensInItsViewWhileTheWindowsAnswer)
{
    const int lines = testSize(40'000, 100'000);
    Desk desk;
    desk.answer = MessageAnswer::No;
    UReportDoc *report = CreateReportWindow(QStringLiteral("R"), false, false);
    ASSERT_NE(report, nullptr);
    for (int line = 0; line < lines; ++line) {
        report->WriteLine(QStringLiteral("line %1 of a report that was just made").arg(line), 0, 1, 0);
    }
    report->SetReportWindowActive();
    auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    ASSERT_NE(window, nullptr);
    window->OnShowReport();
    ASSERT_EQ(report->GetViews().size(), 1U);
    EXPECT_TRUE(editOf(*report).isLoading()) << "the window shows its beginning";
    EXPECT_TRUE(editOf(*report).isReadOnly());
    EXPECT_LT(editOf(*report).document()->blockCount(), lines / 2);
    const Ticks ticks(*report);
    ASSERT_TRUE(isShownWhole(*report));
    EXPECT_GE(ticks.whileLoading, 3) << "what else waits for the event loop has its turn between the pieces";
    EXPECT_TRUE(editOf(*report).windowText() == report->CopyText());
}

TEST(DeskLongReport, ThatIsBeingReadIsNotOpenedTwice)
{
    const JobFolder folder;
    folder.put("a.rep", longFile());
    Desk desk;
    bool isTaken = false;
    meanwhile([&] { isTaken = desk.frame->OpenFile(folder.path("./a.rep")); });
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    EXPECT_TRUE(isTaken);
    EXPECT_EQ(Desk::reports().size(), 1U);
    EXPECT_TRUE(desk.messages.isEmpty());
}

TEST(DeskLongReport, WhoseFileAnotherReportIsSavedIntoMeanwhileIsThatReport)
{
    const JobFolder folder;
    folder.put("a.rep", longFile());
    folder.put("b.rep", "\xEF\xBB\xBFTALVEN b\r\r\n");
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("b.rep")));
    UReportDoc *other = Desk::reports().front();
    meanwhile([&] {
        EXPECT_TRUE(other->OnSaveDocument(folder.path("a.rep")));
        other->SetPathName(folder.path("a.rep"), true);
    });
    EXPECT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    EXPECT_EQ(Desk::reports(), std::vector<UReportDoc *>{other}) << "two of them would overwrite each other";
    EXPECT_EQ(desk.frame->GetActiveView(), other->GetViews().front());
}

TEST(DeskLongReport, LeavesRoomForOthersMeanwhile)
{
    const JobFolder folder;
    const QByteArray content = longFile();
    folder.put("a.rep", content);
    folder.put("b.rep", "\xEF\xBB\xBFTALVEN b\r\r\n");
    folder.put("c.rep", longFile(lineCount, "TALVEN c"));
    Desk desk;
    meanwhile([&] {
        EXPECT_TRUE(desk.frame->OpenFile(folder.path("b.rep")));
        EXPECT_TRUE(desk.frame->OpenFile(folder.path("c.rep")));
        Desk::reports().front()->OnCloseDocument();
    });
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    ASSERT_EQ(Desk::reports().size(), 2U);
    EXPECT_TRUE(Desk::textOf(*Desk::reports()[0]).startsWith(QStringLiteral("TALVEN c")));
    EXPECT_TRUE(Desk::textOf(*Desk::reports()[1]) == textOfFile(content));
    EXPECT_EQ(desk.frame->GetActiveView(), Desk::reports()[1]->GetViews().front());
}

TEST(DeskLongReport, ThatIsStoppedIsNotThereAndNothingIsSaid)
{
    const JobFolder folder;
    folder.put("a.rep", longFile());
    Desk desk;
    meanwhile([] { EXPECT_TRUE(kareport::stopWorkAside(nullptr, {})); });
    EXPECT_FALSE(desk.frame->OpenFile(folder.path("a.rep")));
    EXPECT_TRUE(Desk::reports().empty());
    EXPECT_TRUE(desk.messages.isEmpty());
    EXPECT_TRUE(UApplication::Get()->GetRecentFileList().isEmpty());
    EXPECT_TRUE(desk.frame->OpenFile(folder.path("a.rep"))) << "it can be opened again";
    EXPECT_EQ(Desk::reports().size(), 1U);
}

TEST(DeskLongReport, IsGivenUpByAnExitWhichThenGoesOn)
{
    const JobFolder folder;
    folder.put("a.rep", longFile());
    Desk desk;
    ASSERT_TRUE(desk.frame->OnCommand(kareport::fileNewCommand));
    Desk::reports().front()->WriteLine(QStringLiteral("x"), 0, 1, 0);
    desk.answer = MessageAnswer::Cancel;
    meanwhile([&] {
        desk.frame->close();
        EXPECT_TRUE(desk.frame->isVisible()) << "not while it is read";
    });
    EXPECT_FALSE(desk.frame->OpenFile(folder.path("a.rep")));
    QCoreApplication::processEvents();
    EXPECT_EQ(desk.messages.size(), 1) << "the other report's changes";
    EXPECT_TRUE(desk.frame->isVisible()) << "the user wants to stay";
    EXPECT_EQ(Desk::reports().size(), 1U);

    desk.answer = MessageAnswer::No;
    meanwhile([&] { desk.frame->close(); });
    EXPECT_FALSE(desk.frame->OpenFile(folder.path("a.rep")));
    QCoreApplication::processEvents();
    EXPECT_FALSE(desk.frame->isVisible());
    EXPECT_TRUE(Desk::reports().empty());
}

TEST(DeskLongReport, WhoseFileIsReplacedMeanwhileIsOfferedAgain)
{
    const JobFolder folder;
    const QByteArray content = longFile();
    folder.put("a.rep", content);
    folder.put("new.rep", "\xEF\xBB\xBFTALVEN new\r\r\n");
    Desk desk;
    desk.answer = MessageAnswer::Yes;
    meanwhile(
        [&] { std::filesystem::rename(folder.path("new.rep").toStdString(), folder.path("a.rep").toStdString()); });
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    const UReportDoc &report = *Desk::reports().front();
    const QString text = Desk::textOf(report);
    EXPECT_TRUE(text == textOfFile(content) || text == QStringLiteral("TALVEN new\n")) << "one of them, whole";
    EXPECT_TRUE(QTest::qWaitFor([&desk] { return !desk.messages.isEmpty(); }));
    EXPECT_TRUE(desk.messages.value(0).contains(QStringLiteral("changed by another program")));
    EXPECT_EQ(Desk::textOf(report), QStringLiteral("TALVEN new\n"));
    EXPECT_FALSE(report.IsModified());
}

TEST(DeskLongReport, WhoseFileIsCutShortMeanwhileIsWholeOrNotThere)
{
    const JobFolder folder;
    const QByteArray content = longFile();
    const qsizetype half =
        content.indexOf('\n', content.size() / 2) + 1; // cut before it was opened, it is whole like that
    for (int turn = 0; turn < 4; ++turn) {
        folder.put("a.rep", content);
        Desk desk;
        meanwhile([&] {
            QTest::qSleep(turn * 3);
            QFile::resize(folder.path("a.rep"), half);
        });
        if (desk.frame->OpenFile(folder.path("a.rep"))) {
            const QString text = Desk::textOf(*Desk::reports().front());
            EXPECT_TRUE(text == textOfFile(content) || text == textOfFile(content.first(half))) << turn;
            continue;
        }
        EXPECT_EQ(desk.messages,
                  QStringList{QStringLiteral("\"%1\" could not be opened: the file was cut short while it was read")
                                  .arg(folder.path("a.rep"))});
        EXPECT_TRUE(Desk::reports().empty());
    }
}

TEST(DeskLongReport, IsLoadedAgainWhileTheWindowsAnswer)
{
    const JobFolder folder;
    folder.put("a.rep", "\xEF\xBB\xBFTALVEN short\r\r\n");
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    UReportDoc *report = Desk::reports().front();
    const QByteArray content = longFile();
    folder.put("a.rep", content);
    kareport::ReadNotes notes;
    meanwhile([] { kareport::stopWorkAside(nullptr, {}); });
    EXPECT_FALSE(kareport::reloadSavedReport(*report, &notes));
    EXPECT_TRUE(notes.isStopped);
    EXPECT_EQ(Desk::textOf(*report), QStringLiteral("TALVEN short\n")) << "it stays as it was";
    EXPECT_TRUE(kareport::reloadSavedReport(*report, &notes));
    EXPECT_FALSE(notes.isStopped);
    EXPECT_TRUE(Desk::textOf(*report) == textOfFile(content));
    ASSERT_TRUE(isShownWhole(*report));
    meanwhile([report] { report->OnCloseDocument(); });
    EXPECT_FALSE(kareport::reloadSavedReport(*report));
    EXPECT_TRUE(Desk::reports().empty());
}

TEST(DeskLongReport, ThatTheUserDoesNotWaitForAfterAChangeOnTheDiskCountsAsChanged)
{
    const JobFolder folder;
    folder.put("a.rep", "\xEF\xBB\xBFTALVEN short\r\r\n");
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    UReportDoc *report = Desk::reports().front();
    QTest::qWait(1); // the watch begins after the opening
    desk.answer = MessageAnswer::Yes;
    folder.put("a.rep", longFile());
    QTimer stopping;
    QObject::connect(&stopping, &QTimer::timeout, &stopping, [] { kareport::stopWorkAside(nullptr, {}); });
    stopping.start(0);
    EXPECT_TRUE(QTest::qWaitFor([report] { return report->IsModified(); })) << "what is shown is in no file any more";
    EXPECT_EQ(desk.messages.size(), 1) << "only the question";
    EXPECT_EQ(Desk::textOf(*report), QStringLiteral("TALVEN short\n"));
    desk.answer = MessageAnswer::No;
}

TEST(DeskLongReport, ComesBackAfterACrashWhileTheWindowsAnswer)
{
    const JobFolder folder;
    Desk desk;
    desk.answer = MessageAnswer::No;
    const QString text = textOfFile(longFile()).replace(u'\n', QStringLiteral("\r\n"));
    folder.put("1", text.toUtf8());
    const kareport::KeptReport kept = {QStringLiteral("R"), QString(), folder.path("1"), 0, {0, 7, 1000}};
    bool hasAnswered = false;
    meanwhile([&] { hasAnswered = Desk::reports().empty(); });
    const UReportDoc *report = kareport::reopenReport(kept);
    ASSERT_NE(report, nullptr);
    EXPECT_TRUE(hasAnswered);
    EXPECT_TRUE(report->CopyText() == text);
    EXPECT_TRUE(report->IsModified());
    EXPECT_EQ(report->GetPageStartLines(), (std::vector<qint64>{0, 7, 1000}));
    ASSERT_TRUE(isShownWhole(*report));
}

/// What a program left that crashed, until the end of the test.
class LeftReport
{
public:
    explicit LeftReport(const QByteArray &text)
    {
        QStandardPaths::setTestModeEnabled(true);
        path_ = kareport::Recovery::usualFolder() + QStringLiteral("/0a1b2c3d-0000-4000-8000-00000000000a");
        QDir().mkpath(path_);
        putFile(path_ + QStringLiteral("/reports.json"), R"([{"title": "Left", "path": "", "text": "1"}])");
        putFile(textFile(), text);
    }
    ~LeftReport() { QDir(path_).removeRecursively(); }
    LeftReport(const LeftReport &) = delete;
    LeftReport &operator=(const LeftReport &) = delete;

    QString textFile() const { return path_ + QStringLiteral("/1"); }

private:
    QString path_;
};

TEST(DeskLongReport, ThatTheUserDoesNotWaitForAfterACrashIsOfferedAgain)
{
    const QByteArray text = longFile().sliced(3);
    const LeftReport left(text);
    Desk desk;
    desk.answer = MessageAnswer::Yes;
    meanwhile([] { EXPECT_TRUE(kareport::stopWorkAside(nullptr, {})); });
    desk.frame->OfferLeftReports();
    EXPECT_TRUE(Desk::reports().empty());
    EXPECT_EQ(desk.messages.size(), 1) << "only the question";
    EXPECT_TRUE(contentOf(left.textFile()) == text.toStdString()) << "its text stays";
    desk.frame->OfferLeftReports();
    ASSERT_EQ(Desk::reports().size(), 1U);
    EXPECT_EQ(Desk::reports().front()->GetTextLength(), text.size());
    EXPECT_FALSE(QFile::exists(left.textFile()));
    desk.answer = MessageAnswer::No;
}

TEST(DeskLongReport, ThatCannotBeOpenedAgainAfterACrashIsSaidWithWhatBecomesOfItsText)
{
    struct Row
    {
        qint64 size;
        bool isKept;
        const char *reason;
    };
    constexpr Row rows[] = {
        {qint64(1) << 31, true, "longer than a report can be"},
        {-1, false, "there is no text any more"},
    };
    for (const Row &row : rows) {
        const LeftReport left("x");
        Desk desk;
        desk.answer = MessageAnswer::Yes;
        row.size < 0 ? QFile::remove(left.textFile()) : QFile::resize(left.textFile(), row.size);
        desk.frame->OfferLeftReports();
        ASSERT_EQ(desk.messages.size(), 2) << row.reason;
        EXPECT_TRUE(desk.messages[1].contains(QStringLiteral("Left"))) << row.reason;
        EXPECT_EQ(desk.messages[1].contains(QStringLiteral("offered again at the next start")), row.isKept)
            << row.reason;
        EXPECT_EQ(QFile::exists(left.textFile()), row.isKept) << row.reason;
    }
}

TEST(DeskLongReport, WithoutMemoryIsNotOpened)
{
    const JobFolder folder;
    folder.put("short", "x");
    folder.put("long", longFile());
    for (const char *name : {"short", "long"}) {
        const auto file = kareport::readTextFile(folder.path(name), kareport::UserInput::Taken,
                                                 [](QByteArrayView, kareport::LoadedText &,
                                                    const auto &) -> kareport::TextLoading { throw std::bad_alloc(); });
        EXPECT_EQ(file.state, kareport::TextFile::State::NotRead) << name;
        EXPECT_EQ(file.text, nullptr) << name;
    }
}

} // namespace
