#include "UXmlReportTpl.h"
#include "LoadedTemplate.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <string>

/// Sees what a template keeps to itself.
class UXmlReportTplTest : public testing::Test
{
protected:
    static bool setXml(UXmlReportTpl &tpl, const QString &xml) { return tpl.SetXml(xml); }
    static QString xml(const UXmlReportTpl &tpl) { return tpl.GetXml(); }
    static QString name(const UXmlReportTpl &tpl) { return tpl.name_; }
    static void setName(UXmlReportTpl &tpl, const QString &name) { tpl.name_ = name; }
    static void clean(UXmlReportTpl &tpl, bool keepText) { tpl.CleanData(keepText); }

    static void expectNothingRead(const UXmlReportTpl &tpl, const char *reason);
};

namespace
{

QStringList list(void (UXmlReportTpl::*fill)(QStringList &) const, const UXmlReportTpl &tpl)
{
    QStringList names{QStringLiteral("what was there before")};
    (tpl.*fill)(names);
    return names;
}

const QByteArray stakeout =
    "<ReportTemplate><Name>STAKEOUT</Name><Title>Stakeout Report</Title>"
    "<Tables><Table><Name>Points</Name><Use>PointDic</Use>"
    "<Sort><VariableName>Number</VariableName></Sort><OutputList>"
    "<Field><VariableName>Number</VariableName><Label>Point</Label><Format>8</Format>"
    "<Align>LEFT</Align></Field>"
    "<Field><VariableName>Northing</VariableName><Label>North</Label><Format>12.3</Format>"
    "<Align>RIGHT</Align></Field>"
    "<Field><VariableName>Easting</VariableName><Label>East</Label><Format>12.3</Format>"
    "<Align>RIGHT</Align></Field></OutputList></Table></Tables>"
    "<Dictionaries><Dictionary><DictionaryName>PointDic</DictionaryName><VariableList>"
    "<Variable><ID>1</ID><VariableName>Number</VariableName><Type>NUMBER</Type></Variable>"
    "<Variable><ID>2</ID><VariableName>Northing</VariableName><Type>COORDINATE</Type></Variable>"
    "<Variable><ID>3</ID><VariableName>Easting</VariableName><Type>COORDINATE</Type></Variable>"
    "</VariableList></Dictionary></Dictionaries>"
    "<Options><Separator>|</Separator><PageBreaks>NO</PageBreaks></Options></ReportTemplate>";
const QByteArray traverse = "<ReportTemplate><Name>TRAVERSE</Name><Title>Traverse Report</Title></ReportTemplate>";

} // namespace

void UXmlReportTplTest::expectNothingRead(const UXmlReportTpl &tpl, const char *reason)
{
    EXPECT_EQ(xml(tpl), QString()) << reason;
    EXPECT_EQ(name(tpl), QString()) << reason;
    EXPECT_EQ(tpl.GetTemplateTitle(), QString()) << reason;
    for (const auto fill :
         {&UXmlReportTpl::GetAllTPLsByName, &UXmlReportTpl::GetAllTPLsByTitle, &UXmlReportTpl::GetAllTables,
          &UXmlReportTpl::GetAllBlocks, &UXmlReportTpl::GetAllDictionaries})
    {
        EXPECT_EQ(list(fill, tpl), QStringList()) << reason;
    }
    EXPECT_EQ(tpl.GetTable(QStringLiteral("Points")), nullptr) << reason;
    EXPECT_EQ(tpl.GetDictionary(QStringLiteral("PointDic")), nullptr) << reason;
    EXPECT_EQ(tpl.GetSortList(QStringLiteral("Points")), nullptr) << reason;
    EXPECT_EQ(tpl.GetSeparatorXmlOption(), ' ') << reason;
    EXPECT_TRUE(tpl.GetPageBreakXmlOption()) << reason;
}

TEST_F(UXmlReportTplTest, IsEmptyAfterConstruction)
{
    expectNothingRead(UXmlReportTpl(), "nothing was loaded");
}

TEST_F(UXmlReportTplTest, ChoosesATemplateOfAFileByItsNameInAnyCase)
{
    const LoadedTemplate first(stakeout + traverse, QStringLiteral("stakeout"));
    ASSERT_TRUE(first.loaded);
    EXPECT_EQ(first.tpl.GetTemplateTitle(), QStringLiteral("Stakeout Report"));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTPLsByName, first.tpl),
              QStringList({QStringLiteral("STAKEOUT"), QStringLiteral("TRAVERSE")}));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTPLsByTitle, first.tpl),
              QStringList({QStringLiteral("Stakeout Report"), QStringLiteral("Traverse Report")}));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTables, first.tpl), QStringList(QStringLiteral("Points")));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllDictionaries, first.tpl), QStringList(QStringLiteral("PointDic")));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllBlocks, first.tpl), QStringList());
    EXPECT_EQ(first.tpl.GetSeparatorXmlOption(), '|');
    EXPECT_FALSE(first.tpl.GetPageBreakXmlOption());
    EXPECT_EQ(first.tpl.GetOption()->Separator, '|');
    EXPECT_FALSE(first.tpl.GetOption()->PageBreaks);
    EXPECT_EQ(name(first.tpl), QStringLiteral("stakeout")) << "as it was asked for";

    const LoadedTemplate second(stakeout + traverse, QStringLiteral("Traverse"));
    ASSERT_TRUE(second.loaded);
    EXPECT_EQ(second.tpl.GetTemplateTitle(), QStringLiteral("Traverse Report"));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTables, second.tpl), QStringList()) << "the other template's tables";
}

TEST_F(UXmlReportTplTest, KeepsTheChosenBodyWithItsNameAndTitle)
{
    const LoadedTemplate loaded("text before" + traverse + stakeout, QStringLiteral("TRAVERSE"));
    EXPECT_EQ(xml(loaded.tpl), QStringLiteral("<Name>TRAVERSE</Name><Title>Traverse Report</Title>"));
}

TEST_F(UXmlReportTplTest, OfTwoTemplatesOfOneNameTheLastIsChosenAndBothAreListed)
{
    const LoadedTemplate loaded("<ReportTemplate><Name>T</Name><Title>first</Title>"
                                "<Tables><Table><Name>A</Name></Table></Tables></ReportTemplate>"
                                "<ReportTemplate><Name>t</Name><Title>second</Title>"
                                "<Tables><Table><Name>B</Name></Table></Tables></ReportTemplate>");
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTables, loaded.tpl), QStringList(QStringLiteral("B")));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTPLsByName, loaded.tpl),
              QStringList({QStringLiteral("T"), QStringLiteral("t")}));
    EXPECT_EQ(loaded.tpl.GetTemplateTitle(), QStringLiteral("first")) << "the title is the first one's of the name";
}

TEST_F(UXmlReportTplTest, FailsAndHoldsNothingWithoutTheRequestedTemplate)
{
    const struct
    {
        QByteArray content;
        const char *name;
        const char *reason;
    } rows[] = {
        {stakeout + traverse, "LEVELS", "no template of that name, so the lists are empty as well"},
        {stakeout + traverse, "STAKE", "only the begin of a name"},
        {stakeout + traverse, "STAKEOUT ", "a blank more than the name"},
        {stakeout + traverse, "", "no name"},
        {"", "STAKEOUT", "an empty file"},
        {"\r\n\t", "STAKEOUT", "nothing but line ends"},
        {"<Name>STAKEOUT</Name>", "STAKEOUT", "no template around the name"},
        {"<ReportTemplate><Title>STAKEOUT</Title></ReportTemplate>", "STAKEOUT", "a title is not a name"},
        {"<ReportTemplate></ReportTemplate>" + stakeout, "STAKEOUT", "an empty template ends the list"},
        {"<ReportTemplate ><Name>STAKEOUT</Name></ReportTemplate>", "STAKEOUT", "a blank makes it no tag"},
    };
    for (const auto &row : rows) {
        LoadedTemplate loaded(stakeout, QStringLiteral("STAKEOUT"));
        ASSERT_TRUE(loaded.loaded);
        const TemplateOnDisk file(row.content);
        EXPECT_FALSE(loaded.tpl.LoadTemplate(file.path(), QString::fromLatin1(row.name))) << row.reason;
        expectNothingRead(loaded.tpl, row.reason);
    }
}

TEST_F(UXmlReportTplTest, FailsAndHoldsNothingWithoutAFile)
{
    LoadedTemplate loaded(stakeout, QStringLiteral("STAKEOUT"));
    ASSERT_TRUE(loaded.loaded);
    const QTemporaryDir folder;
    EXPECT_FALSE(loaded.tpl.LoadTemplate(folder.filePath(QStringLiteral("missing.xml")), QStringLiteral("STAKEOUT")));
    expectNothingRead(loaded.tpl, "the file is missing");
}

TEST_F(UXmlReportTplTest, LoadingAgainReplacesEverything)
{
    LoadedTemplate loaded(stakeout, QStringLiteral("STAKEOUT"));
    const TemplateOnDisk file(traverse);
    ASSERT_TRUE(loaded.tpl.LoadTemplate(file.path(), QStringLiteral("TRAVERSE")));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTPLsByName, loaded.tpl), QStringList(QStringLiteral("TRAVERSE")));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTables, loaded.tpl), QStringList());
    EXPECT_EQ(list(&UXmlReportTpl::GetAllDictionaries, loaded.tpl), QStringList());
    EXPECT_EQ(loaded.tpl.GetTable(QStringLiteral("Points")), nullptr);
    EXPECT_EQ(loaded.tpl.GetSortList(QStringLiteral("Points")), nullptr);
    EXPECT_TRUE(loaded.tpl.GetPageBreakXmlOption());
}

TEST_F(UXmlReportTplTest, ValuesLoseTabsAndLineEnds)
{
    const LoadedTemplate loaded(
        "<Report\r\nTemplate>\r\n\t<Name>\r\nT\r\n</Name>\r\n\t<Title>\tA\tlong \r\ntitle </Title>"
        "\r\n</ReportTemplate>\r\n");
    ASSERT_TRUE(loaded.loaded);
    EXPECT_EQ(loaded.tpl.GetTemplateTitle(), QStringLiteral("Along title "));
}

TEST_F(UXmlReportTplTest, NameClosedByTheShortFormDropsFourCharacters)
{
    const LoadedTemplate dropped("<ReportTemplate><Name>T</>1234<Title>kept</Title></ReportTemplate>");
    ASSERT_TRUE(dropped.loaded);
    EXPECT_EQ(dropped.tpl.GetTemplateTitle(), QStringLiteral("kept"));
    const LoadedTemplate torn("<ReportTemplate><Name>T</><Title>lost</Title></ReportTemplate>");
    ASSERT_TRUE(torn.loaded);
    EXPECT_EQ(torn.tpl.GetTemplateTitle(), QString()) << "the dropped characters begin the next tag";
}

TEST_F(UXmlReportTplTest, NameAfterTheTablesIsNotTheTemplates)
{
    const LoadedTemplate loaded("<ReportTemplate><Tables><Table><Name>Points</Name></Table></Tables><Name>T</Name>"
                                "</ReportTemplate>");
    EXPECT_FALSE(loaded.loaded);
    const LoadedTemplate byTable("<ReportTemplate><Tables><Table><Name>Points</Name></Table></Tables><Name>T</Name>"
                                 "</ReportTemplate>",
                                 QStringLiteral("Points"));
    EXPECT_TRUE(byTable.loaded) << "the first name in it is the table's";
}

TEST_F(UXmlReportTplTest, ReadsBothEncodings)
{
    for (const char *title : {"Levé", "Lev\xE9"}) {
        const LoadedTemplate loaded(QByteArray("<ReportTemplate><Name>T</Name><Title>") + title +
                                    "</Title></ReportTemplate>");
        ASSERT_TRUE(loaded.loaded);
        EXPECT_EQ(loaded.tpl.GetTemplateTitle(), QStringLiteral("Levé"));
    }
}

TEST_F(UXmlReportTplTest, ReadsTheOptions)
{
    const struct
    {
        QByteArray content;
        int separator;
        bool pageBreaks;
        const char *reason;
    } rows[] = {
        {"", 0, true, "no options: the character 0, not a blank"},
        {"<Options></Options>", 0, true, "empty options"},
        {"<Options><PageBreaks>NO</PageBreaks></Options>", 0, false, "no separator"},
        {"<Options><Separator></Separator></Options>", 0, true, "an empty separator"},
        {"<Options><Separator>9</Separator></Options>", 9, true, "the code of a tab"},
        {"<Options><Separator>300</Separator></Options>", ' ', true, "beyond the codes"},
        {"<Options><Separator>-1</Separator></Options>", ' ', true, "below the codes"},
        {"<Options><Separator>,</Separator></Options>", ',', true, "a character"},
        {"<Options><Separator>0</Separator></Options>", 0, true, "the code 0"},
        {"<Options><Separator>\t</Separator></Options>", 0, true, "a tab itself is gone before it is read"},
        {"<Options><PageBreaks>no</PageBreaks><Separator>;</Separator></Options>", ';', false, "any order, any case"},
        {"<Options><PageBreaks>No</PageBreaks></Options>", 0, false, "any case"},
        {"<Options><PageBreaks>No page breaks</PageBreaks></Options>", 0, true, "only the word alone"},
        {"<Options><PageBreaks> NO</PageBreaks></Options>", 0, true, "values are not trimmed"},
        {"<Options><PageBreaks></PageBreaks></Options>", 0, true, "an empty element"},
        {"<Options><Separator>|</><PageBreaks>NO</PageBreaks></Options>", '|', false,
         "nothing is cut out of the options, so a short closing tag drops nothing"},
        {"<Options><PageBreaks>NO</PageBreaks></Options><Options><Separator>|</Separator></Options>", 0, false,
         "the first options alone"},
    };
    for (const auto &row : rows) {
        const LoadedTemplate loaded("<ReportTemplate><Name>T</Name>" + row.content + "</ReportTemplate>");
        ASSERT_TRUE(loaded.loaded) << row.reason;
        EXPECT_EQ(static_cast<unsigned char>(loaded.tpl.GetSeparatorXmlOption()), row.separator) << row.reason;
        EXPECT_EQ(loaded.tpl.GetPageBreakXmlOption(), row.pageBreaks) << row.reason;
    }
}

TEST_F(UXmlReportTplTest, TakesATextAsItIsForTheNameItHas)
{
    UXmlReportTpl tpl;
    setName(tpl, QStringLiteral("T"));
    EXPECT_TRUE(
        setXml(tpl, QStringLiteral("x<ReportTemplate><Name>T</Name><Title>a\tb\r\nc</Title></ReportTemplate>")));
    EXPECT_EQ(name(tpl), QStringLiteral("T"));
    EXPECT_EQ(tpl.GetTemplateTitle(), QStringLiteral("a\tb\r\nc")) << "nothing is stripped";
    EXPECT_EQ(xml(tpl), QStringLiteral("<Name>T</Name><Title>a\tb\r\nc</Title>"));
    EXPECT_FALSE(setXml(tpl, QString()));
    EXPECT_EQ(name(tpl), QStringLiteral("T"));
}

TEST_F(UXmlReportTplTest, ATextWithoutTheNamedTemplateStaysWithTheListOfItsTemplates)
{
    UXmlReportTpl tpl;
    setName(tpl, QStringLiteral("LEVELS"));
    const QString text = QString::fromUtf8(stakeout + traverse);
    EXPECT_FALSE(setXml(tpl, text));
    EXPECT_EQ(xml(tpl), text);
    EXPECT_EQ(name(tpl), QStringLiteral("LEVELS"));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTPLsByName, tpl).join(u' '), QStringLiteral("STAKEOUT TRAVERSE"));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTables, tpl), QStringList());
    EXPECT_EQ(tpl.GetTemplateTitle(), QString()) << "the list does not hold the name";
}

TEST_F(UXmlReportTplTest, WithoutANameATemplateWithoutOneIsTaken)
{
    UXmlReportTpl tpl;
    EXPECT_TRUE(setXml(tpl, QStringLiteral("<ReportTemplate><Title>untitled</Title></ReportTemplate>")));
    EXPECT_EQ(tpl.GetTemplateTitle(), QStringLiteral("untitled"));
}

TEST_F(UXmlReportTplTest, CleaningKeepsTheTextOnlyWhenAsked)
{
    LoadedTemplate loaded(stakeout, QStringLiteral("STAKEOUT"));
    ASSERT_TRUE(loaded.loaded);
    const QString body = xml(loaded.tpl);
    clean(loaded.tpl, true);
    EXPECT_EQ(xml(loaded.tpl), body);
    EXPECT_EQ(name(loaded.tpl), QStringLiteral("STAKEOUT"));
    EXPECT_EQ(list(&UXmlReportTpl::GetAllTables, loaded.tpl), QStringList());
    EXPECT_EQ(loaded.tpl.GetSeparatorXmlOption(), ' ');
    clean(loaded.tpl, false);
    expectNothingRead(loaded.tpl, "cleaned");
}
