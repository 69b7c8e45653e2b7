#include "LoadedTemplate.h"
#include "PrintQt.h"
#include "TemplateMarkup.h"
#include "UXmlReportTable.h"
#include "UXmlReportTpl.h"

#include <gtest/gtest.h>

#include <string>

// Northing and Easting in the order of a job.

using markup::element;
using markup::field;
using markup::joined;
using markup::output;

namespace
{

QByteArray templateOf(const QByteArray &tables)
{
    return element("ReportTemplate", element("Name", "T") + element("Tables", tables) +
                                         element("Dictionaries", markup::surveyDictionary()) +
                                         element("Options", markup::separatorOption("|")));
}

/// All members of a field, with a slash between.
std::string shown(const sXmlReportField &field)
{
    return (field.VariableName + u'/' + field.Label + u'/' + QString::number(field.Width) + u'/' +
            QString::number(field.Decimals) + u'/' + field.Align + u'/' + QString::number(field.ID) + u'/' +
            QString::number(field.Type))
        .toStdString();
}

/// The names of a table's fields, with a blank between.
std::string names(const sXmlReportTable &table)
{
    QStringList all;
    for (const sXmlReportField &read : table.Fields) {
        all.append(read.VariableName);
    }
    return all.join(u' ').toStdString();
}

TEST(UXmlReportTplOrder, AFieldMovesWithAllThatItHas)
{
    const QByteArray easting = element("Field", "<VariableName>Easting</VariableName><Label>East</Label>"
                                                "<Format>9.1</Format><Align>CENTER</Align>");
    const QByteArray dictionary =
        element("Dictionary", element("DictionaryName", "D") +
                                  element("VariableList", markup::variable(12, "Northing", "COORDINATE") +
                                                              markup::variable(13, "Easting", "LENGTH") +
                                                              markup::variable(14, "Elevation", "ELEVATION")));
    LoadedTemplate loaded(
        element("ReportTemplate", element("Name", "T") +
                                      element("Tables", output("Table", "X", "D",
                                                               {field("Northing", "North", "12.3", "RIGHT"), easting,
                                                                field("Elevation", "Height", "8.2")})) +
                                      element("Dictionaries", dictionary)));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportTable *table = loaded.tpl.GetTable(QStringLiteral("X"));
    ASSERT_EQ(table->Fields.size(), 3U);
    EXPECT_EQ(shown(table->Fields[0]), "Northing/North/12/3/R/12/5");
    EXPECT_EQ(shown(table->Fields[1]), "Easting/East/9/1/C/13/6");
    ASSERT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), ORDER_EASTING_NORTHING));
    EXPECT_EQ(shown(table->Fields[0]), "Easting/East/9/1/C/13/6");
    EXPECT_EQ(shown(table->Fields[1]), "Northing/North/12/3/R/12/5");
    EXPECT_EQ(shown(table->Fields[2]), "Elevation/Height/8/2/L/14/8") << "others stay";
    ASSERT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), ORDER_NORTHING_EASTING));
    EXPECT_EQ(shown(table->Fields[0]), "Northing/North/12/3/R/12/5") << "and back";
    EXPECT_EQ(shown(table->Fields[1]), "Easting/East/9/1/C/13/6");
}

TEST(UXmlReportTplOrder, NorthingEastingElevationInBothOrders)
{
    const QByteArray fields = joined(
        {field("Northing", "North", "7"), field("Easting", "East", "6", "RIGHT"), field("Elevation", "Height", "8")});
    const struct
    {
        ORIENTATION_ORDER order;
        const char *names;
        QString heading;
    } rows[] = {
        {ORDER_EASTING_NORTHING, "Easting Northing Elevation", QStringLiteral("  East|North  |Height  ")},
        {ORDER_NORTHING_EASTING, "Northing Easting Elevation", QStringLiteral("North  |  East|Height  ")},
    };
    for (const auto &row : rows) {
        LoadedTemplate loaded(templateOf(output("Table", "X", "Survey", {fields})));
        UXmlReportTable table;
        table.SetColumnSeparator('|');
        ASSERT_TRUE(table.LoadTable(QStringLiteral("X"), &loaded.tpl));
        EXPECT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), row.order));
        table.ReorderingHeading();
        EXPECT_EQ(names(*loaded.tpl.GetTable(QStringLiteral("X"))), row.names);
        EXPECT_EQ(table.GetHeading(), row.heading) << row.names;
    }
}

TEST(UXmlReportTplOrder, OfTwoTablesOfOneNameOnlyTheFirstIsOrdered)
{
    LoadedTemplate loaded(
        templateOf(output("Table", "X", "Survey", {field("Northing", "N", "1"), field("Easting", "E", "1")}) +
                   output("Table", "x", "Survey", {field("Northing", "n", "1"), field("Easting", "e", "1")})));
    ASSERT_TRUE(loaded.loaded);
    const sXmlReportTable *first = loaded.tpl.GetTable(QStringLiteral("x"));
    ASSERT_NE(first, nullptr);
    ASSERT_EQ(first->Name, QStringLiteral("X"));
    const sXmlReportTable *second = first + 1; // the template keeps its tables in a row
    ASSERT_EQ(second->Name, QStringLiteral("x"));
    ASSERT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("x"), ORDER_EASTING_NORTHING));
    EXPECT_EQ(names(*first), "Easting Northing");
    EXPECT_EQ(names(*second), "Northing Easting");
}

TEST(UXmlReportTplOrder, AnUnknownOrderIsNeitherSoTheColumnsChangePlaces)
{
    constexpr struct
    {
        int order;
        const char *first;
        const char *second;
        const char *after;
    } rows[] = {
        {2, "Northing", "Easting", "Easting Northing"},     {2, "Easting", "Northing", "Northing Easting"},
        {-1, "Northing", "Easting", "Easting Northing"},    {-1, "Easting", "Northing", "Northing Easting"},
        {32767, "Northing", "Easting", "Easting Northing"}, {-32768, "Easting", "Northing", "Northing Easting"},
    };
    for (const auto &row : rows) {
        LoadedTemplate loaded(
            templateOf(output("Table", "X", "Survey", {field(row.first, "a", "1"), field(row.second, "b", "1")})));
        ASSERT_TRUE(loaded.loaded);
        const auto order = static_cast<ORIENTATION_ORDER>(row.order);
        EXPECT_TRUE(loaded.tpl.SetNorthEastTableFieldOrder(QStringLiteral("X"), order)) << row.order;
        EXPECT_EQ(names(*loaded.tpl.GetTable(QStringLiteral("X"))), row.after) << row.order;
    }
}

} // namespace
