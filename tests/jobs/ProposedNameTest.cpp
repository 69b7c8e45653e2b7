#include "ProposedName.h"

#include "JobFolder.h"
#include "ShippedExamples.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(ProposedName, ATitleBecomesTheNameOfAFile)
{
    struct Row
    {
        const char *title;
        const char *name;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Stakeout, -0+075 to 1+500", "Stakeout, -0+075 to 1+500", "as it is"},
        {"Lot 7/8: as built?", "Lot 7-8- as built-", "a file system takes these for something else"},
        {"../../etc/passwd", "etc-passwd", "never another folder, never hidden"},
        {"-rf", "rf", "programs take it for an option"},
        {"two\nlines\tand  blanks", "two-lines-and blanks", "one line"},
        {"高程 表", "高程 表", "letters of any script"},
        {"...", "", "nothing is left"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(fileNameOf(QString::fromUtf8(row.title)), QString::fromUtf8(row.name)) << row.reason;
    }
    EXPECT_LE(fileNameOf(QString(1000, u'x')).size(), 100);
}

TEST(ProposedName, IsBesideWhatTheReportIsMadeOf)
{
    const JobFolder folder;
    const QString job = folder.path("list.json");
    struct Row
    {
        NamedReport report;
        QString name;
        const char *reason;
    };
    const QString title = QStringLiteral("Pegs");
    const QString last = QStringLiteral("/last");
    const Row rows[] = {
        {{title, QString(), job, last}, folder.path("Pegs.pdf"), "beside the job, by its title"},
        {{title, folder.path("saved.rep"), QStringLiteral("/x/list.json"), last},
         folder.path("saved.pdf"),
         "its own file says more"},
        {{QString(), QString(), job, last}, folder.path("list.pdf"), "without a title as the job"},
        {{title, QString(), QString(), last}, QStringLiteral("/last/Pegs.pdf"), "made of nothing"},
        {{title, QString(), QStringLiteral("/no/such/folder/list.json"), last},
         QStringLiteral("/last/Pegs.pdf"),
         "the folder cannot be written to"},
        {{QString(), QString(), QString(), last}, QString(), "nothing is known"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(proposedName(row.report, QStringLiteral("pdf")), row.name) << row.reason;
    }
    setExamplesFolder(folder.path());
    folder.put("list.json", "{}");
    EXPECT_EQ(proposedName({title, QString(), job, last}, QStringLiteral("pdf")), QStringLiteral("/last/Pegs.pdf"))
        << "nothing is put beside the examples";
    setExamplesFolder(QString());
}

TEST(ProposedName, GetsTheEndingOfAnotherKind)
{
    const QStringList kinds = {QStringLiteral("*.pdf"), QStringLiteral("*.rtf"), QStringLiteral("*")};
    EXPECT_EQ(withOtherEnding(QStringLiteral("/a/b.pdf"), QStringLiteral("*.rtf"), kinds), QStringLiteral("/a/b.rtf"));
    EXPECT_EQ(withOtherEnding(QStringLiteral("/a/b.PDF"), QStringLiteral("*.rtf"), kinds), QStringLiteral("/a/b.rtf"));
    EXPECT_EQ(withOtherEnding(QStringLiteral("/a/b.1"), QStringLiteral("*.rtf"), kinds), QStringLiteral("/a/b.1"));
    EXPECT_EQ(withOtherEnding(QStringLiteral("/a/b.pdf"), QStringLiteral("*"), kinds), QStringLiteral("/a/b.pdf"));
}

} // namespace
