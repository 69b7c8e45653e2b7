#include "ReportFixture.h"
#include "TemplateMarkup.h"
#include "UDataObjectList.h"
#include "UPointNumber.h"
#include "UXmlReportTpl.h"

#include <gtest/gtest.h>

namespace
{

using namespace markup;

/// A template "T" of a title, with the table "Points" and the block "Site".
QByteArray titled(const char *title, const QByteArray &options = separatorOption("124"), const char *name = "T")
{
    const std::vector<QByteArray> fields = {field("Number", "Point", "6"), field("Note", "Note", "6")};
    return element("ReportTemplate", element("Name", name) + element("Title", title) +
                                         element("Tables", output("Table", "Points", "Survey", fields) +
                                                               output("Table", "Lost", "Missing", fields)) +
                                         element("Dictionaries", surveyDictionary()) +
                                         element("Blocks", output("Block", "Site", "Survey", fields) +
                                                               output("Block", "Lost", "Missing", fields)) +
                                         element("Options", options));
}

bool load(UReportDoc &report, const char *table = "", const char *block = "", const char *name = "T")
{
    return report.LoadTemplateXml(QStringLiteral("t.xml"), QString::fromUtf8(name), QString::fromUtf8(table),
                                  QString::fromUtf8(block));
}

TEST(UReportDocTemplate, TheLibraryFolderComesBeforeTheStartFolder)
{
    struct Row
    {
        const char *inLibrary; // the template's name there; null for no file
        const char *inStart;
        QString expected; // the title; null when loading fails
        const char *reason;
    };
    const Row rows[] = {
        {"T", "T", QStringLiteral("Library"), "the library wins"},
        {"T", nullptr, QStringLiteral("Library"), "in the library only"},
        {nullptr, "T", QStringLiteral("Start"), "in the start folder only"},
        {"OTHER", "T", QStringLiteral("Start"), "the library's file has no such template"},
        {"t", "T", QStringLiteral("Library"), "names are compared without regard to case"},
        {"OTHER", "OTHER", QString(), "neither file has it"},
        {nullptr, nullptr, QString(), "no file at all"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const TemplateFolders folders;
        if (row.inLibrary != nullptr) {
            folders.putIntoLibrary(titled("Library", separatorOption("124"), row.inLibrary));
        }
        if (row.inStart != nullptr) {
            folders.putIntoStart(titled("Start", separatorOption("124"), row.inStart));
        }
        for (const QString &ending : {QString(), QStringLiteral("/")}) {
            kareport::setLibraryDir(folders.libraryPath() + ending);
            kareport::setStartPathName(folders.startPath() + ending);
            UReportDoc report(QStringLiteral("Before"), false, false, nullptr);
            EXPECT_EQ(load(report), !row.expected.isNull()) << row.reason;
            EXPECT_EQ(report.GetTitle(), row.expected.isNull() ? QStringLiteral("Before") : row.expected) << row.reason;
            EXPECT_NE(report.GetTemplate(), nullptr) << row.reason << ": an empty template stays after a failure";
            EXPECT_EQ(report.GetDataColumnSeparator(), row.expected.isNull() ? u' ' : u'|') << row.reason;
        }
    }
}

TEST(UReportDocTemplate, TheSeparatorOptionIsWidenedWithItsSign)
{
    struct Row
    {
        QByteArray options;
        char16_t expected;
        const char *reason;
    };
    const Row rows[] = {
        {separatorOption("124"), u'|', "a code"},
        {separatorOption("|"), u'|', "a character"},
        {separatorOption("9"), u'\t', "a tab"},
        {separatorOption("0"), u'\0', "the character 0"},
        {separatorOption("127"), u'\x7F', "the last one without a sign"},
        {separatorOption("128"), u'\xFF80', "the first one with a sign"},
        {separatorOption("176"), u'\xFFB0', "a degree sign by its code"},
        {separatorOption("\xC2\xB0"), u'\xFFB0', "a degree sign as it is"},
        {separatorOption("255"), u'\xFFFF', "the last code"},
        {separatorOption("256"), u' ', "outside: a blank"},
        {separatorOption("-1"), u' ', "outside: a blank"},
        {QByteArray(), u'\0', "no option"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const TemplateFolders folders;
        folders.putIntoLibrary(titled("Title", row.options));
        UReportDoc report;
        EXPECT_TRUE(load(report)) << row.reason;
        EXPECT_EQ(static_cast<unsigned>(report.GetDataColumnSeparator()), static_cast<unsigned>(row.expected))
            << row.reason;
    }
}

TEST(UReportDocTemplate, AHeadingHasTheLow8BitsOfASeparatorAndARowAllOfIt)
{
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    folders.putIntoLibrary(titled("Title", separatorOption("176")));
    UReportDoc report;
    ASSERT_TRUE(load(report, "Points"));
    UDataObjectList list;
    UDataObject &point = list.Add();
    point.Set(1, UPointNumber(QStringLiteral("1")));
    point.Set(6, QStringLiteral("ab"));
    report.WriteLine(QString(), 0, 1, 0);
    ASSERT_TRUE(report.WriteDataTable(&list, 0, 0, 1));
    EXPECT_EQ(textOf(report), reportLines(QStringLiteral(u"\nPoint \xB0Note  \n1     \xFFB0"
                                                         u"ab    \n")));
}

TEST(UReportDocTemplate, PageBreaksAreOnUnlessTheOptionIsNo)
{
    struct Row
    {
        QByteArray option;
        bool expected;
    };
    const Row rows[] = {
        {QByteArray(), true},
        {element("PageBreaks", "NO"), false},
        {element("PageBreaks", "no"), false},
        {element("PageBreaks", "No page breaks"), true},
        {element("PageBreaks", "YES"), true},
    };
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    UReportDoc report;
    for (const Row &row : rows) {
        folders.putIntoLibrary(titled("Title", separatorOption("124") + row.option));
        EXPECT_TRUE(load(report));
        EXPECT_EQ(report.GetPageBreaks(), row.expected) << row.option.toStdString();
    }
}

TEST(UReportDocTemplate, ATableOrBlockThatCannotBeLoadedFailsTheWhole)
{
    struct Row
    {
        const char *table;
        const char *block;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "", true, "the template alone"},
        {"Points", "", true, "with a table"},
        {"", "Site", true, "with a block"},
        {"points", "SITE", true, "with both, in any case"},
        {"Unknown", "", false, "no such table"},
        {"Site", "", false, "a block is not a table"},
        {"Lost", "", false, "a table without its dictionary"},
        {"", "Unknown", false, "no such block"},
        {"", "Lost", false, "a block without its dictionary"},
        {"Points", "Unknown", false, "the table but not the block"},
        {"Unknown", "Site", false, "the block but not the table"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        const TemplateFolders folders;
        folders.putIntoLibrary(titled("Title"));
        UReportDoc report(QStringLiteral("Before"), false, false, nullptr);
        EXPECT_EQ(load(report, row.table, row.block), row.expected) << row.reason;
        EXPECT_EQ(report.GetTitle(), row.expected ? QStringLiteral("Title") : QStringLiteral("Before"))
            << row.reason << ": the title comes last";
        EXPECT_EQ(report.GetDataColumnSeparator(), u'|') << row.reason << ": the options come first";
        EXPECT_TRUE(report.LoadTemplateTable(QStringLiteral("Points"))) << row.reason << ": the template stays loaded";
        EXPECT_TRUE(report.LoadTemplateBlock(QStringLiteral("Site"))) << row.reason << ": the template stays loaded";
    }
}

TEST(UReportDocTemplate, TablesAndBlocksNeedATemplate)
{
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    UReportDoc report;
    EXPECT_FALSE(report.LoadTemplateTable(QStringLiteral("Points")));
    EXPECT_FALSE(report.LoadTemplateBlock(QStringLiteral("Site")));
    EXPECT_FALSE(load(report)) << "no file";
    EXPECT_FALSE(report.LoadTemplateTable(QStringLiteral("Points"))) << "the template is empty";
    EXPECT_FALSE(report.LoadTemplateBlock(QStringLiteral("Site"))) << "the template is empty";
    folders.putIntoStart(titled("Title"));
    ASSERT_TRUE(load(report));
    EXPECT_FALSE(report.LoadTemplateTable(QString())) << "no name";
    EXPECT_FALSE(report.LoadTemplateBlock(QString())) << "no name";
    EXPECT_FALSE(load(report, "", "", "")) << "no template name";
}

TEST(UReportDocTemplate, ALaterTemplateReplacesTheEarlierOne)
{
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    folders.putIntoLibrary(titled("First") + titled("Second", separatorOption("59"), "S"));
    UReportDoc report;
    ASSERT_TRUE(load(report));
    EXPECT_EQ(report.GetTemplate()->GetTemplateTitle(), QStringLiteral("First"));
    ASSERT_TRUE(load(report, "", "", "S"));
    EXPECT_EQ(report.GetTemplate()->GetTemplateTitle(), QStringLiteral("Second"));
    EXPECT_EQ(report.GetTitle(), QStringLiteral("Second"));
    EXPECT_EQ(report.GetDataColumnSeparator(), u';');
    EXPECT_FALSE(load(report, "", "", "Unknown"));
    EXPECT_FALSE(report.LoadTemplateTable(QStringLiteral("Points"))) << "the earlier one is gone";
    EXPECT_EQ(report.GetTitle(), QStringLiteral("Second"));
}

TEST(UReportDocTemplate, TheTemplatesTitleIsNumberedLikeAnyOther)
{
    const FixedSurroundings surroundings;
    const TemplateFolders folders;
    folders.putIntoLibrary(titled("Stakeout"));
    CViewPane pane;
    pane.SetWindowTextW(QStringLiteral("Stakeout"));
    UReportDoc report;
    ASSERT_TRUE(load(report));
    EXPECT_EQ(report.GetTitle(), QStringLiteral("Stakeout 2"));
}

} // namespace
