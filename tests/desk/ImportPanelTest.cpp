#include "TemplateDialog.h"

#include "ColumnMapping.h"
#include "DeskFixture.h"
#include "GeoPackageFile.h"
#include "ImportMemory.h"
#include "ImportPanel.h"
#include "Profile.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QHeaderView>
#include <QJsonDocument>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTableWidget>

#include <gtest/gtest.h>

#include <cmath>

namespace
{

using kareport::ColumnMapping;
using kareport::ImportPanel;
using kareport::TemplateDialog;

class Imports : public testing::Test
{
protected:
    Imports()
    {
        kareport::setProfileStore(kareport::makeMemoryProfile());
        const auto variable = [](int id, const char *name, const char *type) {
            return "<Variable><ID>" + QByteArray::number(id) + "</ID><VariableName>" + name + "</VariableName><Type>" +
                   type + "</Type></Variable>";
        };
        const auto field = [](const char *name) {
            return QByteArray("<Field><VariableName>") + name + "</VariableName><Label>" + name +
                   "</Label><Format>12.3</Format></Field>";
        };
        folder.put("t.xml", "<ReportTemplate><Name>T</Name><Title>Points</Title><Tables><Table><Name>Points</Name>"
                            "<Use>D</Use><OutputList>" +
                                field("Number") + field("Northing") + field("Easting") +
                                "</OutputList></Table></Tables><Dictionaries><Dictionary>"
                                "<DictionaryName>D</DictionaryName><VariableList>" +
                                variable(1, "Number", "NUMBER") + variable(2, "Northing", "COORDINATE") +
                                variable(3, "Easting", "COORDINATE") +
                                "</VariableList></Dictionary></Dictionaries></ReportTemplate>");
    }
    void TearDown() override { kareport::setProfileStore(kareport::makeMemoryProfile()); }

    void open(TemplateDialog &dialog, const char *data)
    {
        dialog.setTemplateFile(folder.path("t.xml"));
        dialog.setData(folder.path(data));
        dialog.show();
    }
    static ImportPanel &panel(const TemplateDialog &dialog) { return *dialog.findChild<ImportPanel *>(); }
    template <typename Widget>
    static Widget *named(const TemplateDialog &dialog, const QString &name)
    {
        for (auto *widget : dialog.findChildren<Widget *>()) {
            if (widget->accessibleName() == name) {
                return widget;
            }
        }
        ADD_FAILURE() << name.toStdString();
        return nullptr;
    }
    /// Chooses an item of a list as a user does: with the keys.
    static void press(const TemplateDialog &dialog, const char *name, const char *item)
    {
        auto *box = named<QComboBox>(dialog, QString::fromUtf8(name));
        const int index = box->findText(QString::fromUtf8(item));
        ASSERT_GE(index, 0) << name << " has no " << item;
        for (int step = 0; box->currentIndex() != index && step < 20; ++step) {
            QTest::keyClick(box, box->currentIndex() < index ? Qt::Key_Down : Qt::Key_Up);
        }
        EXPECT_EQ(box->currentText(), QString::fromUtf8(item));
    }
    static QString chosen(const TemplateDialog &dialog, const char *name)
    {
        return named<QComboBox>(dialog, QString::fromUtf8(name))->currentText();
    }
    static QString message(const TemplateDialog &dialog)
    {
        return dialog.findChild<QLabel *>(QStringLiteral("message"))->text();
    }
    static QByteArray optionsOf(const TemplateDialog &dialog)
    {
        return QJsonDocument(dialog.job().dataOptions).toJson(QJsonDocument::Compact);
    }

    JobFolder folder;
};

TEST_F(Imports, AFileBeginsWithWhatCanBeFoundOut)
{
    folder.put("p.txt", "Number;Northing;Easting\n1;2,5;3\n2;3,5;4\n");
    TemplateDialog dialog;
    EXPECT_FALSE(panel(dialog).isVisibleTo(&dialog)) << "there is no data";
    open(dialog, "p.txt");
    EXPECT_TRUE(panel(dialog).isVisibleTo(&dialog));
    EXPECT_EQ(chosen(dialog, "Delimiter"), QStringLiteral("Semicolon"));
    EXPECT_EQ(chosen(dialog, "Decimal sign"), QStringLiteral("Comma: 1,5"));
    EXPECT_EQ(chosen(dialog, "Encoding"), QStringLiteral("UTF-8"));
    EXPECT_TRUE(named<QCheckBox>(dialog, "First row names the columns")->isChecked());
    const QTableWidget &table = panel(dialog).table();
    ASSERT_EQ(table.columnCount(), 3);
    ASSERT_EQ(table.rowCount(), 3) << "the variables, and two rows";
    EXPECT_EQ(table.horizontalHeaderItem(1)->text(), QStringLiteral("Northing"));
    EXPECT_EQ(table.item(1, 1)->text(), QStringLiteral("2,5"));
    EXPECT_EQ(chosen(dialog, "Variable of the column Northing"), QStringLiteral("Northing"));
    EXPECT_EQ(message(dialog), QString());
    EXPECT_EQ(optionsOf(dialog), "{\"decimal\":\",\",\"delimiter\":\";\"}");
    folder.put("road.xml", "<LandXML version='1.2'><CgPoints><CgPoint name='1'>0 10</CgPoint></CgPoints></LandXML>");
    dialog.setData(folder.path("road.xml"));
    EXPECT_FALSE(panel(dialog).isVisibleTo(&dialog)) << "which says all that itself";
    EXPECT_FALSE(dialog.job().dataOptions.contains(QStringLiteral("delimiter")));
}

TEST_F(Imports, WhatDoesNotFitIsRedAndSaid)
{
    folder.put("p.txt", "Number,Northing,Easting\n1,2.5,3\n2,abc,4\n3,4\n");
    TemplateDialog dialog;
    open(dialog, "p.txt");
    const QTableWidget &table = panel(dialog).table();
    EXPECT_EQ(table.item(1, 1)->background().style(), Qt::NoBrush);
    EXPECT_NE(table.item(2, 1)->background().style(), Qt::NoBrush);
    EXPECT_TRUE(table.item(2, 1)->toolTip().contains(QStringLiteral("expected")));
    EXPECT_EQ(table.item(2, 2)->background().style(), Qt::NoBrush);
    EXPECT_NE(table.item(3, 2)->background().style(), Qt::NoBrush) << "a cell is missing";
    EXPECT_TRUE(message(dialog).startsWith(QStringLiteral("Line 3, column 3: "))) << message(dialog).toStdString();
    EXPECT_TRUE(message(dialog).contains(QStringLiteral("\"abc\"")));
    folder.put("q.txt", "Number,Northing,Easting\n1,2.5,3\n");
    dialog.setData(folder.path("q.txt"));
    EXPECT_EQ(message(dialog), QString());
}

TEST_F(Imports, ChoicesReachTheJob)
{
    folder.put("p.txt", "7|0.5|1\n8|2|3\n");
    TemplateDialog dialog;
    open(dialog, "p.txt");
    EXPECT_EQ(named<QLineEdit>(dialog, "Order of the columns")->text(), QStringLiteral("PNE")) << "they are points";
    QLineEdit *order = named<QLineEdit>(dialog, "Order of the columns");
    order->selectAll();
    QTest::keyClicks(order, QStringLiteral("PEN"));
    press(dialog, "Unit of lengths in the data", "US survey foot");
    press(dialog, "Unit of angles in the data", "Gon");
    EXPECT_EQ(
        optionsOf(dialog),
        "{\"delimiter\":\"|\",\"header\":false,\"order\":\"PEN\",\"units\":{\"angle\":\"gon\",\"length\":\"usft\"}}");
    EXPECT_EQ(chosen(dialog, "Variable of the column Easting"), QStringLiteral("Easting"));
    order->clear();
    EXPECT_FALSE(message(dialog).isEmpty()) << "no column is a variable";
    press(dialog, "Variable of the column 3", "Northing");
    EXPECT_EQ(message(dialog), QString());
    EXPECT_EQ(dialog.job().dataOptions.value("columns"), QJsonValue(QJsonObject{{"Northing", 3}}));
    QTest::mouseClick(named<QCheckBox>(dialog, "First row names the columns"), Qt::LeftButton, {}, QPoint(8, 8));
    EXPECT_FALSE(dialog.job().dataOptions.contains(QStringLiteral("columns"))) << "the columns are others now";
    press(dialog, "Delimiter", "Comma");
    EXPECT_EQ(panel(dialog).table().columnCount(), 1);
}

TEST_F(Imports, WhatWasChosenIsThereForTheNextFileOfTheShape)
{
    folder.put("p.txt", "Pt,N,E\n1,2.5,3\n");
    folder.put("next.txt", "Pt,N,E\n7,8,9\n10,11,12\n");
    folder.put("other.txt", "Pt,N,E,Z\n7,8,9,1\n");
    {
        TemplateDialog dialog;
        open(dialog, "p.txt");
        press(dialog, "Variable of the column Pt", "Number");
        press(dialog, "Variable of the column N", "Easting");
        press(dialog, "Unit of lengths in the data", "Millimetre");
        dialog.accept();
    }
    TemplateDialog dialog;
    open(dialog, "next.txt");
    EXPECT_EQ(chosen(dialog, "Variable of the column N"), QStringLiteral("Easting"));
    EXPECT_EQ(optionsOf(dialog), "{\"columns\":{\"Easting\":\"N\",\"Number\":\"Pt\"},\"units\":{\"length\":\"mm\"}}");
    dialog.setData(folder.path("other.txt"));
    EXPECT_EQ(chosen(dialog, "Variable of the column N"), QStringLiteral("(not read)"));
    EXPECT_EQ(optionsOf(dialog), "{}");
}

TEST_F(Imports, TheReportHasWhatIsShown)
{
    folder.put("p.txt", "Pt;N;E\nA1;1000,5;3\nA2;2000,25;4\n");
    Desk desk;
    TemplateDialog dialog;
    open(dialog, "p.txt");
    press(dialog, "Variable of the column Pt", "Number");
    press(dialog, "Variable of the column N", "Northing");
    ASSERT_TRUE(desk.frame->OpenTemplateJob(dialog.job()));
    EXPECT_TRUE(Desk::textOf(*Desk::reports().front()).contains(QStringLiteral("2000.250")));
    desk.answer = MessageAnswer::No;
}

TEST_F(Imports, TablesOfADatabaseAreChosenFromAList)
{
    geo::runSql(folder.path("survey.gpkg"),
                geo::packageSql() +
                    "CREATE TABLE points (Number TEXT, Northing REAL, Easting REAL);"
                    "INSERT INTO points VALUES ('1', 2.5, 3), ('2', 'abc', 4);"
                    "CREATE TABLE trees (fid INTEGER PRIMARY KEY, Number TEXT, geom BLOB);"
                    "INSERT INTO gpkg_contents VALUES ('trees', 'features', 'trees', 25832);"
                    "INSERT INTO gpkg_geometry_columns VALUES ('trees', 'geom', 'POINT', 25832, 0, 0);"
                    "INSERT INTO trees VALUES (1, 'oak', " +
                    geo::pointLiteral(400000.5, 5000000.25, std::nan(""), std::nan(""), 25832) + ");");
    Desk desk;
    TemplateDialog dialog;
    open(dialog, "survey.gpkg");
    EXPECT_TRUE(panel(dialog).isVisibleTo(&dialog));
    EXPECT_FALSE(named<QComboBox>(dialog, QStringLiteral("Delimiter"))->isVisibleTo(&dialog));
    EXPECT_EQ(chosen(dialog, "Table of the database"), QStringLiteral("points"));
    const QTableWidget &table = panel(dialog).table();
    EXPECT_EQ(table.columnCount(), 3);
    EXPECT_EQ(table.item(1, 1)->text(), QStringLiteral("2.5"));
    EXPECT_EQ(table.item(1, 1)->background().style(), Qt::NoBrush);
    EXPECT_NE(table.item(2, 1)->background().style(), Qt::NoBrush) << "the row does not fit";
    EXPECT_TRUE(message(dialog).contains(QStringLiteral("abc"))) << message(dialog).toStdString();
    press(dialog, "Table of the database", "trees");
    EXPECT_EQ(message(dialog), QString());
    EXPECT_EQ(chosen(dialog, "Variable of the column @y"), QStringLiteral("Northing")) << "as coordinates are";
    EXPECT_EQ(dialog.job().dataKind, QStringLiteral("sqlite"));
    EXPECT_EQ(optionsOf(dialog), "{\"columns\":{\"Easting\":\"@x\",\"Northing\":\"@y\"},\"table\":\"trees\"}");
    ASSERT_TRUE(desk.frame->OpenTemplateJob(dialog.job()));
    EXPECT_TRUE(Desk::textOf(*Desk::reports().front()).contains(QStringLiteral("5000000.250")));
    desk.answer = MessageAnswer::No;

    geo::runSql(folder.path("empty.sqlite"), "CREATE TABLE x (a); DROP TABLE x;");
    dialog.setData(folder.path("empty.sqlite"));
    EXPECT_EQ(message(dialog), QStringLiteral("The database has no table"));
}

TEST_F(Imports, OnlyTheLastShapesAreKept)
{
    for (int shape = 0; shape < 60; ++shape) {
        kareport::rememberImport(QString::number(shape), {{QStringLiteral("order"), QString::number(shape)}});
    }
    EXPECT_FALSE(kareport::rememberedImport(QStringLiteral("9")).has_value());
    EXPECT_TRUE(kareport::rememberedImport(QStringLiteral("10")).has_value());
    EXPECT_EQ(kareport::rememberedImport(QStringLiteral("59"))->value(u"order"), QJsonValue("59"));
    kareport::rememberImport(QStringLiteral("59"), {});
    EXPECT_EQ(*kareport::rememberedImport(QStringLiteral("59")), QJsonObject());
    EXPECT_TRUE(kareport::rememberedImport(QStringLiteral("10")).has_value()) << "no shape is there twice";
    WriteProfileString(QString(), QStringLiteral("Imports"), QStringLiteral("[1, {\"shape\": 2}, "));
    EXPECT_FALSE(kareport::rememberedImport(QStringLiteral("59")).has_value());
}

/// Columns by their names and what is read from them.
kareport::DataPreview columns(std::initializer_list<kareport::PreviewedColumn> list)
{
    kareport::DataPreview preview;
    preview.columns = list;
    return preview;
}

TEST(ColumnMapping, SaysWhatIsChosenAsAJobReadsIt)
{
    const auto named = columns({{"Pt", ""}, {"N", ""}, {"Easting", "Easting"}});
    const auto bare = columns({{"", ""}, {"", ""}});
    const auto text = [](const ColumnMapping &mapping, const kareport::DataPreview &own,
                         const QJsonObject &options = {}) {
        return QJsonDocument(mapping.put(options, own)).toJson(QJsonDocument::Compact).toStdString();
    };
    ColumnMapping mapping;
    EXPECT_EQ(text(mapping, named), "{}");
    mapping.choose(0, QStringLiteral("Number"));
    EXPECT_EQ(text(mapping, named), R"({"columns":{"Number":"Pt"}})");
    mapping.choose(1, QStringLiteral("Easting"));
    EXPECT_EQ(text(mapping, named), R"({"columns":{"Easting":"N","Number":"Pt"}})")
        << "the column of its name is not read";
    EXPECT_EQ(mapping.variables(named), (QStringList{"Number", "Easting", ""}));
    mapping.choose(1, QString());
    mapping.choose(2, QString());
    EXPECT_EQ(text(mapping, named), R"({"columns":["Number","-","-"]})") << "a list alone leaves a column out";
    ColumnMapping again;
    again.take(mapping.put({}, named), named);
    EXPECT_EQ(again.variables(named), mapping.variables(named));
    mapping.clear();
    mapping.choose(1, QStringLiteral("Number"));
    EXPECT_EQ(text(mapping, bare), R"({"columns":{"Number":2}})") << "columns without names have numbers";
    mapping.choose(0, QStringLiteral("number"));
    EXPECT_EQ(text(mapping, bare), R"({"columns":{"number":1}})") << "a variable has one column";
    const auto twice = columns({{"A", ""}, {"a", ""}});
    EXPECT_EQ(text(mapping, twice), R"({"columns":{"number":1}})") << "nor is a name of two columns one";
    const auto ordered = columns({{"Number", "Number"}, {"Northing", "Northing"}});
    mapping.clear();
    mapping.choose(0, QString());
    EXPECT_EQ(text(mapping, ordered, {{"order", "PN"}}), R"({"columns":["-","Northing"]})") << "in place of the order";
    again.take({{"columns", QJsonObject{{"Number", "gone"}, {"Northing", 7}}}}, named);
    EXPECT_TRUE(again.isEmpty()) << "what is not there is left out";
}

} // namespace
