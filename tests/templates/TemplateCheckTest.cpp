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
        {"    <Dictionaries>", "    <!-- text --><?note text?>\n    <Dictionaries>", {}, "a comment, an instruction"},
        {"<Templates>", "<Templates version=\"2\"><Author>", {}, "elements around the templates"},
        {"<Templates>", "<ReportTemplates>", {}, "an element around the templates, which is nearly named as they are"},
        {"<Label>North</Label><Format>12.3</Format>", "<Label>North</Label><Format> 12.3 </Format>", {}, "blanks"},
        {"<Label>North</Label><Format>12.3</Format>", "<Label></Label><Format></Format>", {}, "no format"},
        {"<Format>3</Format>", "<Format>-3</Format>", {}, "a width below 0 fills on the right"},
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

TEST(TemplateCheck, RemarksOnWhatIsNotRead)
{
    const char *const title = "<Title>Stakeout</Title>";
    const char *const align = "<Align>RIGHT</Align>";
    const Row rows[] = {
        {align,
         "¦<Aling>RIGHT</Aling>",
         {{"error", "unknown element <Aling>: did you mean \"Align\"?"}},
         "a misspelt element, with its text"},
        {"<Separator>|</Separator>",
         "<Separator>|</Separator>¦<Pagebreak>NO</Pagebreak>",
         {{"error", "unknown element <Pagebreak>: did you mean \"PageBreaks\"?"}},
         "the beginning of a name"},
        {align,
         "¦<Unit>m</Unit>",
         {{"warning", "unknown element <Unit>: it is not read"}},
         "an element of another kind"},
        {align,
         "¦<Remark date=\"5\"/>",
         {{"warning", "unknown element <Remark>: it is not read"}},
         "one with an attribute and no content"},
        {align,
         "¦<Remark>¦see ¦<b>there</b> ¦and elsewhere</Remark>",
         {{"warning", "unknown element <Remark>: it is not read"},
          {"warning", "the text \"see\" is outside of all elements and is not read"},
          {"warning", "unknown element <b>: it is not read"},
          {"warning", "the text \"and elsewhere\" is outside of all elements and is not read"}},
         "one in another"},
        {"    <Dictionaries>",
         "    ¦<Fields><Sort></Sort></Fields><Dictionaries>",
         {{"warning", "unknown element <Fields>: did you mean \"Field\"?"}},
         "what is in it may be read all the same"},
        {align,
         "¦RIGHT",
         {{"warning", "the text \"RIGHT\" is outside of all elements and is not read"}},
         "text between elements"},
        {title,
         "<Title>Stakeout</Title> ¦of\n the harbour",
         {{"warning", "the text \"of the harbour\" is outside of all elements and is not read"}},
         "text after a value"},
        {"</Templates>",
         "</Templates>\n¦two lines\nof text\n",
         {{"warning", "no template follows: the last 17 characters, in 2 lines, are not read"}},
         "text after the last template"},
        {"<Templates>",
         "<Templates>\n  ¦text & more",
         {{"warning", "this text is in no template: 44 characters in 2 lines are not read"}},
         "text before the first template"},
        {"</Templates>",
         "  ¦<ReportTemplat><Name>B</Name></ReportTemplat></Templates>",
         {{"error", "unknown element <ReportTemplat>: did you mean \"ReportTemplate\"?"}},
         "a whole template that is not read"},
    };
    for (const Row &row : rows) {
        expectRemarks(changedTemplate(row.was, row.now), row.remarks, row.reason);
    }
}

TEST(TemplateCheck, AManyTimesMisspeltFileIsWalkedSoon)
{
    for (const char *piece :
         {"<Name>", "<x>", "</x>", "<", "< ", "<!-- ", "<Name", "a<b>c", "</>", "<ReportTemplat><Name>"})
    {
        const QString text = QStringLiteral("<ReportTemplate>") + QString::fromLatin1(piece).repeated(100'000);
        EXPECT_FALSE(kareport::checkTemplates(kareport::TemplateFile(text.toUtf8())).empty()) << piece;
    }
}

TEST(TemplateCheck, LeavesTheRemarksOnOneTemplate)
{
    const QString rest = QStringLiteral("<Options><Separator>|</Separator></Options></ReportTemplate>\n");
    const QString text = QStringLiteral("<ReportTemplate><Name>A</Name><Title>&amp;</Title>") + rest +
                         QStringLiteral("between\n<ReportTemplate><Name>B</Name>") + rest +
                         QStringLiteral("<ReportTemplate><Name>a</Name>text") + rest;
    const kareport::TemplateFile file(text.toUtf8());
    EXPECT_EQ(kareport::checkTemplates(file).size(), 4U);
    const auto ofOne = kareport::checkTemplates(file, {.name = QStringLiteral("A")});
    ASSERT_EQ(ofOne.size(), 2U) << "those on the last one of the name";
    EXPECT_EQ(ofOne[0].text.toStdString(),
              "a template named \"a\" comes before this one: the last one of a name is read");
    EXPECT_EQ(ofOne[1].text.toStdString(), "the text \"text\" is outside of all elements and is not read");
    EXPECT_TRUE(kareport::checkTemplates(file, {.name = QStringLiteral("B")}).empty());
    EXPECT_TRUE(kareport::checkTemplates(file, {.name = QStringLiteral("C")}).empty()) << "there is none";
}

TEST(TemplateCheck, ALabelWithPlaceholdersIsNotAsWideAsItLooks)
{
    const QString text = changedTemplate("<Label>Point</Label>", "<Label>Pt {lengthUnit}</Label>");
    const kareport::TemplateFile file(text.toUtf8());
    EXPECT_EQ(kareport::checkTemplates(file).size(), 1U);
    EXPECT_TRUE(kareport::checkTemplates(file, {.hasPlaceholders = true}).empty());
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
