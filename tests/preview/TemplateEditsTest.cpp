#include "TemplateEdits.h"

#include "PrintQt.h"
#include "TemplateCheck.h"
#include "TemplateFile.h"
#include "TextDifference.h"

#include <QFile>

#include <gtest/gtest.h>

namespace
{

using kareport::EditedTemplate;
using kareport::outlineOf;
using kareport::withDictionary;
using kareport::withField;
using kareport::withOutput;
using kareport::withRenamedVariable;

QString survey()
{
    QFile file(QStringLiteral(KAREPORT_EXAMPLES_DIR "/survey.xml"));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    return QString::fromUtf8(file.readAll());
}

/// What the check says of a text.
QStringList remarksOn(const QString &text)
{
    const QByteArray bytes = text.toUtf8();
    QStringList found;
    for (const auto &remark : kareport::checkTemplates(kareport::TemplateFile{QByteArrayView(bytes)})) {
        found.append(remark.text);
    }
    return found;
}

TEST(TemplateEdits, AFieldIsWrittenAsTheOneBeforeIt)
{
    const QString text = survey();
    const qsizetype at = text.indexOf(QStringLiteral("<Label>Point</Label>"));
    const EditedTemplate edited = withField(text, at);
    EXPECT_TRUE(edited.problem.isEmpty());
    const auto change = kareport::differenceOf(text, edited.text);
    EXPECT_EQ(change.removed, 0) << "all that was there is there";
    EXPECT_EQ(edited.text.count(u'\n'), text.count(u'\n') + 1);
    const auto before = outlineOf(text).templates[0].outputs[0].fields;
    const auto after = outlineOf(edited.text).templates[0].outputs[0].fields;
    ASSERT_EQ(after.size(), before.size() + 1);
    EXPECT_EQ(after[1].variable.text, QStringLiteral("Number")) << "all variables are shown: the first one again";
    EXPECT_EQ(after[2].variable.text, before[1].variable.text);
    EXPECT_EQ(edited.text.mid(edited.selection.begin, edited.selection.size()), after[1].label.text);
    EXPECT_TRUE(edited.text.mid(after[1].element.begin - 5, 5) == QStringLiteral("\n\t\t\t\t") ||
                edited.text.mid(after[1].element.begin - 5, 5).endsWith(QStringLiteral("\t\t\t\t")));
    EXPECT_TRUE(remarksOn(edited.text).isEmpty()) << remarksOn(edited.text).join(u'\n').toStdString();
    EXPECT_FALSE(withField(text, 0).problem.isEmpty());
    EXPECT_EQ(withField(text, 0).text, text);
}

TEST(TemplateEdits, ATableAndABlockComeWithTheFieldsOfADictionary)
{
    const QString text = survey();
    for (const bool isTable : {true, false}) {
        const EditedTemplate edited = withOutput(text, text.indexOf(QStringLiteral("<Use>")), isTable);
        EXPECT_TRUE(edited.problem.isEmpty());
        EXPECT_EQ(kareport::differenceOf(text, edited.text).removed, 0);
        const auto outline = outlineOf(edited.text).templates[0];
        const auto *made = outline.output(isTable, isTable ? u"Table1" : u"Block1");
        ASSERT_NE(made, nullptr);
        EXPECT_EQ(made->fields.size(), 7U);
        EXPECT_EQ(edited.text.mid(edited.selection.begin, edited.selection.size()), made->name.text);
        EXPECT_TRUE(remarksOn(edited.text).isEmpty()) << remarksOn(edited.text).join(u'\n').toStdString();
    }
}

TEST(TemplateEdits, WhatIsMissingIsInsertedAsWell)
{
    const EditedTemplate table = withOutput(QString(), 0, true);
    EXPECT_EQ(table.text.toStdString(), "<ReportTemplate>\n"
                                        "\t<Name>Template1</Name>\n"
                                        "\t<Title>Report</Title>\n"
                                        "\t<Tables>\n"
                                        "\t\t<Table>\n"
                                        "\t\t\t<Name>Table1</Name>\n"
                                        "\t\t\t<Use>Dictionary1</Use>\n"
                                        "\t\t\t<OutputList>\n"
                                        "\t\t\t\t<Field><VariableName>Variable1</VariableName><Label>Variable1</Label>"
                                        "<Format>20</Format><Align>LEFT</Align></Field>\n"
                                        "\t\t\t</OutputList>\n"
                                        "\t\t</Table>\n"
                                        "\t</Tables>\n"
                                        "\t<Dictionaries>\n"
                                        "\t\t<Dictionary>\n"
                                        "\t\t\t<DictionaryName>Dictionary1</DictionaryName>\n"
                                        "\t\t\t<VariableList>\n"
                                        "\t\t\t\t<Variable><ID>1</ID><VariableName>Variable1</VariableName>"
                                        "<Type>TEXT</Type></Variable>\n"
                                        "\t\t\t</VariableList>\n"
                                        "\t\t</Dictionary>\n"
                                        "\t</Dictionaries>\n"
                                        "\t<Options>\n"
                                        "\t\t<Separator>32</Separator>\n"
                                        "\t</Options>\n"
                                        "</ReportTemplate>\n");
    EXPECT_TRUE(remarksOn(table.text).isEmpty());
    const EditedTemplate dictionary = withDictionary(table.text, 40);
    EXPECT_EQ(outlineOf(dictionary.text).templates[0].dictionaryList.size(), 2U);
    EXPECT_EQ(dictionary.text.mid(dictionary.selection.begin, dictionary.selection.size()),
              QStringLiteral("Dictionary2"));
    const QString flat = QStringLiteral("<ReportTemplate><Name>N</Name><Tables></Tables></ReportTemplate>");
    const EditedTemplate into = withOutput(flat, 5, true);
    EXPECT_EQ(outlineOf(into.text).templates[0].outputs.size(), 1U) << into.text.toStdString();
}

TEST(TemplateEdits, RenamingAVariableRenamesItsUsesAndNothingElse)
{
    const QString text = survey();
    const qsizetype at = text.indexOf(QStringLiteral("<Sort><VariableName>Number")) + 22;
    const auto use = kareport::variableAt(outlineOf(text), at);
    ASSERT_TRUE(use);
    EXPECT_EQ(use->name, QStringLiteral("Number"));
    const EditedTemplate edited = withRenamedVariable(text, at, QStringLiteral("PointNo"));
    EXPECT_TRUE(edited.problem.isEmpty()) << edited.problem.toStdString();
    QString expected = text;
    const qsizetype end = text.indexOf(QStringLiteral("</ReportTemplate>"));
    QString first = text.left(end);
    const qsizetype count = first.count(QStringLiteral("<VariableName>Number</VariableName>"));
    EXPECT_EQ(count, 3) << "sort key, field and dictionary";
    first.replace(QStringLiteral("<VariableName>Number</VariableName>"),
                  QStringLiteral("<VariableName>PointNo</VariableName>"));
    EXPECT_EQ(edited.text, first + text.mid(end));
    EXPECT_EQ(edited.text.mid(edited.selection.begin, edited.selection.size()), QStringLiteral("PointNo"));
    for (const char *wrong : {"", " x", "a<b", "Northing", "FILLER"}) {
        EXPECT_FALSE(withRenamedVariable(text, at, QString::fromLatin1(wrong)).problem.isEmpty()) << wrong;
    }
    EXPECT_TRUE(withRenamedVariable(text, at, QStringLiteral("NUMBER")).problem.isEmpty())
        << "its own name in capitals";
}

} // namespace
