#include "TemplateDialog.h"

#include "CommandLine.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "Profile.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QDoubleSpinBox>
#include <QLabel>
#include <QPushButton>
#include <QTest>

#include <gtest/gtest.h>

namespace
{

using kareport::TemplateDialog;
using kareport::TemplateJob;

QStringList itemsOf(const TemplateDialog &dialog, const char *name)
{
    QStringList items;
    for (const auto *box : dialog.findChildren<QComboBox *>()) {
        if (box->accessibleName() == QString::fromUtf8(name)) {
            for (int i = 0; i < box->count(); ++i) {
                items.append(box->itemText(i));
            }
        }
    }
    return items;
}

void choose(const TemplateDialog &dialog, const char *name, int index)
{
    for (auto *box : dialog.findChildren<QComboBox *>()) {
        if (box->accessibleName() == QString::fromUtf8(name)) {
            box->setCurrentIndex(index);
        }
    }
}

template <typename Widget>
Widget *widgetOf(const TemplateDialog &dialog, const char *name)
{
    for (auto *widget : dialog.findChildren<Widget *>()) {
        if (widget->accessibleName() == QString::fromUtf8(name)) {
            return widget;
        }
    }
    return nullptr;
}

/// The names of the rows that a LandXML file has, as they are shown.
QStringList shownRows(const TemplateDialog &dialog)
{
    QStringList shown;
    for (const char *name : {"List", "Group", "Parcel", "Alignment", "Grade line", "Surface", "Interval"}) {
        if (widgetOf<QWidget>(dialog, name)->isVisibleTo(&dialog)) {
            shown.append(QString::fromUtf8(name));
        }
    }
    return shown;
}

/// Chooses an item of a list as a user does: with the keys.
void press(const TemplateDialog &dialog, const char *name, const char *item)
{
    auto *box = widgetOf<QComboBox>(dialog, name);
    const int index = box->findText(QString::fromUtf8(item));
    EXPECT_GE(index, 0) << name << " has no " << item;
    QTest::keyClick(box, Qt::Key_Home);
    for (int i = 0; i < index; ++i) {
        QTest::keyClick(box, Qt::Key_Down);
    }
    EXPECT_EQ(box->currentText(), QString::fromUtf8(item));
}

/// Two roads, points and a surface, in feet.
QByteArray roads()
{
    return "<LandXML version='1.2'><Units><Imperial linearUnit='foot'/></Units>"
           "<CgPoints name='control'><CgPoint name='1'>0 10</CgPoint></CgPoints>"
           "<CgPoints name='as-built'><CgPoint name='2'>50 -10</CgPoint></CgPoints><Alignments>"
           "<Alignment name='road' staStart='0'><CoordGeom><Line><Start>0 0</Start><End>100 0</End></Line></CoordGeom><Profile>"
           "<ProfAlign name='design'><PVI>0 1</PVI><PVI>100 1</PVI></ProfAlign>"
           "<ProfSurf name='ground'><PntList2D>0 1 100 2</PntList2D></ProfSurf></Profile></Alignment>"
           "<Alignment name='lane' staStart='0'><CoordGeom><Line><Start>0 0</Start><End>0 60</End></Line></CoordGeom></Alignment>"
           "</Alignments></LandXML>";
}

/// A template of stations and of points beside an alignment.
QByteArray roadTemplate()
{
    return "<ReportTemplate><Name>ROAD</Name><Title>Road</Title><Tables><Table><Name>Stations</Name><Use>D</Use>"
           "<OutputList><Field><VariableName>Along</VariableName><Label>Along</Label><Format>8.3</Format></Field>"
           "<Field><VariableName>Ground</VariableName><Label>Ground</Label><Format>8.3</Format></Field>"
           "</OutputList></Table></Tables><Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>"
           "<Variable><ID>1</ID><VariableName>Along</VariableName><Type>LENGTH</Type></Variable>"
           "<Variable><ID>2</ID><VariableName>Ground</VariableName><Type>ELEVATION</Type></Variable>"
           "</VariableList></Dictionary></Dictionaries><Options><Separator>124</Separator></Options></ReportTemplate>";
}

QPushButton *okButton(const TemplateDialog &dialog)
{
    return dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
}

class TemplateDialogs : public testing::Test
{
protected:
    void TearDown() override { kareport::setProfileStore(kareport::makeMemoryProfile()); }

    CommandLineFolder folder;
};

TEST_F(TemplateDialogs, ListsWhatAFileHolds)
{
    TemplateDialog dialog;
    EXPECT_FALSE(okButton(dialog)->isEnabled()) << "nothing is chosen yet";
    EXPECT_TRUE(dialog.findChild<QLabel *>(QStringLiteral("message"))->text().isEmpty()) << "and nothing is wrong yet";
    dialog.setTemplateFile(folder.path("t.xml"));
    EXPECT_EQ(itemsOf(dialog, "Template"),
              QStringList({QStringLiteral("CONTROL – Control points"), QStringLiteral("SITE – Site ä")}));
    EXPECT_EQ(itemsOf(dialog, "Table or block"), QStringList({QStringLiteral("Points"), QStringLiteral("Point")}));
    dialog.setData(folder.path("points.csv"));
    EXPECT_TRUE(okButton(dialog)->isEnabled());
    TemplateJob job = dialog.job();
    EXPECT_EQ(job.templateFile, folder.path("t.xml"));
    EXPECT_EQ(job.templateName, QStringLiteral("CONTROL"));
    EXPECT_EQ(job.table, QStringLiteral("Points"));
    EXPECT_TRUE(job.block.isEmpty());
    EXPECT_EQ(job.data, folder.path("points.csv"));
    choose(dialog, "Table or block", 1);
    job = dialog.job();
    EXPECT_EQ(job.block, QStringLiteral("Point")) << "the blocks are listed after the tables";
    EXPECT_TRUE(job.table.isEmpty());
}

TEST_F(TemplateDialogs, SaysWhatIsWrong)
{
    struct Row
    {
        const char *file;
        int templateIndex;
        const char *data;
        const char *says;
        const char *reason;
    };
    folder.put("none.xml", "<x>");
    folder.put("empty.xml", "");
    for (const Row &row :
         {Row{"t.xml", 0, "gone.csv", "no data file", "data that is not there"},
          Row{"t.xml", 1, "points.csv", "neither a table nor a block", "a template without outputs"},
          Row{"gone.xml", 0, "points.csv", "cannot be read", "a file that is not there"},
          Row{"none.xml", 0, "points.csv", "ReportTemplate", "no template in the file"},
          Row{"empty.xml", 0, "points.csv", "empty", "an empty file"}, Row{".", 0, "points.csv", "folder", "a folder"}})
    {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path(row.file));
        dialog.setData(folder.path(row.data));
        choose(dialog, "Template", row.templateIndex);
        const QString text = dialog.findChild<QLabel *>(QStringLiteral("message"))->text();
        EXPECT_TRUE(text.contains(QString::fromUtf8(row.says))) << row.reason << ": " << text.toStdString();
        EXPECT_TRUE(text.isEmpty() || text[0].isUpper()) << row.reason;
        EXPECT_FALSE(okButton(dialog)->isEnabled()) << row.reason;
    }
}

TEST_F(TemplateDialogs, TheLastChoiceIsThereAgain)
{
    {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path("t.xml"));
        dialog.setData(folder.path("points.csv"));
        choose(dialog, "Table or block", 1);
        dialog.accept();
    }
    {
        TemplateDialog dialog;
        EXPECT_EQ(dialog.job().block, QStringLiteral("Point"));
        EXPECT_EQ(dialog.job().data, folder.path("points.csv"));
        EXPECT_TRUE(okButton(dialog)->isEnabled()) << "one key makes the report anew";
        dialog.setData(QString());
        dialog.reject();
    }
    EXPECT_EQ(TemplateDialog().job().data, folder.path("points.csv")) << "what was cancelled is not kept";
    QFile::remove(folder.path("t.xml"));
    const TemplateDialog gone;
    EXPECT_FALSE(okButton(gone)->isEnabled());
}

TEST_F(TemplateDialogs, OffersTheListsAndTheNamesOfALandXmlFile)
{
    folder.put("roads.xml", roads());
    TemplateDialog dialog;
    dialog.setTemplateFile(folder.path("t.xml"));
    EXPECT_EQ(shownRows(dialog), QStringList());
    dialog.setData(folder.path("roads.xml"));
    EXPECT_TRUE(okButton(dialog)->isEnabled())
        << dialog.findChild<QLabel *>(QStringLiteral("message"))->text().toStdString();
    EXPECT_EQ(itemsOf(dialog, "List"),
              QStringList({QStringLiteral("Points"), QStringLiteral("Alignments"),
                           QStringLiteral("Elements of alignments"), QStringLiteral("Stations"),
                           QStringLiteral("Profile"), QStringLiteral("Points beside an alignment")}))
        << "those that the file has something for";
    EXPECT_EQ(shownRows(dialog), QStringList({QStringLiteral("List"), QStringLiteral("Group")}));
    EXPECT_EQ(itemsOf(dialog, "Group"),
              QStringList({QStringLiteral("(all)"), QStringLiteral("control"), QStringLiteral("as-built")}));
    EXPECT_EQ(dialog.job().dataKind, QStringLiteral("landxml"));
    EXPECT_EQ(dialog.job().dataOptions, QJsonObject({{"list", "points"}}));

    press(dialog, "List", "Stations");
    EXPECT_EQ(shownRows(dialog),
              QStringList({QStringLiteral("List"), QStringLiteral("Alignment"), QStringLiteral("Grade line"),
                           QStringLiteral("Surface"), QStringLiteral("Interval")}));
    EXPECT_EQ(itemsOf(dialog, "Grade line"), QStringList({QStringLiteral("(the first)"), QStringLiteral("design")}));
    press(dialog, "Alignment", "road");
    press(dialog, "Surface", "ground");
    widgetOf<QDoubleSpinBox>(dialog, "Interval")->setValue(25);
    EXPECT_EQ(dialog.job().dataOptions,
              QJsonObject({{"list", "stations"}, {"alignment", "road"}, {"surface", "ground"}, {"interval", 25}}));

    press(dialog, "List", "Points beside an alignment");
    EXPECT_EQ(itemsOf(dialog, "Alignment"), QStringList({QStringLiteral("road"), QStringLiteral("lane")}))
        << "there must be one";
    press(dialog, "Group", "as-built");
    EXPECT_EQ(dialog.job().dataOptions,
              QJsonObject({{"list", "offsetsOf"}, {"group", "as-built"}, {"alignment", "road"}}));

    dialog.setData(folder.path("points.csv"));
    EXPECT_EQ(shownRows(dialog), QStringList());
    EXPECT_EQ(dialog.job().dataKind, QStringLiteral("csv"));
    EXPECT_EQ(dialog.job().dataOptions, QJsonObject());
}

TEST_F(TemplateDialogs, NamesOfALandXmlFileAreThoseOfTheListAndOfTheAlignment)
{
    folder.put("roads.xml",
               QByteArray(roads()).replace("</Profile></Alignment>",
                                           "</Profile><CrossSects><CrossSect sta='5'><CrossSectSurf name='rock'>"
                                           "<PntList2D>0 1</PntList2D></CrossSectSurf></CrossSect></CrossSects>"
                                           "</Alignment><Alignment name='empty'/>"));
    TemplateDialog dialog;
    dialog.setTemplateFile(folder.path("t.xml"));
    dialog.setData(folder.path("roads.xml"));
    const QString all = u"(all)"_qs;
    const QString first = u"(the first)"_qs;
    press(dialog, "List", "Stations");
    EXPECT_EQ(itemsOf(dialog, "Alignment"), QStringList({all, u"road"_qs, u"lane"_qs})) << "those with elements";
    EXPECT_EQ(itemsOf(dialog, "Surface"), QStringList({first, u"ground"_qs})) << "along the alignments";
    press(dialog, "Alignment", "lane");
    EXPECT_EQ(itemsOf(dialog, "Grade line"), QStringList(first)) << "of another alignment";
    EXPECT_EQ(itemsOf(dialog, "Surface"), QStringList(first));
    press(dialog, "Alignment", "road");
    press(dialog, "Grade line", "design");
    EXPECT_EQ(dialog.job().dataOptions.value(u"gradeLine"_qs).toString(), u"design");
    press(dialog, "List", "Cross sections");
    EXPECT_EQ(itemsOf(dialog, "Alignment"), QStringList({all, u"road"_qs})) << "those with cross sections";
    EXPECT_EQ(itemsOf(dialog, "Surface"), QStringList({all, u"rock"_qs})) << "across the alignments";
    press(dialog, "List", "Profile");
    EXPECT_EQ(itemsOf(dialog, "Alignment"), QStringList({all, u"road"_qs})) << "those with grade lines";
    press(dialog, "List", "Alignments");
    EXPECT_EQ(itemsOf(dialog, "Alignment"), QStringList({all, u"road"_qs, u"empty"_qs, u"lane"_qs}));
}

TEST_F(TemplateDialogs, ALandXmlFileThatCannotBeReadIsSaid)
{
    struct Row
    {
        QByteArray content;
        const char *says;
        const char *reason;
    };
    const QByteArray begin = "<LandXML><Units><Metric linearUnit='meter'/></Units>";
    for (const Row &row : {Row{roads().left(300), "not well-formed", "a file that is cut off"},
                           Row{"<LandXML/>", "no units", "without units"},
                           Row{begin + "</LandXML>", "nothing that is listed", "without anything"}})
    {
        folder.put("roads.xml", row.content);
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path("t.xml"));
        dialog.setData(folder.path("roads.xml"));
        const QString text = dialog.findChild<QLabel *>(QStringLiteral("message"))->text();
        EXPECT_TRUE(text.contains(QString::fromUtf8(row.says))) << row.reason << ": " << text.toStdString();
        EXPECT_FALSE(okButton(dialog)->isEnabled()) << row.reason;
        EXPECT_EQ(shownRows(dialog), QStringList()) << row.reason;
    }
}

TEST_F(TemplateDialogs, TheLastListIsThereAgain)
{
    folder.put("roads.xml", roads());
    {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path("t.xml"));
        dialog.setData(folder.path("roads.xml"));
        press(dialog, "List", "Stations");
        press(dialog, "Alignment", "lane");
        widgetOf<QDoubleSpinBox>(dialog, "Interval")->setValue(12.5);
        dialog.accept();
    }
    const TemplateDialog again;
    EXPECT_EQ(again.job().dataOptions, QJsonObject({{"list", "stations"}, {"alignment", "lane"}, {"interval", 12.5}}));
    EXPECT_TRUE(okButton(again)->isEnabled());
}

TEST_F(TemplateDialogs, ALandXmlFileThatIsOpenedIsTheData)
{
    folder.put("roads.xml", roads());
    TemplateDialog dialog;
    dialog.setFile(folder.path("t.xml"));
    dialog.setFile(folder.path("roads.xml"));
    EXPECT_EQ(dialog.job().templateFile, folder.path("t.xml"));
    EXPECT_EQ(dialog.job().data, folder.path("roads.xml"));
    EXPECT_EQ(dialog.job().dataKind, QStringLiteral("landxml"));
}

TEST_F(TemplateDialogs, AListOfALandXmlFileBecomesAReport)
{
    folder.put("roads.xml", roads());
    folder.put("road-template.xml", roadTemplate());
    Desk desk;
    desk.frame->askTemplate = [&](const QString &) -> std::optional<TemplateJob> {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path("road-template.xml"));
        dialog.setFile(folder.path("roads.xml"));
        press(dialog, "List", "Stations");
        press(dialog, "Alignment", "road");
        widgetOf<QDoubleSpinBox>(dialog, "Interval")->setValue(50);
        EXPECT_TRUE(okButton(dialog)->isEnabled());
        QTest::mouseClick(okButton(dialog), Qt::LeftButton);
        EXPECT_EQ(dialog.result(), QDialog::Accepted);
        return dialog.job();
    };
    ASSERT_TRUE(desk.frame->OnCommand(kareport::fileFromTemplateCommand));
    EXPECT_EQ(desk.messages, QStringList());
    ASSERT_EQ(Desk::reports().size(), 1U);
    const QString text = Desk::textOf(*Desk::reports().front());
    EXPECT_TRUE(text.contains(QStringLiteral("15.240|")) && text.contains(QStringLiteral("0.457")))
        << text.toStdString();
    EXPECT_TRUE(text.contains(QStringLiteral("30.480|"))) << text.toStdString();
}

} // namespace
