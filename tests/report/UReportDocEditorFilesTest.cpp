#include "ReportEditorFixture.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

using UReportDocEditorFiles = ReportEditor;

constexpr QFile::Permissions others =
    QFile::ReadGroup | QFile::WriteGroup | QFile::ExeGroup | QFile::ReadOther | QFile::WriteOther | QFile::ExeOther;

TEST_F(UReportDocEditorFiles, AreReadByTheUserAlone)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    putFile(at("Report$$$.rep"), "of an earlier run");
    ASSERT_TRUE(QFile::setPermissions(at("Report$$$.rep"), QFile::ReadOwner | QFile::WriteOwner | others));
    createWritten()->UpdateAllViews(nullptr);
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext\r\r\n");
    for (const char *name : {"Report$$$.rep", "Report$$$ 2.rtf"}) {
        EXPECT_TRUE(QFile::exists(at(name))) << name;
        EXPECT_EQ(QFile::permissions(at(name)) & others, QFile::Permissions()) << name;
    }
}

TEST_F(UReportDocEditorFiles, DoNotFollowALinkThatHasTheirName)
{
    const QTemporaryDir elsewhere;
    const QString precious = elsewhere.filePath(QStringLiteral("precious"));
    const QString absent = elsewhere.filePath(QStringLiteral("absent"));
    putFile(precious, "precious");
    ASSERT_TRUE(QFile::link(precious, at("Report$$$.rep")));
    ASSERT_TRUE(QFile::link(absent, at("Report$$$ 2.rtf")));
    ASSERT_TRUE(QFile::link(precious, at("Report$$$ 2_1.rtf")));
    const PreferredEditor editor(QStringLiteral("winword"));
    createWritten()->UpdateAllViews(nullptr);
    EXPECT_EQ(contentOf(precious), "precious");
    EXPECT_FALSE(QFile::exists(absent));
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFtext\r\r\n");
    EXPECT_FALSE(QFileInfo(at("Report$$$.rep")).isSymLink());
    EXPECT_EQ(launches.files(), QStringList{at("Report$$$ 2_2.rtf")});
}

TEST_F(UReportDocEditorFiles, OfRichTextAreNumberedPastThoseThatExist)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    putFile(at("a 2.rtf"), "earlier");
    putFile(at("a 2_1.rtf"), "earlier");
    putFile(at("a 2_3.rtf"), "earlier");
    putFile(at("a 4.rtf"), "earlier");
    UReportDoc *report = createWritten(QStringLiteral("a"));
    report->UpdateAllViews(nullptr);
    report->UpdateAllViews(nullptr);
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), (QStringList{at("a 2_2.rtf"), at("a 4_1.rtf"), at("a 6.rtf")}));
    for (const char *name : {"a 2.rtf", "a 2_1.rtf", "a 2_3.rtf", "a 4.rtf"}) {
        EXPECT_EQ(contentOf(at(name)), "earlier") << name;
    }
    EXPECT_EQ(contentOf(at("a 2_2.rtf")), richTextOf({"text\r"}));
}

TEST_F(UReportDocEditorFiles, PassANameThatSomethingElseKeeps)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    ASSERT_TRUE(QDir().mkdir(at("Report$$$.rep")));
    ASSERT_TRUE(QDir().mkdir(at("Report$$$ 2.rep")));
    createWritten()->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), QStringList{at("Report$$$ 3.rep")});
    EXPECT_EQ(contentOf(at("Report$$$ 3.rep")), "\xEF\xBB\xBFtext\r\r\n");
}

TEST_F(UReportDocEditorFiles, ThatHaveNoNameLeftAreNotOpened)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    UReportDoc *report = createWritten(QStringLiteral("a"));
    ASSERT_TRUE(QDir().mkdir(at("a.rep")));
    for (int number = 2; number <= 1000; ++number) {
        ASSERT_TRUE(QDir().mkdir(temporary.at(QStringLiteral("a %1.rep").arg(number))));
    }
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), QStringList()) << "what has the name is not the report";
    ASSERT_TRUE(QDir().rmdir(at("a 1000.rep")));
    report->UpdateAllViews(nullptr);
    report->WriteLine(QStringLiteral("more"), 0, 1, 0);
    report->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), (QStringList{at("a 1000.rep"), at("a 1000.rep")})) << "the last one serves again";
    EXPECT_EQ(contentOf(at("a 1000.rep")), "\xEF\xBB\xBFtext\r\r\nmore\r\r\n");
}

TEST_F(UReportDocEditorFiles, OfRichTextThatCannotBeMadeGiveWayToTheText)
{
    // Every ".rep" in the path becomes ".rtf", also that of a folder: the folder of the other name is not there.
    ASSERT_TRUE(QDir().mkdir(at("x.rep")));
    TemporaryFolder::set(at("x.rep"));
    const PreferredEditor editor(QStringLiteral("winword"));
    createWritten(QStringLiteral("a"))->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files(), QStringList{at("x.rep/a 2.rep")});
    EXPECT_EQ(contentOf(at("x.rep/a 2.rep")), "\xEF\xBB\xBFtext\r\r\r\n") << "of the converted report";
    EXPECT_EQ(QFile::permissions(at("x.rep/a 2.rep")) & others, QFile::Permissions());
    EXPECT_EQ(contentOf(at("x.rep/a.rep")), "\xEF\xBB\xBFtext\r\r\n") << "of the report itself";

    ASSERT_TRUE(QDir().mkdir(at("x.rtf")));
    createWritten(QStringLiteral("b"))->UpdateAllViews(nullptr);
    EXPECT_EQ(launches.files().value(1), at("x.rtf/b 2.rtf")) << "with such a folder it goes there";
}

TEST_F(UReportDocEditorFiles, ThatCannotBeMadeAreStillNamedToTheEditor)
{
    const QString name(300, u'a'); // longer than a file's name can be
    for (const char *program : {"notepad", "winword"}) {
        const PreferredEditor editor(QLatin1String{program});
        UReportDoc *report = createWritten(name);
        report->UpdateAllViews(nullptr);
        EXPECT_TRUE(report->IsModified()) << program << ": it could not be saved";
    }
    EXPECT_EQ(launches.files(),
              (QStringList{temporary.at(name + QStringLiteral(".rep")), temporary.at(name + QStringLiteral(" 3.rep"))}))
        << "one name for each, no other is tried";
}

} // namespace
