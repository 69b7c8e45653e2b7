#include "ReportFixture.h"
#include "TemporaryFolder.h"

#include <QDir>
#include <QFile>
#include <QSet>

#include <gtest/gtest.h>

namespace
{

QString nameFor(const QString &reportFileName)
{
    UReportDoc report;
    report.SetReportFileName(reportFileName);
    return report.GetCurrentReportFileName();
}

TEST(UReportDocTemporaryName, NamesWithoutAnOwnStemAreNumberedTogether)
{
    const FixedSurroundings surroundings;
    const TemporaryFolder folder;
    const UReportDoc report;
    EXPECT_EQ(report.GetReportFileName(), QString());
    EXPECT_EQ(report.GetCurrentReportFileName(), folder.at(QStringLiteral("Report$$$.rep")));
    EXPECT_EQ(report.GetCurrentReportFileName(), folder.at(QStringLiteral("Report$$$ 2.rep")));
    EXPECT_EQ(report.GetCurrentReportFileName(), folder.at(QStringLiteral("Report$$$ 3.rep")));
    const UReportDoc other;
    EXPECT_EQ(other.GetCurrentReportFileName(), folder.at(QStringLiteral("Report$$$ 4.rep"))) << "another report";
    EXPECT_EQ(nameFor(QStringLiteral("C:\\x\\Survey.rep")), folder.at(QStringLiteral("Report$$$ 5.rep")))
        << "a name of three letters after its point leaves nothing of itself";
}

TEST(UReportDocTemporaryName, AReportsNameGivesTheStem)
{
    struct Row
    {
        QString name;
        QString stem;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("C:\\x\\Survey"), QStringLiteral("Survey"), "no extension"},
        {QStringLiteral("/x/y/Survey"), QStringLiteral("Survey"), "folders with the other separator"},
        {QStringLiteral("C:\\x/Survey"), QStringLiteral("Survey"), "both separators, the last one counts"},
        {QStringLiteral("/x\\Survey"), QStringLiteral("Survey"), "both separators, the last one counts"},
        {QStringLiteral("/x.y/Survey"), QStringLiteral("Survey"), "a point in a folder is not part of the name"},
        {QStringLiteral("Survey.rep"), QStringLiteral("Report$$$"), "an extension of three letters leaves nothing"},
        {QStringLiteral("Survey.c"), QStringLiteral("Report$$$"), "nor does a shorter one"},
        {QStringLiteral("Survey."), QStringLiteral("Report$$$"), "nor a point at the end"},
        {QStringLiteral("Survey.html"), QStringLiteral("l"), "of a longer one its end stays"},
        {QStringLiteral("Survey.version2"), QStringLiteral("sion2"), "of a longer one its end stays"},
        {QStringLiteral("Survey.version2.rep"), QStringLiteral("Report$$$"), "the last point counts"},
        {QStringLiteral(".profile"), QStringLiteral("file"), "a point at the beginning"},
        {QStringLiteral("/x/"), QStringLiteral("Report$$$"), "a folder only"},
        {QStringLiteral("\\"), QStringLiteral("Report$$$"), "a separator only"},
        {QStringLiteral("."), QStringLiteral("Report$$$"), "a point only"},
        {QString(), QStringLiteral("Report$$$"), "no name"},
        {QStringLiteral(u"測量 \xD83D\xDE00"), QStringLiteral(u"測量 \xD83D\xDE00"), "any characters"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const TemporaryFolder folder;
        EXPECT_EQ(nameFor(row.name), folder.at(row.stem + QStringLiteral(".rep"))) << row.reason;
        EXPECT_EQ(nameFor(row.name), folder.at(row.stem + QStringLiteral(" 2.rep"))) << row.reason;
    }
}

TEST(UReportDocTemporaryName, AReportThatIsMadeWithANameHasItAsStem)
{
    const FixedSurroundings surroundings;
    const TemporaryFolder folder;
    const UReportDoc report(QStringLiteral("Traverse"), false, false, nullptr);
    EXPECT_EQ(report.GetCurrentReportFileName(), folder.at(QStringLiteral("Traverse.rep")));
    EXPECT_EQ(nameFor(QStringLiteral("Traverse 2")), folder.at(QStringLiteral("Traverse 2.rep")));
    EXPECT_EQ(report.GetCurrentReportFileName(), folder.at(QStringLiteral("Traverse 3.rep")))
        << "a number that another name has taken is skipped";
}

TEST(UReportDocTemporaryName, TheFileSystemIsNotAsked)
{
    const FixedSurroundings surroundings;
    const TemporaryFolder folder;
    QFile existing(folder.at(QStringLiteral("Survey.rep")));
    ASSERT_TRUE(existing.open(QIODevice::WriteOnly));
    EXPECT_EQ(nameFor(QStringLiteral("Survey")), existing.fileName()) << "only names that were handed out are taken";
    ASSERT_TRUE(existing.remove());
    EXPECT_EQ(nameFor(QStringLiteral("Survey")), folder.at(QStringLiteral("Survey 2.rep")))
        << "and they stay taken without a file";
    EXPECT_FALSE(QFile::exists(folder.at(QStringLiteral("Survey 2.rep")))) << "no file is made";
}

TEST(UReportDocTemporaryName, TheFolderEndsWithOneSeparator)
{
    const FixedSurroundings surroundings;
    const TemporaryFolder folder(QStringLiteral("/"));
    EXPECT_EQ(nameFor(QStringLiteral("Survey")), folder.at(QStringLiteral("Survey.rep"))) << "given with one";
    TemporaryFolder::set(QStringLiteral("/"));
    const QString unused = QDir(folder.at(QString())).dirName();
    EXPECT_EQ(nameFor(unused), QDir::separator() + unused + QStringLiteral(".rep")) << "the separator is all of it";
}

TEST(UReportDocTemporaryName, AfterAThousandTheLastOneIsGivenAgain)
{
    const FixedSurroundings surroundings;
    const TemporaryFolder folder;
    QSet<QString> names;
    QString last;
    for (int i = 0; i < 1000; ++i) {
        last = nameFor(QStringLiteral("Survey"));
        names.insert(last);
    }
    EXPECT_EQ(names.size(), 1000) << "each of them once";
    EXPECT_EQ(last, folder.at(QStringLiteral("Survey 1000.rep")));
    EXPECT_EQ(nameFor(QStringLiteral("Survey")), last);
    EXPECT_EQ(nameFor(QStringLiteral("Survey")), last);
    EXPECT_EQ(nameFor(QStringLiteral("Other")), folder.at(QStringLiteral("Other.rep"))) << "other stems are free";
}

} // namespace
