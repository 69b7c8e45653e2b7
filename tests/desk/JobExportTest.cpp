#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "Interrupt.h"
#include "TableQuestion.h"

#include <QAction>
#include <QApplication>
#include <QDialog>
#include <QListWidget>
#include <QTimer>

namespace
{

/// The desk with a job of one table in a folder.
class ExportingDesk : public Desk
{
public:
    ExportingDesk()
    {
        folder.put("t.xml", "<ReportTemplate><Name>T</Name><Title>Points</Title>"
                            "<Tables><Table><Name>Points</Name><Use>D</Use><OutputList>"
                            "<Field><VariableName>Number</VariableName><Label>Pt</Label><Format>5</Format></Field>"
                            "<Field><VariableName>North</VariableName><Label>North</Label><Format>9.3</Format>"
                            "<Align>RIGHT</Align></Field></OutputList></Table></Tables>"
                            "<Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>"
                            "<Variable><ID>1</ID><VariableName>Number</VariableName><Type>NUMBER</Type></Variable>"
                            "<Variable><ID>2</ID><VariableName>North</VariableName><Type>COORDINATE</Type></Variable>"
                            "</VariableList></Dictionary></Dictionaries></ReportTemplate>");
        folder.put("p.csv", "Number,North\n1,12.5\n2,7\n");
        folder.put("job.json", R"({"template": {"file": "t.xml", "name": "T"}, "data": {"p": {"csv": "p.csv"}},
            "report": [{"table": "Points", "data": "p"}]})");
        frame->askTable = [this](const QStringList &tables) {
            offered = tables;
            return choice;
        };
        frame->askExport = [this](const kareport::SaveRequest &request) {
            asked = request.filter;
            return file;
        };
    }

    void exportTo(const char *name)
    {
        file = folder.path(name);
        EXPECT_TRUE(frame->OnCommand(kareport::fileExportCommand));
    }
    bool canExport()
    {
        frame->UpdateCommands();
        return frame->CommandAction(kareport::fileExportCommand)->isEnabled();
    }

    JobFolder folder;
    std::optional<QString> file;
    QString asked;
    QStringList offered; ///< the tables of the last question
    std::optional<std::size_t> choice;
};

/// A job that writes two tables of data of its own, and one of them twice.
QByteArray jobOfTables(const QByteArray &outputs = {})
{
    return R"({"template": {"file": "t.xml", "name": "T"}, "data": {"p": {"csv": "p.csv"}, "q": {"csv": "q.csv"}},
        "report": [{"table": "Points", "data": "p"}, {"table": "Points", "data": "q"}, {"table": "Points", "data": "p",
        "where": [{"of": "North", "above": 10}]}])" +
           (outputs.isEmpty() ? outputs : R"(, "output": [)" + outputs + ']') + '}';
}

TEST(JobExport, TheValuesOfAJobsReportAreWritten)
{
    ExportingDesk desk;
    EXPECT_FALSE(desk.canExport()) << "there is no report";
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    EXPECT_TRUE(desk.canExport());
    desk.exportTo("a.csv");
    EXPECT_EQ(desk.folder.bytesOf("a.csv"), "Number,North\n1,12.5\n2,7\n");
    EXPECT_TRUE(desk.asked.contains(u"*.xlsx"));
    desk.exportTo("a.xlsx");
    EXPECT_TRUE(desk.folder.bytesOf("a.xlsx").startsWith("PK"));
    desk.exportTo("a.html");
    EXPECT_TRUE(desk.folder.bytesOf("a.html").contains("<td class=\"n\">12.500</td>"));
    EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.join(u'\n').toStdString();
    EXPECT_EQ(Desk::reports().size(), 1U) << "no report is left of it";
}

TEST(JobExport, WhatGoesWrongIsSaid)
{
    ExportingDesk desk;
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    desk.exportTo("a.txt");
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.first().contains(u"one of the endings .xlsx, .html, .csv and .jsonl"));
    desk.exportTo("p.csv");
    ASSERT_EQ(desk.messages.size(), 2);
    EXPECT_TRUE(desk.messages.last().contains(u"is data of the job"));
    EXPECT_EQ(desk.folder.bytesOf("p.csv"), "Number,North\n1,12.5\n2,7\n");
    desk.folder.put("p.csv", "Number,North\n1,x\n");
    desk.exportTo("a.csv");
    ASSERT_EQ(desk.messages.size(), 3);
    EXPECT_TRUE(desk.messages.last().contains(u"does not fit"));
    EXPECT_FALSE(QFile::exists(desk.folder.path("a.csv")));
}

TEST(JobExport, FurtherPagesReplaceNoOtherFile)
{
    ExportingDesk desk;
    desk.folder.put("job.json", R"({"template": {"file": "t.xml", "name": "T"}, "data": {"p": {"csv": "p.csv"}},
        "report": [{"table": "Points", "data": "p"}], "output": [{"file": "x.html", "rowsPerPage": 1}]})");
    desk.folder.put("a-2.html", "<p>a page of its own</p>");
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    desk.exportTo("a.html");
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.first().contains(u"already exists")) << desk.messages.first().toStdString();
    EXPECT_EQ(desk.folder.bytesOf("a-2.html"), "<p>a page of its own</p>");
    EXPECT_FALSE(QFile::exists(desk.folder.path("a.html")));
    ASSERT_TRUE(QFile::remove(desk.folder.path("a-2.html")));
    for (int turn = 0; turn < 2; ++turn) {
        desk.exportTo("a.html");
        EXPECT_EQ(desk.messages.size(), 1) << "a page of an earlier export is replaced";
        EXPECT_TRUE(desk.folder.bytesOf("a-2.html").contains("7.000"));
    }
}

TEST(JobExport, OfSeveralTablesTheUserChoosesOne)
{
    ExportingDesk desk;
    desk.folder.put("q.csv", "Number,North\n3,4\n");
    desk.folder.put("job.json", jobOfTables());
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    desk.exportTo("a.csv");
    const QStringList tables = {QStringLiteral("Points (p)"), QStringLiteral("Points (q)"),
                                QStringLiteral("Points (p)")};
    EXPECT_EQ(desk.offered, tables);
    EXPECT_FALSE(QFile::exists(desk.folder.path("a.csv"))) << "none was chosen";
    const char *const rows[] = {"Number,North\n1,12.5\n2,7\n", "Number,North\n3,4\n", "Number,North\n1,12.5\n"};
    for (std::size_t i = 0; i < std::size(rows); ++i) {
        desk.choice = i;
        desk.exportTo("a.csv");
        EXPECT_EQ(desk.folder.bytesOf("a.csv"), rows[i]) << i << ": of the same name and data, the one of its place";
    }
    desk.offered.clear();
    desk.exportTo("a.xlsx");
    desk.exportTo("a.html");
    EXPECT_TRUE(desk.offered.isEmpty()) << "which have all of them";
    EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.join(u'\n').toStdString();
}

TEST(JobExport, TheJobSaysHowTheChosenTableIsWritten)
{
    ExportingDesk desk;
    desk.folder.put("q.csv", "Number,North\n3,4\n");
    desk.folder.put("job.json", jobOfTables(R"({"file": "x.csv", "data": "q", "delimiter": ";"})"));
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    desk.exportTo("a.csv");
    EXPECT_EQ(desk.folder.bytesOf("a.csv"), "Number;North\n3;4\n");
    EXPECT_TRUE(desk.offered.isEmpty()) << "the job has one such output";
    desk.folder.put("job.json", jobOfTables(R"({"file": "x.csv", "data": "q", "delimiter": ";"},
        {"file": "y.csv", "data": "r"})")
                                    .replace(R"("q": {)", R"("r": {"csv": "p.csv"}, "q": {)")
                                    .replace(R"("data": "p",)", R"("data": "r",)"));
    desk.choice = 1;
    desk.exportTo("b.csv");
    EXPECT_EQ(desk.offered.size(), 3) << "it has several";
    EXPECT_EQ(desk.folder.bytesOf("b.csv"), "Number;North\n3;4\n") << "as the job writes this table";
    desk.choice = 0;
    desk.exportTo("b.csv");
    EXPECT_EQ(desk.folder.bytesOf("b.csv"), "Number,North\n1,12.5\n2,7\n");
}

TEST(JobExport, TheQuestionForATable)
{
    ExportingDesk desk;
    const QStringList tables = {QStringLiteral("Points (p)"), QStringLiteral("<b>Sites (q)")};
    for (const bool isChosen : {true, false}) {
        QTimer::singleShot(0, [isChosen] {
            auto *dialog = qobject_cast<QDialog *>(QApplication::activeModalWidget());
            ASSERT_NE(dialog, nullptr);
            auto *list = dialog->findChild<QListWidget *>();
            ASSERT_NE(list, nullptr);
            EXPECT_EQ(list->count(), 2);
            QTest::keyClick(list, Qt::Key_Down);
            QTest::keyClick(list, isChosen ? Qt::Key_Return : Qt::Key_Escape);
        });
        const auto answer = kareport::askExportedTable(&*desk.frame, tables);
        EXPECT_EQ(answer, isChosen ? std::optional<std::size_t>(1) : std::nullopt);
    }
}

TEST(JobExport, OneThatIsCancelledLosesNothing)
{
    ExportingDesk desk;
    QByteArray rows = "Number,North\n";
    for (int i = 0; i < 20'000; ++i) {
        rows += QByteArray::number(i) + ",1.5\n";
    }
    desk.folder.put("p.csv", rows);
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    const QString text = Desk::textOf(*Desk::reports().front());
    const QStringList names = desk.folder.names();
    for (const char *name : {"a.csv", "a.jsonl", "a.html", "a.xlsx"}) {
        desk.folder.put(name, "kept");
        QTimer::singleShot(0, [] { kareport::setInterrupted(true); });
        desk.exportTo(name);
        kareport::setInterrupted(false);
        EXPECT_EQ(desk.folder.bytesOf(name), "kept") << name;
        EXPECT_TRUE(QFile::remove(desk.folder.path(name)));
        EXPECT_EQ(desk.folder.names(), names) << name << ": nothing half written";
    }
    EXPECT_TRUE(desk.messages.isEmpty()) << "the user knows";
    EXPECT_EQ(Desk::reports().size(), 1U);
    EXPECT_EQ(Desk::textOf(*Desk::reports().front()), text);
    desk.exportTo("a.csv");
    EXPECT_EQ(desk.folder.bytesOf("a.csv"), rows) << "another one is whole";
}

TEST(JobExport, AReportOfNoJobHasNoValues)
{
    ExportingDesk desk;
    desk.folder.put("a.rep", savedText("a line"));
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("a.rep")));
    EXPECT_FALSE(desk.canExport());
}

} // namespace
