#include "ReportSubject.h"

#include "Recovery.h"
#include "SavedReports.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

namespace
{

using kareport::KeptReport;
using kareport::Recovery;

constexpr qsizetype longText = qsizetype(4) << 20;
constexpr std::size_t ofThatSize = std::size_t(2) << 20;
constexpr std::size_t ofAPiece = std::size_t(128) << 10; // of a text that is written piece by piece

void put(const QString &path, const QByteArray &content)
{
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
    ASSERT_EQ(file.write(content), content.size());
}

QByteArray content(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

TEST(RecoveryAllocations, AReportIsOpenedAgainWholeOrNotAtAll)
{
    const Surroundings around;
    const QTemporaryDir folder;
    const KeptReport kept = {QStringLiteral("R"), QString(), folder.filePath(QStringLiteral("1"))};
    put(kept.textFile, QByteArray(longText, 'x'));
    const auto &documents = around.application.reportTemplate()->GetDocuments();
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        const std::size_t before = documents.size();
        UReportDoc *report = nullptr;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number, ofThatSize);
            EXPECT_NO_THROW(report = kareport::reopenReport(kept)) << number;
            hasFailed = failing.hasFailed();
        }
        EXPECT_EQ(documents.size(), before + (report != nullptr ? 1 : 0)) << number << ": an empty report is not left";
        if (report != nullptr) {
            EXPECT_EQ(report->GetTextLength(), longText) << number;
            report->OnCloseDocument();
        }
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GE(allocations, 1) << "the text of the report";
}

TEST(RecoveryAllocations, WithoutMemoryTheTextThatWasKeptBeforeStays)
{
    const Surroundings around;
    const QTemporaryDir folder;
    Recovery recovery(folder.path());
    UReportDoc *report = CreateReport(QStringLiteral("R"), true, false, nullptr, 0, nullptr);
    report->SetData(QString(longText, u'x'));
    report->SetModifiedFlag(true);
    ASSERT_TRUE(recovery.keep());
    const QString program = QDir(folder.path()).entryList(QDir::Dirs | QDir::NoDotAndDotDot).value(0);
    const QString file = folder.path() + u'/' + program + QStringLiteral("/1");
    QByteArray before = content(file);
    ASSERT_EQ(before.size(), longText);
    const qint64 allocations = failingEachAllocation([&](qint64 number) {
        EXPECT_TRUE(report->ReplaceText(0, 1, number % 2 == 0 ? u"x" : u"y"));
        bool isKept = true;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number, ofAPiece);
            EXPECT_NO_THROW(isKept = recovery.keep()) << number;
            hasFailed = failing.hasFailed();
        }
        if (!isKept) {
            EXPECT_TRUE(content(file) == before) << number << ": half a text is not written";
            EXPECT_TRUE(recovery.keep()) << number << ": the next turn tries again";
        }
        before = content(file);
        EXPECT_TRUE(before == report->CopyText().toUtf8()) << number;
        return hasFailed && !testing::Test::HasFailure();
    });
    EXPECT_GE(allocations, 2) << "a copy of a piece, and its bytes";
    report->OnCloseDocument();
}

TEST(RecoveryAllocations, AFileThatIsLoadedAgainWithoutMemoryIsNotTakenForLoaded)
{
    const Surroundings around;
    put(around.loadPath, "\xEF\xBB\xBF"
                         "old\r\r\n");
    UReportDoc *report = kareport::openSavedReport(around.loadPath);
    ASSERT_NE(report, nullptr);
    put(around.loadPath, "\xEF\xBB\xBF" + QByteArray(longText, 'x') + "\r\r\n");
    EXPECT_GE(failingEachAllocation([&](qint64 number) {
                  bool isLoaded = false;
                  bool hasFailed = false;
                  report->SetData(QStringLiteral("old"));
                  {
                      const FailingAllocation failing(number, ofThatSize);
                      EXPECT_NO_THROW(isLoaded = kareport::reloadSavedReport(*report)) << number;
                      hasFailed = failing.hasFailed();
                  }
                  EXPECT_EQ(isLoaded, report->GetTextLength() == longText + 2) << number;
                  return hasFailed && !testing::Test::HasFailure();
              }),
              1);
    report->OnCloseDocument();
}

} // namespace
