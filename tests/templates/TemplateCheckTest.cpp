#include "CheckedTemplate.h"

#include <gtest/gtest.h>

namespace
{

struct Row
{
    const char *was;
    const char *now;
    ExpectedRemarks remarks;
    const char *reason;
};

TEST(TemplateCheck, SaysNothingAboutACleanTemplate)
{
    expectRemarks(cleanTemplate, {}, "clean");
}

TEST(TemplateCheck, SaysNothingAboutWhatIsReadAsItLooks)
{
    const Row rows[] = {
        {"<Title>Stakeout</Title>", "", {}, "no title"},
        {"</Options>", "<PageBreaks>NO</PageBreaks></Options>", {}, "page breaks off"},
        {"<Separator>|</Separator>",
         "<Separator>|</><PageBreaks>NO</PageBreaks>",
         {},
         "nothing is cut out of the options, so a short closing tag drops nothing"},
        {"<Separator>|</Separator>", "<Separator>9</Separator>", {}, "the separator's code"},
        {"<Title>Stakeout</Title>", "<Title>a < b & c > d</Title>", {}, "signs that are neither tags nor entities"},
        {"<Title>Stakeout</Title>", "<Title>Stakeout</>     ", {}, "a short closing tag with room after it"},
        {"<Align>RIGHT</Align>", "<Align>center</Align>", {}, "a centred column"},
        {"<Label>North</Label><Format>12.3</Format>", "<Label>North</Label>", {}, "a column as wide as its label"},
        {"<Label>Point</Label><Format>8</Format>", "<Label>Point</Label><Format>5</Format>", {}, "a label that fits"},
        {"    <Dictionaries>", "    <Unknown a=\"1\"/>\n    <Dictionaries>", {}, "an element of another kind"},
        {"<VariableName>FILLER", "<VariableName>suffix_+", {}, "a marker needs no variable"},
    };
    for (const Row &row : rows) {
        expectRemarks(changedTemplate(row.was, row.now), row.remarks, row.reason);
    }
}

TEST(TemplateCheck, NameAndTitleMayComeAfterTheDictionaries)
{
    QString text = cleanTemplate;
    const QString head = QStringLiteral("    <Name>STAKEOUT</Name>\n    <Title>Stakeout</Title>\n");
    const qsizetype from = text.indexOf(QStringLiteral("    <Dictionaries>"));
    const QString dictionaries = text.sliced(from, text.indexOf(QStringLiteral("    <Blocks>")) - from);
    text.remove(dictionaries);
    text.replace(head, dictionaries + head);
    expectRemarks(text, {}, "a dictionary holds no name that could be taken for the template's");
}

TEST(TemplateCheck, RemarksOnTags)
{
    const char *const title = "<Title>Stakeout</Title>";
    const Row rows[] = {
        {title,
         "¦<Title lang=\"en\">Stakeout</Title>",
         {{"error", "<Title lang=\"en\"> is not a tag: a tag has no blanks and no attributes"}},
         "an attribute"},
        {title,
         "¦<Title >Stakeout</Title>",
         {{"error", "<Title > is not a tag: a tag has no blanks and no attributes"}},
         "a blank"},
        {title,
         "¦<Title>Stakeout¦</Title >",
         {{"error", "<Title> is not read: its closing tag was expected"},
          {"error", "</Title > is not a tag: a tag has no blanks and no attributes"}},
         "a blank in the closing tag"},
        {title,
         "</Title>¦<Title>Stakeout</Title>",
         {{"error", "<Title> is not read: a closing tag of that name comes before it"}},
         "closed before it is opened"},
        {title,
         "<Title>Stake¦<Title>out</Title>",
         {{"error", "<Title> is inside another <Title>: the outer one ends at the first closing tag"}},
         "an element cut short by the first closing tag"},
        {"<Label>Point</Label><Format>8</Format>",
         "<Label>Point</Label><Format>8</>¦123456",
         {{"warning", "\"123456\" is dropped with the short closing tag of <Format>"}},
         "characters after a short closing tag"},
        {title, "<Title>Stakeout</>12345", {}, "after the part that is read last nothing is lost"},
        {"          <Field><VariableName>FILLER",
         "          ¦<Field></Field><Field><VariableName>FILLER",
         {{"error", "an empty <Field> ends its list: what follows in the list is not read"}},
         "an empty element ends its list"},
        {"<!-- what a surveyor needs -->",
         "<!-- ¦<Separator> -->",
         {{"warning", "<Separator> is read although it is in a comment"}},
         "a tag in a comment"},
    };
    for (const Row &row : rows) {
        expectRemarks(changedTemplate(row.was, row.now), row.remarks, row.reason);
    }
}

TEST(TemplateCheck, RemarksOnTemplatesAndTheirNames)
{
    const char *const none = "no template was read: a <ReportTemplate> element was expected";
    const struct
    {
        QString text;
        ExpectedRemarks remarks;
        const char *reason;
    } rows[] = {
        {QStringLiteral("¦"), {{"error", none}}, "an empty file"},
        {QStringLiteral("¦just a text\nof two lines\n"), {{"error", none}}, "no template in it"},
        {QStringLiteral("\n  ¦<ReportTemplate><Options><Separator>|</Separator></Options></ReportTemplate>"),
         {{"error", "the template has no <Name>, so it cannot be chosen"}},
         "a template without any name"},
        {QStringLiteral("<ReportTemplate><Name>A</Name><Separator>|</Separator>\n<Options><Separator>|</Separator>"
                        "</Options></ReportTemplate>\n<ReportTemplate>\n ¦<Name>a</Name><Options><Separator>|"
                        "</Separator></Options></ReportTemplate>"),
         {{"warning", "a template named \"a\" comes before this one: the last one of a name is read"}},
         "two templates of one name, in any case"},
        {QStringLiteral("<ReportTemplate><Name>A</Name><Options><Separator>|</Separator></Options></ReportTemplate>\n"
                        "¦<ReportTemplate></ReportTemplate>\n<ReportTemplate><Name>B</Name></ReportTemplate>"),
         {{"error", "an empty <ReportTemplate> ends its list: what follows in the list is not read"}},
         "an empty template"},
        {changedTemplate("    <Name>STAKEOUT</Name>\n", "")
             .replace(QStringLiteral("<Name>Points"), QStringLiteral("¦<Name>Points")),
         {{"error", "the template's own <Name> must come before <Tables>: this one was taken for it"}},
         "no name but that of a table"},
        {changedTemplate("    <Name>STAKEOUT</Name>\n", "")
             .replace(QStringLiteral("<Name>Points"), QStringLiteral("¦<Name>Points"))
             .replace(QStringLiteral("    <Options>"), QStringLiteral("    <Name>STAKEOUT</Name>\n    <Options>")),
         {{"error", "the template's own <Name> must come before <Tables>: this one was taken for it"}},
         "the name comes after the tables"},
        {changedTemplate("<Name>STAKEOUT</Name>", "<Name>STAKEOUT</>")
             .replace(QStringLiteral("<Name>Points"), QStringLiteral("¦<Name>Points")),
         {{"error", "<Name> is inside another <Name>: the outer one ends at the first closing tag"}},
         "a short closing tag where a full one of the name follows: the name runs on"},
        {changedTemplate("<Separator>|</Separator>", "")
             .replace(QStringLiteral("<Options>"), QStringLiteral("¦<Options>")),
         {{"warning", "no <Separator>: the columns are separated by the character 0"}},
         "no separator"},
        {changedTemplate("<Separator>|", "<Separator>")
             .replace(QStringLiteral("<Options>"), QStringLiteral("¦<Options>")),
         {{"warning", "no <Separator>: the columns are separated by the character 0"}},
         "an empty separator"},
        {QStringLiteral(" ¦<ReportTemplate><Name>A</Name></ReportTemplate>"),
         {{"warning", "no <Separator>: the columns are separated by the character 0"}},
         "no options"},
    };
    for (const auto &row : rows) {
        expectRemarks(row.text, row.remarks, row.reason);
    }
}

TEST(TemplateCheck, RemarksOnEntitiesInPrintedTexts)
{
    for (const char *entity : {"&amp;", "&lt;", "&gt;", "&quot;", "&apos;", "&#", "<![CDATA["}) {
        const std::string remark = std::string(entity) + " is printed unchanged";
        const ExpectedRemarks expected{{"warning", remark.c_str()}};
        const QByteArray marked = QByteArray("¦") + entity;
        expectRemarks(changedTemplate("<Title>Stakeout", "<Title>Stake " + marked), expected, entity);
        expectRemarks(changedTemplate("<Label>A label: ", "<Label>A " + marked), expected, entity);
        expectRemarks(changedTemplate("<Label>Point</Label><Format>8</Format>",
                                      "<Label>P" + marked + "</Label><Format>20</Format>"),
                      expected, entity);
    }
}

TEST(TemplateCheck, CountsLinesAndColumnsAsAnEditorDoes)
{
    const ExpectedRemarks expected{{"warning", "&amp; is printed unchanged"}};
    const struct
    {
        const char *title;
        const char *reason;
    } rows[] = {
        {"<Title>\n¦&amp;</Title>", "the first column of a line"},
        {"<Title>\t\t¦&amp;</Title>", "a tab is one column"},
        {"<Title>é点\U0001F600¦&amp;</Title>", "a character is one column, in however many bytes"},
        {"<Title>a\nb\n\nc\r\n  ¦&amp;</Title>", "line ends inside a value"},
        {"<Title>x ¦&am\np;</Title>", "a line end inside of what is remarked"},
    };
    for (const auto &row : rows) {
        expectRemarks(changedTemplate("<Title>Stakeout</Title>", row.title), expected, row.reason);
        QString windows = changedTemplate("<Title>Stakeout</Title>", row.title);
        expectRemarks(windows.replace(u'\n', QStringLiteral("\r\n")), expected,
                      std::string(row.reason) + ", with CR LF");
    }
}

TEST(TemplateCheck, CountsColumnsInAFileThatIsNotUtf8)
{
    QString text = changedTemplate("<Title>Stakeout</Title>", "<Title>é¦&amp;</Title>");
    const auto places = takeMarks(text);
    const auto remarks = kareport::checkTemplates(kareport::TemplateFile(text.toLatin1()));
    ASSERT_EQ(remarks.size(), 1U);
    EXPECT_EQ(remarks[0].place.line, places[0].line);
    EXPECT_EQ(remarks[0].place.column, places[0].column);
}

TEST(TemplateCheck, ShowsTheRemarksInTheOrderOfTheFile)
{
    QString text = changedTemplate("<Title>Stakeout</Title>", "¦<Title >Stakeout</Title>");
    text.replace(QStringLiteral("<Type>Coordinate"), QStringLiteral("¦<Type>Kilogram"));
    text.replace(QStringLiteral("<VariableName>northing"), QStringLiteral("¦<VariableName>northing"));
    text.replace(QStringLiteral("<Field><VariableName>Northing"), QStringLiteral("<Field>¦<VariableName>Northing"));
    expectRemarks(text,
                  {{"error", "<Title > is not a tag: a tag has no blanks and no attributes"},
                   {"error", "the dictionary has no variable \"Northing\": the column cannot be filled"},
                   {"error", "unknown type \"Kilogram\": the variable \"Northing\" is left out"},
                   {"error", "the dictionary has no variable \"northing\": the line repeats the value before it"}},
                  "four remarks of three kinds");
}

} // namespace
