#pragma once

#include "PrintQt.h"
#include "TemplateCheck.h"

#include <QList>

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

/// A template file without anything to remark.
inline const QString cleanTemplate = QStringLiteral(R"(<?xml version="1.0"?>
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

/// The clean template with one piece of it replaced.
inline QString changedTemplate(const char *was, const char *now)
{
    const QString piece = QString::fromUtf8(was);
    EXPECT_EQ(cleanTemplate.count(piece), 1) << was;
    QString text = cleanTemplate;
    return text.replace(piece, QString::fromUtf8(now));
}

struct ExpectedRemark
{
    const char *severity; ///< "error" or "warning"
    const char *text;
};
using ExpectedRemarks = std::vector<ExpectedRemark>;

/// Takes the marks "¦" out of a text and tells their lines and columns.
inline std::vector<kareport::TextPlace> takeMarks(QString &text)
{
    std::vector<kareport::TextPlace> places;
    for (qsizetype at = text.indexOf(u'¦'); at >= 0; at = text.indexOf(u'¦')) {
        text.remove(at, 1);
        const QString before = text.first(at);
        const QString line = before.sliced(before.lastIndexOf(u'\n') + 1);
        places.push_back({before.count(u'\n') + 1, line.toUcs4().size() + 1});
    }
    return places;
}

/// Checks a template and compares the remarks, one for every mark "¦" in the text, in their order.
inline void expectRemarks(QString text, const ExpectedRemarks &expected, const std::string &reason)
{
    const auto places = takeMarks(text);
    ASSERT_EQ(places.size(), expected.size()) << reason;
    const auto remarks = kareport::checkTemplates(kareport::TemplateFile(text.toUtf8()));
    std::string all;
    for (const auto &remark : remarks) {
        all += '\n' + std::to_string(remark.place.line) + ": " + remark.text.toStdString();
    }
    ASSERT_EQ(remarks.size(), expected.size()) << reason << all;
    for (std::size_t i = 0; i < remarks.size(); ++i) {
        EXPECT_EQ(remarks[i].text, QString::fromUtf8(expected[i].text)) << reason;
        EXPECT_STREQ(remarks[i].isError ? "error" : "warning", expected[i].severity) << reason;
        EXPECT_EQ(remarks[i].place.line, places[i].line) << reason << all;
        EXPECT_EQ(remarks[i].place.column, places[i].column) << reason << all;
    }
}
