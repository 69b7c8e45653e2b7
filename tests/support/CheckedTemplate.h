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
QString changedTemplate(const char *was, const char *now);

struct ExpectedRemark
{
    const char *severity; ///< "error" or "warning"
    const char *text;
};
using ExpectedRemarks = std::vector<ExpectedRemark>;

/// Takes the marks "¦" out of a text and tells their lines and columns.
std::vector<kareport::TextPlace> takeMarks(QString &text);

/// Checks a template and compares the remarks, one for every mark "¦" in the text, in their order.
void expectRemarks(QString text, const ExpectedRemarks &expected, const std::string &reason);
