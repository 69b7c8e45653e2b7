#include "DeskCommandIds.h"
#include "DeskFixture.h"

#include <QAction>

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
};

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

TEST(JobExport, AReportOfNoJobHasNoValues)
{
    ExportingDesk desk;
    desk.folder.put("a.rep", savedText("a line"));
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("a.rep")));
    EXPECT_FALSE(desk.canExport());
}

} // namespace
