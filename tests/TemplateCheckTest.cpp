#include "TemplateCheck.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <vector>

using kareport::checkTemplates;
using kareport::TemplateFile;
using kareport::TemplateRemark;
using kareport::TextPlace;

namespace
{

const QString clean = QStringLiteral(R"(<?xml version="1.0"?>
<Templates>
  <!-- what a surveyor needs -->
  <ReportTemplate>
    <Name>STAKEOUT</Name>
    <Title>Stakeout</Title>
    <Tables>
      <Table>
        <Name>Points</Name>
        <Use>pointdic</Use>
        <Sort><VariableName>Number</VariableName></Sort>
        <OutputList>
          <Field><VariableName>Number</VariableName><Label>Point</Label><Format>8</Format></Field>
          <Field><VariableName>FILLER</VariableName></Field>
          <Field><VariableName>Northing</VariableName><Label>North</Label><Format>12.3</Format><Align>RIGHT</Align></Field>
        </OutputList>
      </Table>
    </Tables>
    <Dictionaries>
      <Dictionary>
        <DictionaryName>PointDic</DictionaryName>
        <VariableList>
          <Variable><ID>1</ID><VariableName>Number</VariableName><Type>NUMBER</Type></Variable>
          <Variable><ID>2</ID><VariableName>Northing</VariableName><Type>Coordinate</Type></Variable>
        </VariableList>
      </Dictionary>
    </Dictionaries>
    <Blocks>
      <Block>
        <Name>Site</Name>
        <Use>PointDic</Use>
        <OutputList>
          <Field><VariableName>northing</VariableName><Label>A label: </Label><Format>3</Format><Align>left</Align></Field>
        </OutputList>
      </Block>
    </Blocks>
    <Options>
      <Separator>|</Separator>
    </Options>
  </ReportTemplate>
</Templates>
)");

constexpr char16_t mark = u'¦';

/// Takes the marks out of a text and tells their lines and columns.
std::vector<std::pair<qsizetype, qsizetype>> takeMarks(QString &text)
{
    std::vector<std::pair<qsizetype, qsizetype>> places;
    for (qsizetype at = text.indexOf(mark); at >= 0; at = text.indexOf(mark)) {
        text.remove(at, 1);
        const QString before = text.first(at);
        places.emplace_back(before.count(u'\n') + 1, before.sliced(before.lastIndexOf(u'\n') + 1).toUcs4().size() + 1);
    }
    return places;
}

std::vector<TemplateRemark> check(const QByteArray &bytes)
{
    return checkTemplates(TemplateFile(bytes));
}

/// A change of the clean template, with a mark at the place of every remark, in order.
struct Row
{
    const char *was;
    const char *now;
    std::vector<std::pair<const char *, const char *>> remarks; ///< "error" or "warning", and the text
    const char *reason;
};

void expectRemarks(const Row &row, const char *content = nullptr)
{
    QString text = clean;
    if (content == nullptr) {
        const QString was = QString::fromUtf8(row.was);
        ASSERT_EQ(text.count(was), 1) << row.reason;
        text.replace(was, QString::fromUtf8(row.now));
    } else {
        text = QString::fromUtf8(content);
    }
    const auto places = takeMarks(text);
    ASSERT_EQ(places.size(), row.remarks.size()) << row.reason;
    const auto remarks = check(text.toUtf8());
    ASSERT_EQ(remarks.size(), places.size())
        << row.reason << (remarks.empty() ? QString() : remarks.back().text).toStdString();
    for (std::size_t i = 0; i < remarks.size(); ++i) {
        EXPECT_EQ(remarks[i].text, QString::fromUtf8(row.remarks[i].second)) << row.reason;
        EXPECT_STREQ(remarks[i].isError ? "error" : "warning", row.remarks[i].first) << row.reason;
        EXPECT_EQ(remarks[i].place.line, places[i].first) << row.reason;
        EXPECT_EQ(remarks[i].place.column, places[i].second) << row.reason;
    }
}

TEST(TemplateCheck, SaysNothingAboutACleanTemplate)
{
    for (const TemplateRemark &remark : check(clean.toUtf8())) {
        ADD_FAILURE() << remark.place.line << ':' << remark.place.column << ": " << remark.text.toStdString();
    }
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
        {"<Name>STAKEOUT</Name>", "<Name>STAKEOUT</>    ", {}, "a short closing tag with room behind it"},
        {"<Align>RIGHT</Align>", "<Align>center</Align>", {}, "a centred column"},
        {"<Label>North</Label><Format>12.3</Format>", "<Label>North</Label>", {}, "a column as wide as its label"},
        {"<Label>Point</Label><Format>8</Format>", "<Label>Point</Label><Format>5</Format>", {}, "a label that fits"},
        {"    <Dictionaries>", "    <Unknown a=\"1\"/>\n    <Dictionaries>", {}, "an element of another kind"},
    };
    for (const Row &row : rows) {
        expectRemarks(row);
    }
}

TEST(TemplateCheck, NameAndTitleMayStandBehindTheDictionaries)
{
    QString text = clean;
    const QString head = QStringLiteral("    <Name>STAKEOUT</Name>\n    <Title>Stakeout</Title>\n");
    const qsizetype from = text.indexOf(QStringLiteral("    <Dictionaries>"));
    const qsizetype to = text.indexOf(QStringLiteral("    <Blocks>"));
    const QString dictionaries = text.sliced(from, to - from);
    text.remove(from, to - from);
    text.replace(head, dictionaries + head);
    for (const TemplateRemark &remark : check(text.toUtf8())) {
        ADD_FAILURE() << "a dictionary holds no name of its own: " << remark.text.toStdString();
    }
}

TEST(TemplateCheck, RemarksOnTags)
{
    const Row rows[] = {
        {"<Title>Stakeout</Title>",
         "¦<Title lang=\"en\">Stakeout</Title>",
         {{"error", "<Title lang=\"en\"> is no tag: a tag has no blanks and no attributes"}},
         "an attribute"},
        {"<Title>Stakeout</Title>",
         "¦<Title >Stakeout</Title>",
         {{"error", "<Title > is no tag: a tag has no blanks and no attributes"}},
         "a blank"},
        {"<Title>Stakeout</Title>",
         "¦<Title>Stakeout¦</Title >",
         {{"error", "<Title> is not read: its closing tag was expected"},
          {"error", "</Title > is no tag: a tag has no blanks and no attributes"}},
         "a blank in the closing tag"},
        {"<Title>Stakeout</Title>",
         "</Title>¦<Title>Stakeout</Title>",
         {{"error", "<Title> is not read: a closing tag of that name stands before it"}},
         "closed before it is opened"},
        {"<Title>Stakeout</Title>",
         "<Title>Stake¦<Title>out</Title>",
         {{"error", "<Title> stands in another <Title>: the outer one is cut short at the first closing tag"}},
         "an element cut short by the first closing tag"},
        {"<Name>STAKEOUT</Name>",
         "<Name>STAKEOUT</>¦1234",
         {{"warning", "\"1234\" is dropped with the short closing tag of <Name>"}},
         "characters behind a short closing tag"},
        {"          <Field><VariableName>FILLER",
         "¦<Field></Field><Field><VariableName>FILLER",
         {{"error", "an empty <Field> ends its list: what follows in the list is not read"}},
         "an empty element ends its list"},
        {"<!-- what a surveyor needs -->",
         "<!-- ¦<Separator> -->",
         {{"warning", "<Separator> is read although it stands in a comment"}},
         "a tag in a comment"},
    };
    for (const Row &row : rows) {
        expectRemarks(row);
    }
}

TEST(TemplateCheck, RemarksOnTemplates)
{
    const Row rows[] = {
        {"<Name>STAKEOUT</Name>", "", {}, ""},
    };
    (void)rows;
    expectRemarks(
        {"", "", {{"error", "no template was read: a <ReportTemplate> element was expected"}}, "an empty file"}, "¦");
    expectRemarks(
        {"", "", {{"error", "no template was read: a <ReportTemplate> element was expected"}}, "no template in it"},
        "¦just a text\nof two lines\n");
    expectRemarks({"", "", {{"error", "the template has no <Name>, so nobody can choose it"}}, "no name at all"},
                  "\n ¦<ReportTemplate><Options><Separator>|</Separator></Options></ReportTemplate>");
    expectRemarks({"",
                   "",
                   {{"warning", "a template named \"a\" stands before: the last one of a name is read"}},
                   "two of one name"},
                  "<ReportTemplate><Name>A</Name><Options><Separator>|</Separator></Options></ReportTemplate>\n"
                  "<ReportTemplate>¦<Name>a</Name><Options><Separator>|</Separator></Options></ReportTemplate>");
    expectRemarks({"",
                   "",
                   {{"error", "an empty <ReportTemplate> ends its list: what follows in the list is not read"}},
                   "an empty one"},
                  "<ReportTemplate><Name>A</Name><Options><Separator>|</Separator></Options></ReportTemplate>\n"
                  "¦<ReportTemplate></ReportTemplate>\n<ReportTemplate><Name>B</Name></ReportTemplate>\n");
}

} // namespace
