#include "TableDesk.h"

#include "CommandLine.h"
#include "DeskCommandIds.h"
#include "UnitsBar.h"

#include <QComboBox>
#include <QSpinBox>

#include <gtest/gtest.h>

namespace
{

template <typename Widget>
Widget *boxNamed(const kareport::UnitsBar &bar, const char *name)
{
    for (Widget *box : bar.findChildren<Widget *>()) {
        if (box->accessibleName() == QString::fromUtf8(name)) {
            return box;
        }
    }
    ADD_FAILURE() << name;
    return nullptr;
}

/// Chooses an entry as a user does, with the keys.
void choose(const kareport::UnitsBar &bar, const char *name, const char *item)
{
    auto *box = boxNamed<QComboBox>(bar, name);
    const int index = box->findText(QString::fromUtf8(item));
    ASSERT_GE(index, 0) << item;
    for (int step = 0; box->currentIndex() != index && step < 10; ++step) {
        QTest::keyClick(box, box->currentIndex() < index ? Qt::Key_Down : Qt::Key_Up);
    }
    EXPECT_EQ(box->currentText(), QString::fromUtf8(item));
}

TEST(UnitsBar, AChoiceMakesTheReportAgain)
{
    TableDesk desk;
    kareport::UnitsBar &bar = desk.frame->runs().unitsBar();
    EXPECT_FALSE(bar.isEnabled()) << "there is no report";
    desk.folder.put("p.csv", "Number,North\n1,0.3048\n2,1000\n");
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    desk.frame->runs().showFront();
    EXPECT_TRUE(bar.isEnabled());
    EXPECT_EQ(boxNamed<QComboBox>(bar, "Unit of lengths")->currentText(), QStringLiteral("m"));
    choose(bar, "Unit of lengths", "ft");
    EXPECT_EQ(TableDesk::northings(*report), (QStringList{"1.000", "3280.840"}));
    QSpinBox *decimals = boxNamed<QSpinBox>(bar, "Decimals of lengths");
    QTest::keyClick(decimals, Qt::Key_Down);
    EXPECT_EQ(report->GetJobSettings().lengthDecimals, 2);
    EXPECT_TRUE(desk.messages.isEmpty());

    // It stays with this report.
    UReportDoc *other = desk.open();
    ASSERT_NE(other, nullptr);
    EXPECT_EQ(TableDesk::northings(*other).front(), QStringLiteral("0.305"));
    desk.frame->runs().showFront();
    EXPECT_EQ(boxNamed<QComboBox>(bar, "Unit of lengths")->currentText(), QStringLiteral("m"));
    ASSERT_TRUE(desk.frame->OnCommand(kareport::previousReportCommand));
    desk.frame->runs().showFront();
    EXPECT_EQ(boxNamed<QComboBox>(bar, "Unit of lengths")->currentText(), QStringLiteral("ft"));
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(TableDesk::northings(*report).front(), QStringLiteral("1.00")) << "also when it is made again";
}

TEST(UnitsBar, EveryChoiceReachesTheJob)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    kareport::UnitsBar &bar = desk.frame->runs().unitsBar();
    desk.frame->runs().showFront();
    choose(bar, "Unit of areas", "ac");
    choose(bar, "Unit of angles", "gon");
    choose(bar, "Form of stations", "123+45.678");
    choose(bar, "Order of coordinates", "E, N");
    QTest::keyClick(boxNamed<QSpinBox>(bar, "Decimals of numbers and areas"), Qt::Key_Up);
    QTest::keyClick(boxNamed<QSpinBox>(bar, "Decimals of stations"), Qt::Key_Down);
    const UJobSettings &settings = report->GetJobSettings();
    EXPECT_EQ(settings.areaUnit, kareport::AreaUnit::Acre);
    EXPECT_EQ(settings.angleUnit, kareport::AngleUnit::Gon);
    EXPECT_EQ(settings.stationFormat, UJobSettings::StationFormat::HundredsPlus);
    EXPECT_EQ(settings.northEastOrder, 0);
    EXPECT_EQ(settings.numberDecimals, 4);
    EXPECT_EQ(settings.stationDecimals, 2);
}

TEST(UnitsBar, AChoiceThatIsNotCarriedOutIsTakenBack)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    kareport::UnitsBar &bar = desk.frame->runs().unitsBar();
    desk.frame->runs().showFront();
    report->ReplaceText(0, 0, u"mine");
    desk.answer = MessageAnswer::No;
    auto *box = boxNamed<QComboBox>(bar, "Unit of lengths");
    QTest::keyClick(box, Qt::Key_Down);
    EXPECT_EQ(desk.messages.size(), 1);
    EXPECT_EQ(box->currentText(), QStringLiteral("m"));
    desk.answer = MessageAnswer::Yes;
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(report->GetJobSettings().lengthUnit, kareport::LengthUnit::Metre);
    QFile::remove(desk.folder.path("p.csv"));
    QTest::keyClick(box, Qt::Key_Down);
    EXPECT_EQ(box->currentText(), QStringLiteral("m")) << "the data is gone";
    desk.answer = MessageAnswer::No;
}

TEST(UnitsBar, TheKeyboardComesAndGoes)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    desk.frame->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&*desk.frame));
    kareport::ReportEdit &edit = TableDesk::viewOf(*report)->GetEdit();
    edit.setFocus();
    kareport::UnitsBar &bar = desk.frame->runs().unitsBar();
    desk.frame->runs().showFront();
    bar.hide();
    ASSERT_TRUE(desk.frame->OnCommand(kareport::chooseUnitsCommand));
    EXPECT_TRUE(bar.isVisible());
    auto *box = boxNamed<QComboBox>(bar, "Unit of lengths");
    EXPECT_TRUE(box->hasFocus());
    QTest::keyClick(box, Qt::Key_Tab);
    EXPECT_TRUE(boxNamed<QSpinBox>(bar, "Decimals of lengths")->hasFocus()) << "from box to box";
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Backtab);
    EXPECT_TRUE(box->hasFocus());
    QTest::keyClick(box, Qt::Key_Escape);
    EXPECT_TRUE(edit.hasFocus());
}

TEST(SaveAsJob, WhatIsWrittenRendersToTheSameBytes)
{
    TableDesk desk;
    WriteProfileString(QString(), QStringLiteral("Job Settings"), QStringLiteral("{\"lengthDecimals\": 1}"));
    WriteProfileString(QString(), QStringLiteral("Report Margins"), QStringLiteral("1500,1500,1500,1500"));
    desk.folder.put("points.txt", "7;0,3048;x\n8;1000;y\n");
    QDir(desk.folder.path()).mkdir(QStringLiteral("jobs"));
    kareport::TemplateJob job;
    job.templateFile = desk.folder.path("t.xml");
    job.templateName = QStringLiteral("T");
    job.table = QStringLiteral("Points");
    job.data = desk.folder.path("points.txt");
    job.dataOptions = {
        {QStringLiteral("delimiter"), QStringLiteral(";")},
        {QStringLiteral("decimal"), QStringLiteral(",")},
        {QStringLiteral("header"), false},
        {QStringLiteral("columns"), QJsonObject{{QStringLiteral("Number"), 1}, {QStringLiteral("North"), 2}}}};
    EXPECT_FALSE(desk.isEnabled(kareport::saveAsJobCommand));
    ASSERT_TRUE(desk.frame->OpenTemplateJob(job));
    UReportDoc *report = Desk::reports().front();
    ASSERT_TRUE(desk.frame->runs().runWith(*report, {{QStringLiteral("lengthUnit"), QStringLiteral("ft")}}));
    EXPECT_EQ(TableDesk::northings(*report), (QStringList{"1.0", "3280.8"}));
    kareport::SaveRequest asked;
    desk.frame->runs().askJobFile = [&](const kareport::SaveRequest &request) {
        asked = request;
        return std::optional(desk.folder.path("jobs/mine.json"));
    };
    ASSERT_TRUE(desk.frame->OnCommand(kareport::saveAsJobCommand));
    EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.join(u'\n').toStdString();
    EXPECT_EQ(asked.initialFolder, desk.folder.path()) << "beside the data";
    EXPECT_EQ(asked.fileName, QStringLiteral("points.json"));
    const QByteArray saved = desk.folder.bytesOf("jobs/mine.json");
    EXPECT_TRUE(saved.contains("\"../points.txt\"")) << saved.constData();
    EXPECT_TRUE(saved.contains("\"../t.xml\"")) << saved.constData();
    EXPECT_TRUE(saved.contains("\"mine.pdf\"")) << "an output is proposed";

    // The time in the page header is that of the run.
    const QString time = QStringLiteral("1700000000");
    qputenv("SOURCE_DATE_EPOCH", time.toUtf8());
    ASSERT_TRUE(desk.frame->runs().runAgain());
    ASSERT_TRUE(report->OnSaveDocument(desk.folder.path("desk.rep")));
    const ProgramRun run = runProgram(desk.folder.path(), words("render jobs/mine.json -o cli.rep --quiet"),
                                      {{"SOURCE_DATE_EPOCH", "1700000000"}});
    qunsetenv("SOURCE_DATE_EPOCH");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(desk.folder.bytesOf("cli.rep"), desk.folder.bytesOf("desk.rep"));
    EXPECT_TRUE(desk.folder.bytesOf("cli.rep").contains("3280.8"));

    // The report is that job's now.
    ASSERT_NE(desk.frame->runs().recipeInFront(), nullptr);
    EXPECT_EQ(desk.frame->runs().recipeInFront()->jobFile(), desk.folder.path("jobs/mine.json"));
    EXPECT_EQ(UApplication::Get()->GetRecentFileList().value(0), desk.folder.path("jobs/mine.json"));
    desk.folder.put("jobs/mine.json", QByteArray(saved).replace("\"ft\"", "\"m\""));
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(TableDesk::northings(*report), (QStringList{"0.3", "1000.0"}));
}

TEST(SaveAsJob, DataAndTemplateAreNeverReplaced)
{
    TableDesk desk;
    ASSERT_NE(desk.open(), nullptr);
    const QByteArray data = desk.folder.bytesOf("p.csv");
    const QByteArray text = desk.folder.bytesOf("t.xml");
    for (const char *name : {"p.csv", "t.xml"}) {
        desk.messages.clear();
        desk.frame->runs().askJobFile = [&](const kareport::SaveRequest &) {
            return std::optional(desk.folder.path(name));
        };
        ASSERT_TRUE(desk.frame->OnCommand(kareport::saveAsJobCommand));
        EXPECT_EQ(desk.messages.size(), 1) << name;
    }
    EXPECT_EQ(desk.folder.bytesOf("p.csv"), data);
    EXPECT_EQ(desk.folder.bytesOf("t.xml"), text);
    desk.frame->runs().askJobFile = [](const kareport::SaveRequest &) { return std::optional<QString>(); };
    const QStringList before = desk.folder.names();
    ASSERT_TRUE(desk.frame->OnCommand(kareport::saveAsJobCommand));
    EXPECT_EQ(desk.folder.names(), before) << "cancelled";
}

} // namespace
