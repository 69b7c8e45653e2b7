#include "FailEachCall.h"

#include "DeskFixture.h"
#include "Recovery.h"
#include "ReportSubject.h"
#include "ReportWindowFixture.h"
#include "SaveAs.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

using kareport::Recovery;

const QString plainText = reportLines(QStringLiteral("a line of a report\n").repeated(5000));

TEST(DeskSaves, AnExportIsWholeOrItIsSaidAndTheReportIsStillModified)
{
    const QTemporaryDir folder;
    Desk desk;
    UReportDoc *report = CreateReport(QStringLiteral("R"), false, false, nullptr, 0, nullptr);
    report->SetData(plainText);
    report->SetModifiedFlag(true);
    const QString path = folder.filePath(QStringLiteral("a.pdf"));
    kareport::SaveRequest request;
    request.document = report;
    failEachCall(
        path, [&] { desk.messages.clear(); },
        [&] {
            const auto own = kareport::askOwnName(request, [&path](const kareport::SaveRequest &) { return path; });
            EXPECT_FALSE(own) << "it never becomes the report's own file";
            return desk.messages.isEmpty();
        },
        [&] {
            ASSERT_EQ(desk.messages.size(), 1);
            EXPECT_TRUE(desk.messages.front().contains(path)) << desk.messages.front().toStdString();
        });
    EXPECT_TRUE(report->IsModified());
    EXPECT_EQ(report->CopyText(), plainText);
    report->SetModifiedFlag(false);
}

TEST(DeskSaves, TheReportWindowSavesWholeOrSaysWhy)
{
    const QTemporaryDir folder;
    WindowDesk desk;
    UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), false, false);
    ASSERT_NE(report, nullptr);
    report->SetData(plainText);
    report->SetPageSize();
    for (const char *name : {"a.rep", "a.rtf", "a.pdf"}) {
        SCOPED_TRACE(name);
        const QString path = folder.filePath(QString::fromUtf8(name));
        const AnsweredSaving saving(path);
        AnsweredBoxes boxes(MessageAnswer::Ok);
        failEachCall(
            path,
            [&] {
                report->SetModifiedFlag(true);
                boxes.boxes.clear();
            },
            [&] {
                WindowDesk::windowOf(report).OnSave();
                EXPECT_EQ(report->IsModified(), boxes.boxes.size() == 1) << boxes.boxes.size();
                return !report->IsModified();
            },
            [&] {
                ASSERT_EQ(boxes.boxes.size(), 1U);
                EXPECT_TRUE(boxes.boxes.front().text.contains(path));
            });
        EXPECT_EQ(report->CopyText(), plainText);
    }
    report->SetModifiedFlag(false);
}

/// The folder of the one program that keeps its reports in a folder.
QString programIn(const QString &folder)
{
    return folder + u'/' + QDir(folder).entryList(QDir::Dirs | QDir::NoDotAndDotDot).value(0);
}

TEST(DeskSaves, TheListOfWhatIsOpenIsWholeAndTriedAgain)
{
    const Surroundings around;
    const QTemporaryDir folder;
    Recovery recovery(folder.path());
    UReportDoc *report = CreateReport(QStringLiteral("R"), true, false, nullptr, 0, nullptr);
    report->SetPathName(folder.filePath(QStringLiteral("own.rep")), false);
    report->SetModifiedFlag(false);
    ASSERT_TRUE(recovery.keep());
    int number = 0;
    failEachCall(
        programIn(folder.path()) + QStringLiteral("/reports.json"),
        [&] { report->SetTitle(QString::number(++number)); }, [&] { return recovery.keep(); },
        [&] { EXPECT_TRUE(recovery.keep()) << "the next turn tries again"; });
    report->OnCloseDocument();
}

TEST(DeskSaves, ATextThatIsKeptIsWholeAndTriedAgain)
{
    const Surroundings around;
    const QTemporaryDir folder;
    Recovery recovery(folder.path());
    UReportDoc *report = CreateReport(QStringLiteral("R"), true, false, nullptr, 0, nullptr);
    report->SetData(plainText);
    report->SetModifiedFlag(true);
    ASSERT_TRUE(recovery.keep());
    bool isOdd = false;
    failEachCall(
        programIn(folder.path()) + QStringLiteral("/1"),
        [&] {
            isOdd = !isOdd;
            EXPECT_TRUE(report->ReplaceText(0, 1, isOdd ? u"x" : u"y"));
        },
        [&] { return recovery.keep(); },
        [&] {
            EXPECT_TRUE(recovery.keep()) << "the next turn tries again";
            EXPECT_TRUE(contentOf(programIn(folder.path()) + QStringLiteral("/1")) ==
                        report->CopyText().toUtf8().toStdString());
        });
    report->OnCloseDocument();
}

} // namespace
