#include "TemporaryNames.h"

#include "PrintQt.h"

#include <QDir>

#include <gtest/gtest.h>

namespace
{

using kareport::TemporaryNames;
using kareport::temporaryStem;

TEST(TemporaryNames, TheStemIsTheReportsNameWithoutExtension)
{
    struct Row
    {
        QStringView name;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", u"Report$$$", "no name"},
        {u"C:\\x\\Survey", u"Survey", "a name without extension"},
        {u"/x/Survey", u"Survey", "the same where folders have another mark"},
        {u"C:\\x/y\\z/Survey", u"Survey", "both marks"},
        {u"Survey", u"Survey", "no folder"},
        {u"C:\\x\\Survey.rep", u"Report$$$", "three letters after the point leave nothing"},
        {u"Survey.re", u"Report$$$", "two letters leave nothing"},
        {u"Survey.", u"Report$$$", "nothing after the point"},
        {u".", u"Report$$$", "a point alone"},
        {u"Survey.text", u"t", "what is more than three letters is what is left"},
        {u"Survey.report", u"ort", "what is more than three letters is what is left"},
        {u"a.b.report", u"ort", "the last point counts"},
        {u"C:\\x.long-folder\\Survey", u"Survey", "a point of a folder does not count"},
        {u"C:\\x\\", u"Report$$$", "a folder"},
        {u"\\", u"Report$$$", "a folder"},
        {u"測量 é", u"測量 é", "characters beyond ASCII"},
        {u"a.測量測量地", u"量地", "counted in characters"},
        {u" ", u" ", "a blank is a name"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(temporaryStem(row.name.toString()), row.expected.toString())
            << row.reason << ": " << testing::PrintToString(row.name);
    }
}

QString inFolder(QStringView folder, QStringView name)
{
    return folder.toString() + QDir::separator() + name.toString();
}

TEST(TemporaryNames, AreHandedOutOnce)
{
    TemporaryNames names;
    const QString folder = QStringLiteral("/no/such folder");
    const QString stem = QStringLiteral("Report$$$");
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"Report$$$.rep"));
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"Report$$$ 2.rep"));
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"Report$$$ 3.rep"));
    EXPECT_EQ(names.next(folder, QStringLiteral("Survey")), inFolder(folder, u"Survey.rep")) << "each stem for itself";
    EXPECT_EQ(names.next(folder, QStringLiteral("Survey")), inFolder(folder, u"Survey 2.rep"));
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"Report$$$ 4.rep"));
    EXPECT_EQ(names.next(QStringLiteral("/other"), stem), inFolder(u"/other", u"Report$$$.rep")) << "each folder, too";
    EXPECT_EQ(TemporaryNames().next(folder, stem), inFolder(folder, u"Report$$$.rep")) << "another set";
}

TEST(TemporaryNames, ANumberedNameMayBeTakenAsTheStemOfAnother)
{
    TemporaryNames names;
    const QString folder = QStringLiteral("/t");
    EXPECT_EQ(names.next(folder, QStringLiteral("a 2")), inFolder(folder, u"a 2.rep"));
    EXPECT_EQ(names.next(folder, QStringLiteral("a")), inFolder(folder, u"a.rep"));
    EXPECT_EQ(names.next(folder, QStringLiteral("a")), inFolder(folder, u"a 3.rep")) << "the second one is taken";
}

TEST(TemporaryNames, AFoldersOwnSeparatorIsNotDoubled)
{
    const QString separator = QDir::separator();
    EXPECT_EQ(TemporaryNames().next(QStringLiteral("/t") + separator, QStringLiteral("a")), inFolder(u"/t", u"a.rep"));
    EXPECT_EQ(TemporaryNames().next(separator, QStringLiteral("a")), inFolder(u"", u"a.rep"));
    EXPECT_EQ(TemporaryNames().next(QString(), QStringLiteral("a")), QStringLiteral("a.rep"))
        << "no folder, no separator";
}

TEST(TemporaryNames, AfterTheThousandthItIsGivenAgain)
{
    TemporaryNames names;
    const QString folder = QStringLiteral("/t");
    const QString stem = QStringLiteral("a");
    QSet<QString> given;
    for (int i = 0; i < 999; ++i) {
        given.insert(names.next(folder, stem));
    }
    EXPECT_EQ(given.size(), 999) << "all different";
    EXPECT_FALSE(given.contains(inFolder(folder, u"a 1000.rep")));
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"a 1000.rep"));
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"a 1000.rep"));
    EXPECT_EQ(names.next(folder, stem), inFolder(folder, u"a 1000.rep"));
    EXPECT_EQ(names.next(folder, QStringLiteral("b")), inFolder(folder, u"b.rep")) << "another stem begins anew";
}

} // namespace
