#include "TemplateCompletion.h"

#include "PrintQt.h"
#include "TemplateMarkup.h"

#include <gtest/gtest.h>

namespace
{

using kareport::completionsAt;

/// The template of the tests up to a mark, which is put where a piece of it is, and the rest of it.
QStringList offered(const QString &piece, const QString &written)
{
    using namespace markup;
    QString text = QString::fromUtf8(surveyTemplate(
        output("Table", "Points", "Survey", {field("Number", "Pt", "8"), field("Height", "H", "7.1")}, {"Northing"}),
        "", separatorOption("32")));
    const qsizetype at = text.indexOf(piece);
    EXPECT_GE(at, 0) << piece.toStdString() << text.toStdString();
    text.replace(at, piece.size(), written);
    const qsizetype mark = text.indexOf(u'|');
    text.remove(mark, 1);
    return completionsAt(text, mark).words;
}

TEST(TemplateCompletion, OffersTheElementsOfTheElement)
{
    struct Row
    {
        const char *text;
        const char *words;
    };
    const Row rows[] = {{"<|", "ReportTemplate"},
                        {"<Reports><|", "ReportTemplate"},
                        {"<ReportTemplate><", "Name Title Tables Dictionaries Blocks Options"},
                        {"<REPORTTEMPLATE><tables><T", "Table"},
                        {"<ReportTemplate><Tables><Table><Name>x</Name><", "Name Use Sort OutputList"},
                        {"<ReportTemplate><!-- <Tables> --><", "Name Title Tables Dictionaries Blocks Options"},
                        {"<Field></", "Field"},
                        {"<Field><Label></", "Label"},
                        {"text", ""},
                        {"<Label>text", ""},
                        {"<Align>L", ""}};
    for (const Row &row : rows) {
        const QString text = QString::fromLatin1(row.text).remove(u'|');
        const auto found = completionsAt(text, text.size());
        EXPECT_EQ(found.words.join(u' '), QString::fromLatin1(row.words)) << row.text;
    }
    EXPECT_EQ(completionsAt(QStringLiteral("<ReportTemplate><Ta"), 19).begin, 17);
}

TEST(TemplateCompletion, OffersWhatAValueMayBe)
{
    EXPECT_EQ(offered(QStringLiteral("<Align>LEFT"), QStringLiteral("<Align>|")),
              QStringList({QStringLiteral("LEFT"), QStringLiteral("RIGHT"), QStringLiteral("CENTER")}));
    EXPECT_TRUE(offered(QStringLiteral("<Type>"), QStringLiteral("<Type>|")).contains(QStringLiteral("ELEVATION")));
    EXPECT_EQ(offered(QStringLiteral("<Use>Survey"), QStringLiteral("<Use>|")), QStringList(QStringLiteral("Survey")));
    const QStringList fields = offered(QStringLiteral("<VariableName>Number"), QStringLiteral("<VariableName>|"));
    EXPECT_TRUE(fields.contains(QStringLiteral("Northing")) && fields.contains(QStringLiteral("FILLER")));
    EXPECT_TRUE(offered(QStringLiteral("<Format>8"), QStringLiteral("<Format>|")).contains(QStringLiteral("7.1")));
    const QStringList keys =
        offered(QStringLiteral("<Sort><VariableName>Northing"), QStringLiteral("<Sort><VariableName>|"));
    EXPECT_TRUE(keys.contains(QStringLiteral("Easting")) && !keys.contains(QStringLiteral("FILLER")));
}

} // namespace
