#include "FrameFixture.h"
#include "ReportFixture.h"

#include "SaveDialog.h"

#include <QCoreApplication>
#include <QCursor>
#include <QDir>
#include <QFileInfo>
#include <QGuiApplication>
#include <QTemporaryDir>
#include <QTranslator>

#include <gtest/gtest.h>

#include <optional>
#include <vector>

namespace
{

const QString folderEntry = QStringLiteral("LastOpenDirectoryReport");
const QString reportsFirst =
    QStringLiteral("Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|All Files (*.*)|*.*||");
const QString richTextFirst =
    QStringLiteral("RTF Files (*.rtf)|*.rtf|Report Files (*.rep)|*.rep|PDF (*.pdf)|*.pdf|All Files (*.*)|*.*||");

bool isWaiting()
{
    return QGuiApplication::overrideCursor() != nullptr && QGuiApplication::overrideCursor()->shape() == Qt::WaitCursor;
}

/// A save dialog that answers at once.
class AnsweredDialog
{
public:
    explicit AnsweredDialog(std::optional<QString> answer)
    {
        kareport::setSaveDialog([this, answer](const kareport::SaveRequest &request) {
            requests.push_back(request);
            wasWaiting = isWaiting();
            return answer;
        });
    }
    ~AnsweredDialog() { kareport::setSaveDialog({}); }
    AnsweredDialog(const AnsweredDialog &) = delete;
    AnsweredDialog &operator=(const AnsweredDialog &) = delete;

    std::vector<kareport::SaveRequest> requests;
    bool wasWaiting = false;
};

/// A report that only notes what it is to save.
class WatchedReport : public UReportDoc
{
public:
    bool OnSaveDocument(const QString &path) override
    {
        saved.append(path);
        wasWaiting = isWaiting();
        return succeeds;
    }

    QStringList saved;
    bool succeeds = true;
    bool wasWaiting = false;
};

TEST(UReportDocSaveDialog, AsksWhenThereIsNoNameOrTheNameIsToBecomeItsOwn)
{
    struct Row
    {
        QString path;
        bool replace;
        bool asks;
        const char *reason;
    };
    const Row rows[] = {
        {QString(), false, true, "no name"},
        {QString(), true, true, "no name"},
        {QStringLiteral("/jobs/a.rep"), true, true, "another name is wanted, whatever it is now"},
        {QStringLiteral("/jobs/a.rep"), false, false, "its own name again, or a copy"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const AnsweredDialog dialog(QStringLiteral("/jobs/chosen.rep"));
        WatchedReport report;
        EXPECT_TRUE(report.DoSave(row.path, row.replace)) << row.reason;
        EXPECT_EQ(dialog.requests.size(), row.asks ? 1U : 0U) << row.reason;
        EXPECT_EQ(report.saved, QStringList{row.asks ? QStringLiteral("/jobs/chosen.rep") : row.path}) << row.reason;
        EXPECT_EQ(report.GetPathName(), row.replace ? QStringLiteral("/jobs/chosen.rep") : QString()) << row.reason;
    }
}

TEST(UReportDocSaveDialog, OffersReportFilesFirst)
{
    const FixedSurroundings surroundings;
    const AnsweredDialog dialog(std::nullopt);
    WatchedReport report;
    report.SetReportFileName(QStringLiteral("Survey"));
    report.DoSave(QStringLiteral("/jobs/a.pdf"), true);
    ASSERT_EQ(dialog.requests.size(), 1U);
    const kareport::SaveRequest &request = dialog.requests.front();
    EXPECT_EQ(request.filter, reportsFirst);
    EXPECT_EQ(request.defaultExtension, QStringLiteral("rep"));
    EXPECT_EQ(request.fileName, QString()) << "no name is proposed";
    EXPECT_EQ(request.flags, 0x0806U) << "no box for read-only, ask before overwriting, folders that exist";
    EXPECT_EQ(request.initialFolder, QString()) << "none has been used yet";
}

TEST(UReportDocSaveDialog, OffersRichTextFirstAfterAFileOfThatName)
{
    struct Row
    {
        QString name;
        bool exists;
        QString filter;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("a.rtf"), true, richTextFirst, "rich text by its name"},
        {QStringLiteral("a.RTF"), true, richTextFirst, "in any case"},
        {QStringLiteral("a.rtf.rep"), true, richTextFirst, "anywhere in the name"},
        {QStringLiteral("a.rtf"), false, richTextFirst, "also when it could not be opened"},
        {QStringLiteral("a.rep"), true, reportsFirst, "a report file"},
        {QStringLiteral("artf"), true, reportsFirst, "without the point"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const AnsweredDialog dialog(std::nullopt);
        const QTemporaryDir folder;
        const QString path = folder.filePath(row.name);
        if (row.exists) {
            putFile(path, "text\n");
        }
        UReportDoc report;
        EXPECT_EQ(report.OnOpenDocument(path), row.exists) << row.reason;
        report.DoSave(QString(), false);
        EXPECT_EQ(dialog.requests.back().filter, row.filter) << row.reason;

        UReportDoc cleared;
        cleared.OnOpenDocument(path);
        cleared.Clear();
        cleared.DoSave(QString(), false);
        EXPECT_EQ(dialog.requests.back().filter, reportsFirst)
            << row.reason << ": an emptied report comes from no file";

        UReportDoc reopened;
        reopened.OnOpenDocument(path);
        reopened.OnOpenDocument(folder.filePath(QStringLiteral("other.rep")));
        reopened.DoSave(QString(), false);
        EXPECT_EQ(dialog.requests.back().filter, reportsFirst) << row.reason << ": the file asked for last counts";
    }
}

/// Knows the file kinds in another language.
class Translator : public QTranslator
{
public:
    Translator() { QCoreApplication::installTranslator(this); }
    ~Translator() override { QCoreApplication::removeTranslator(this); }

    bool isEmpty() const override { return false; }
    QString translate(const char * /*context*/, const char *text, const char * /*note*/, int /*number*/) const override
    {
        const QString kinds = QString::fromUtf8(text);
        return kinds.startsWith(QStringLiteral("Report Files")) ? QStringLiteral("Berichte|*.rep|") : QString();
    }
};

TEST(UReportDocSaveDialog, TheKindsAreTranslated)
{
    const FixedSurroundings surroundings;
    const Translator translator;
    const AnsweredDialog dialog(std::nullopt);
    UReportDoc report;
    report.DoSave(QString(), false);
    EXPECT_EQ(dialog.requests.back().filter, QStringLiteral("Berichte|*.rep|All Files (*.*)|*.*||"));
}

TEST(UReportDocSaveDialog, ANameThatBeginsWithTheExtensionIsNotRichText)
{
    const FixedSurroundings surroundings;
    const AnsweredDialog dialog(std::nullopt);
    UReportDoc report;
    report.OnOpenDocument(QStringLiteral(".rtf"));
    report.DoSave(QString(), false);
    EXPECT_EQ(dialog.requests.back().filter, reportsFirst);
}

TEST(UReportDocSaveDialog, BeginsInTheFolderUsedLast)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString inner = folder.filePath(QStringLiteral("inner"));
    ASSERT_TRUE(QDir().mkdir(inner));
    const AnsweredDialog dialog(inner + QStringLiteral("/a.rep"));
    WatchedReport report;
    WriteProfileString(QString(), folderEntry, folder.path());
    report.DoSave(QString(), false);
    EXPECT_EQ(dialog.requests.back().initialFolder, folder.path());
    EXPECT_EQ(GetProfileString(QString(), folderEntry), inner) << "the folder of the answer is kept";
    report.DoSave(QString(), false);
    EXPECT_EQ(dialog.requests.back().initialFolder, inner);
    ASSERT_TRUE(QDir().rmdir(inner));
    report.DoSave(QString(), false);
    EXPECT_EQ(dialog.requests.back().initialFolder, QString()) << "a folder that is gone";
}

TEST(UReportDocSaveDialog, TheFolderIsKeptThoughTheSaveFails)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString taken = folder.filePath(QStringLiteral("a.rep"));
    ASSERT_TRUE(QDir().mkdir(taken)); // a folder has the name
    const AnsweredDialog dialog(taken);
    WriteProfileString(QString(), folderEntry, QStringLiteral("/jobs"));
    UReportDoc report;
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    EXPECT_FALSE(report.DoSave(QString(), true));
    EXPECT_EQ(GetProfileString(QString(), folderEntry), folder.path()) << "it is where the user looked";
}

TEST(UReportDocSaveDialog, CancellingChangesNothing)
{
    const FixedSurroundings surroundings;
    const UApplication application;
    const AnsweredDialog dialog(std::nullopt);
    WriteProfileString(QString(), folderEntry, QStringLiteral("/jobs"));
    for (const bool replace : {false, true}) {
        WatchedReport report;
        report.SetPathName(QStringLiteral("/jobs/own.rep"), false);
        report.SetModifiedFlag(true);
        EXPECT_FALSE(report.DoSave(QString(), replace));
        EXPECT_EQ(report.saved, QStringList());
        EXPECT_TRUE(report.IsModified());
        EXPECT_EQ(report.GetPathName(), QStringLiteral("/jobs/own.rep"));
        EXPECT_EQ(GetProfileString(QString(), folderEntry), QStringLiteral("/jobs"));
        EXPECT_EQ(application.GetRecentFileList(), QStringList());
    }
}

TEST(UReportDocSaveDialog, WithoutADialogNothingIsSaved)
{
    const FixedSurroundings surroundings;
    WatchedReport report;
    EXPECT_FALSE(report.DoSave(QString(), false));
    EXPECT_EQ(report.saved, QStringList());
}

TEST(UReportDocSaveDialog, ANewNameBecomesItsOwnAndReportFilesAreRemembered)
{
    struct Row
    {
        QString name;
        bool isRecent;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("/jobs/a.rep"), true, "a report file"},
        {QStringLiteral("/jobs/a.txt"), true, "any other name"},
        {QStringLiteral("/jobs/a"), true, "no extension"},
        {QStringLiteral("/jobs/a.rtf"), false, "rich text would be opened as its source"},
        {QStringLiteral("/jobs/a.RTF"), false, "in any case"},
        {QStringLiteral("/jobs/a.pdf"), false, "a PDF cannot be opened again"},
        {QStringLiteral("/jobs/a.Pdf"), false, "in any case"},
        {QStringLiteral("/jobs/a.rtf.rtf"), true, "the first extension is not at the end: it is report text"},
        {QStringLiteral("/jobs/a.pdf.rep"), true, "report text"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const UApplication application;
        const AnsweredDialog dialog(row.name);
        WatchedReport report;
        report.SetModifiedFlag(true);
        EXPECT_TRUE(report.DoSave(QString(), true)) << row.reason;
        EXPECT_EQ(report.GetPathName(), row.name) << row.reason;
        EXPECT_EQ(application.GetRecentFileList(), row.isRecent ? QStringList{row.name} : QStringList()) << row.reason;
        EXPECT_FALSE(report.IsModified()) << row.reason;

        WatchedReport copied;
        copied.SetModifiedFlag(true);
        EXPECT_TRUE(copied.DoSave(row.name, false)) << row.reason;
        EXPECT_EQ(copied.saved, QStringList{row.name}) << row.reason;
        EXPECT_EQ(copied.GetPathName(), QString()) << row.reason << ": a copy";
        EXPECT_FALSE(copied.IsModified()) << row.reason << ": what there is has been saved";
    }
}

TEST(UReportDocSaveDialog, AFailedSaveKeepsNameAndModifiedFlag)
{
    const FixedSurroundings surroundings;
    const UApplication application;
    const QTemporaryDir folder;
    for (const QString &name : {QStringLiteral("a.rep"), QStringLiteral("a.rtf"), QStringLiteral("a.pdf")}) {
        const AnsweredDialog dialog(folder.filePath(QStringLiteral("missing/") + name));
        UReportDoc report;
        report.SetPageSize();
        report.WriteLine(QStringLiteral("x"), 0, 1, 0);
        report.SetPathName(QStringLiteral("/jobs/own.rep"), false);
        EXPECT_FALSE(report.DoSave(QString(), true)) << name.toStdString();
        EXPECT_TRUE(report.IsModified()) << name.toStdString();
        EXPECT_EQ(report.GetPathName(), QStringLiteral("/jobs/own.rep")) << name.toStdString();
        EXPECT_EQ(application.GetRecentFileList(), QStringList()) << name.toStdString();
    }
}

TEST(UReportDocSaveDialog, AFailedSaveIsSaidOnlyWhereTheHostHasInstalledIt)
{
    const FixedSurroundings surroundings;
    const UApplication application;
    const QTemporaryDir folder;
    const AnsweredMessages messages(MessageAnswer::Yes);
    for (const bool isInstalled : {false, true}) {
        QStringList said;
        if (isInstalled) {
            kareport::setSaveFailure([&said](const QString &path, const QString &reason) {
                said.append(QFileInfo(path).fileName() +
                            (reason.isEmpty() ? QStringLiteral(" unknown") : QStringLiteral(" known")));
            });
        }
        UReportDoc report;
        report.SetAutoDelete(false);
        ASSERT_TRUE(report.Write(QStringLiteral("text\n"), 0));
        EXPECT_FALSE(report.DoSave(folder.filePath(QStringLiteral("none/a.rep")), false));
        WatchedReport watched;
        watched.succeeds = false;
        EXPECT_FALSE(watched.DoSave(QStringLiteral("b.rep"), false));
        kareport::setSaveFailure({});
        EXPECT_EQ(said, isInstalled ? QStringList({QStringLiteral("a.rep known"), QStringLiteral("b.rep unknown")})
                                    : QStringList());
    }
    EXPECT_TRUE(messages.texts.isEmpty()) << "the module shows none itself";
}

/// Saves as its base does until the host takes it over.
class TakenOverReport : public UReportDoc
{
public:
    bool OnSaveDocument(const QString &path) override { return !isTakenOver && UReportDoc::OnSaveDocument(path); }

    bool isTakenOver = false;
};

TEST(UReportDocSaveDialog, AHostsOwnSaveHasNotTheReasonOfAnEarlierOne)
{
    const FixedSurroundings surroundings;
    const UApplication application;
    const QTemporaryDir folder;
    QStringList reasons;
    kareport::setSaveFailure([&reasons](const QString &, const QString &reason) { reasons.append(reason); });
    TakenOverReport report;
    report.SetAutoDelete(false);
    ASSERT_TRUE(report.Write(QStringLiteral("text\n"), 0));
    EXPECT_FALSE(report.DoSave(folder.filePath(QStringLiteral("none/a.rep")), false));
    report.isTakenOver = true;
    EXPECT_FALSE(report.DoSave(folder.filePath(QStringLiteral("a.rep")), false));
    kareport::setSaveFailure({});
    ASSERT_EQ(reasons.size(), 2);
    EXPECT_FALSE(reasons[0].isEmpty());
    EXPECT_TRUE(reasons[1].isEmpty()) << reasons[1].toStdString();
}

TEST(UReportDocSaveDialog, TheWaitCursorIsShownWhileTheFileIsWritten)
{
    const FixedSurroundings surroundings;
    const AnsweredDialog dialog(QStringLiteral("/jobs/a.rep"));
    for (const bool succeeds : {true, false}) {
        WatchedReport report;
        report.succeeds = succeeds;
        EXPECT_EQ(report.DoSave(QString(), false), succeeds);
        EXPECT_FALSE(dialog.wasWaiting) << "not while the user chooses";
        EXPECT_TRUE(report.wasWaiting);
        EXPECT_EQ(QGuiApplication::overrideCursor(), nullptr) << "and gone afterwards";
    }
}

TEST(UReportDocSaveDialog, SavingAModifiedReportBeforeItClosesAsksForItsName)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    const AnsweredMessages messages(MessageAnswer::Yes);
    UReportDoc report;
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    {
        const AnsweredDialog cancelled(std::nullopt);
        EXPECT_FALSE(report.SaveModified()) << "the name was not given: it must not close";
        EXPECT_TRUE(report.IsModified());
    }
    {
        const AnsweredDialog dialog(path);
        EXPECT_TRUE(report.SaveModified());
        EXPECT_EQ(contentOf(path), "\xEF\xBB\xBFx\r\r\n");
        EXPECT_EQ(report.GetPathName(), path);
    }
    report.WriteLine(QStringLiteral("y"), 0, 1, 0);
    const AnsweredDialog notAsked(std::nullopt);
    EXPECT_TRUE(report.SaveModified());
    EXPECT_TRUE(notAsked.requests.empty()) << "from now on it has one";
    EXPECT_EQ(contentOf(path), "\xEF\xBB\xBFx\r\r\ny\r\r\n");
}

} // namespace
