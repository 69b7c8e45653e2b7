#include "ReportFixture.h"
#include "TemplateMarkup.h"
#include "UDataObjectList.h"
#include "UJobSettings.h"
#include "UPointNumber.h"
#include "UXmlReportTpl.h"

#include <QDir>

#include <gtest/gtest.h>

// What a report keeps of a load that fails, and which of its two folders a template comes from.

namespace
{

using namespace markup;

/// A template of a name and title, with the tables "Points" and "Swap" and the block "Site".
QByteArray surveyOf(const char *name, const char *title, const QByteArray &options)
{
    return element("ReportTemplate",
                   element("Name", name) + element("Title", title) +
                       element("Tables", output("Table", "Points", "Survey", {field("Number", "Pt", "4")}) +
                                             output("Table", "Swap", "Survey",
                                                    {field("Northing", "N", "2"), field("Easting", "E", "3")})) +
                       element("Dictionaries", surveyDictionary()) +
                       element("Blocks", output("Block", "Site", "Survey", {field("Number", "Point", "4")})) +
                       element("Options", options));
}

const QByteArray semicolon = separatorOption(";") + element("PageBreaks", "NO");

bool load(UReportDoc &report, const char *name, const char *table = "", const char *block = "")
{
    return report.LoadTemplateXml(QStringLiteral("t.xml"), QString::fromUtf8(name), QString::fromUtf8(table),
                                  QString::fromUtf8(block));
}

/// A template folder and a report on pages of 72 lines.
struct TemplateReport
{
    FixedSurroundings surroundings;
    TemplateFolders folders;
    UReportDoc report{QStringLiteral("Before"), false, false, nullptr};

    TemplateReport() { report.FixPage(72, 80); }
};

TEST(UReportDocTemplateFiles, WhereNeitherFileIsGoodTheSeparatorAndPageBreaksStay)
{
    TemplateReport t;
    t.report.SetDataColumnSeparator(u'!', false);
    EXPECT_FALSE(load(t.report, "T")) << "no files";
    EXPECT_EQ(t.report.GetDataColumnSeparator(), u'!');
    EXPECT_TRUE(t.report.GetPageBreaks());

    t.folders.putIntoLibrary(surveyOf("T", "Title", semicolon));
    t.folders.putIntoStart(surveyOf("Other", "Other title", separatorOption("|")));
    ASSERT_TRUE(load(t.report, "T"));
    ASSERT_EQ(t.report.GetDataColumnSeparator(), u';');
    ASSERT_FALSE(t.report.GetPageBreaks());
    for (const char *name : {"Unknown", ""}) {
        EXPECT_FALSE(load(t.report, name)) << name;
        EXPECT_EQ(t.report.GetDataColumnSeparator(), u';') << name;
        EXPECT_FALSE(t.report.GetPageBreaks()) << name;
        EXPECT_EQ(t.report.GetTitle(), QStringLiteral("Title")) << name;
    }
}

TEST(UReportDocTemplateFiles, AnUnknownTableOrBlockFailsAfterTheOptionsAndBeforeTheTitle)
{
    for (const auto &[table, block] : {std::pair("Unknown", ""), std::pair("", "Unknown"), std::pair("Points", "No")}) {
        TemplateReport t;
        t.folders.putIntoLibrary(surveyOf("T", "Title", semicolon));
        EXPECT_FALSE(load(t.report, "T", table, block));
        EXPECT_EQ(t.report.GetDataColumnSeparator(), u';') << table << block;
        EXPECT_FALSE(t.report.GetPageBreaks()) << table << block;
        EXPECT_EQ(t.report.GetTitle(), QStringLiteral("Before")) << table << block;
    }
}

TEST(UReportDocTemplateFiles, ATemplateThatExistsOnlyInTheStartFolderLoadsAfterTheLibraryFails)
{
    const struct
    {
        const char *inLibrary;
        const char *reason;
    } rows[] = {
        {"other", "the library's file has another template only"},
        {"empty", "the library's file is empty"},
        {"folder", "a folder has the file's name in the library"},
        {"none", "there is no file in the library"},
    };
    for (const auto &row : rows) {
        TemplateReport t;
        const std::string kind = row.inLibrary;
        if (kind == "other") {
            t.folders.putIntoLibrary(surveyOf("Other", "Other title", semicolon));
        } else if (kind == "empty") {
            t.folders.putIntoLibrary(QByteArray());
        } else if (kind == "folder") {
            ASSERT_TRUE(QDir(t.folders.libraryPath()).mkdir(QStringLiteral("t.xml")));
        }
        t.folders.putIntoStart(surveyOf("First", "First title", semicolon) +
                               surveyOf("T", "Title", separatorOption("|")));
        EXPECT_TRUE(load(t.report, "T", "Points", "Site")) << row.reason;
        EXPECT_EQ(t.report.GetTitle(), QStringLiteral("Title")) << row.reason;
        EXPECT_EQ(t.report.GetDataColumnSeparator(), u'|') << row.reason;
        EXPECT_TRUE(t.report.GetPageBreaks()) << row.reason;
        QStringList names;
        t.report.GetTemplate()->GetAllTPLsByName(names);
        EXPECT_EQ(names.join(u' '), QStringLiteral("First T")) << row.reason << ": only the start folder's are listed";
        t.report.GetTemplate()->GetAllTPLsByTitle(names);
        EXPECT_EQ(names.join(u'/'), QStringLiteral("First title/Title")) << row.reason;
    }
}

TEST(UReportDocTemplateFiles, ATableThatIsLoadedTwiceKeepsEastingFirst)
{
    TemplateReport t;
    t.folders.putIntoLibrary(surveyOf("T", "Title", semicolon));
    UJobSettings settings;
    settings.northEastOrder = ORDER_EASTING_NORTHING;
    t.report.SetJobSettings(settings);
    ASSERT_TRUE(load(t.report, "T"));
    t.report.WriteLine(QStringLiteral("start"), 0, 1, 0);
    UDataObjectList list;
    for (int i = 0; i < 3; ++i) {
        ASSERT_TRUE(t.report.LoadTemplateTable(QStringLiteral("Swap")));
        EXPECT_EQ(t.report.GetTemplate()->GetTable(QStringLiteral("Swap"))->Fields.at(0).VariableName,
                  QStringLiteral("Easting"))
            << i;
        EXPECT_TRUE(t.report.WriteDataTable(&list, 0, 0, 1));
    }
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("start\nE  ;N \nE  ;N \nE  ;N \n")));
}

TEST(UReportDocTemplateFiles, AfterAFailedBlockNoBlockIsWrittenButTheTableStillIs)
{
    TemplateReport t;
    t.folders.putIntoLibrary(surveyOf("T", "Title", semicolon));
    ASSERT_FALSE(load(t.report, "T", "Points", "Unknown"));
    t.report.WriteLine(QStringLiteral("start"), 0, 1, 0);
    t.report.SetModifiedFlag(false);
    UDataObject object;
    object.Set(1, UPointNumber(QStringLiteral("7")));
    EXPECT_FALSE(t.report.WriteDataBlock(&object, 1, 1));
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("start\n")));
    EXPECT_FALSE(t.report.IsModified());
    UDataObjectList list;
    list.Add().Set(1, UPointNumber(QStringLiteral("8")));
    EXPECT_TRUE(t.report.WriteDataTable(&list, 0, 0, 1));
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("start\nPt  \n8   \n")));
}

TEST(UReportDocTemplateFiles, ABlockThatWasLoadedGoesWithAFailedOne)
{
    TemplateReport t;
    t.folders.putIntoLibrary(surveyOf("T", "Title", semicolon));
    ASSERT_TRUE(load(t.report, "T", "Points", "Site"));
    UDataObject object;
    object.Set(1, UPointNumber(QStringLiteral("7")));
    EXPECT_FALSE(t.report.LoadTemplateBlock(QStringLiteral("Unknown")));
    EXPECT_FALSE(t.report.WriteDataBlock(&object, 1, 1));
    EXPECT_EQ(textOf(t.report), QString());
    EXPECT_TRUE(t.report.WriteDataBlock(QStringLiteral("site"), &object, 0, 0)) << "it can be loaded again";
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("Point;7\n")));
}

TEST(UReportDocTemplateFiles, AfterAFailedTableNoTableIsWrittenButTheBlockStillIs)
{
    TemplateReport t;
    t.folders.putIntoLibrary(surveyOf("T", "Title", semicolon));
    ASSERT_TRUE(load(t.report, "T", "Points", "Site"));
    ASSERT_FALSE(t.report.LoadTemplateTable(QStringLiteral("Unknown")));
    t.report.SetModifiedFlag(false);
    UDataObjectList list;
    list.Add().Set(1, UPointNumber(QStringLiteral("8")));
    EXPECT_FALSE(t.report.WriteDataTable(&list, 1, 1, 1));
    EXPECT_EQ(textOf(t.report), QString());
    EXPECT_FALSE(t.report.IsModified());
    UDataObject object;
    object.Set(1, UPointNumber(QStringLiteral("7")));
    EXPECT_TRUE(t.report.WriteDataBlock(&object, 0, 0));
    EXPECT_EQ(textOf(t.report), reportLines(QStringLiteral("Point;7\n")));
}

} // namespace
