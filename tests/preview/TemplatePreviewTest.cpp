#include "TemplatePreview.h"

#include "CommandLine.h"
#include "PreviewFixture.h"
#include "TemplateMarkup.h"

#include <QDirIterator>
#include <QJsonDocument>
#include <QJsonObject>

#include <gtest/gtest.h>

namespace
{

using kareport::JsonSource;
using kareport::PreviewCell;

/// The text of a file as the editor has it.
QString fileText(const QString &path)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    return QString::fromUtf8(file.readAll()).replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
}

/// The jobs of the examples that need nothing but files.
QStringList exampleJobs()
{
    QStringList jobs;
    QDirIterator files(QStringLiteral(KAREPORT_EXAMPLES_DIR), {QStringLiteral("*.json")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString path = files.next();
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        const QJsonObject job = QJsonDocument::fromJson(file.readAll()).object();
        if (job.contains(QStringLiteral("template")) && !path.contains(QStringLiteral("/postgresql/"))) {
            jobs.append(path);
        }
    }
    jobs.sort();
    return jobs;
}

/// A folder with a template of points, 3000 rows for it, and a job of short pages.
class PointsFolder : public JobFolder
{
public:
    explicit PointsFolder(int rows = 3000, const QByteArray &step = R"({"table": "Points", "data": "p"})")
    {
        using namespace markup;
        const QByteArray tables = output("Table", "Points", "Survey",
                                         {field("Number", "Pt", "8"), field("Northing", "North", "12.3", "RIGHT"),
                                          field("Easting", "East", "12.3", "RIGHT")});
        put("t.xml", surveyTemplate(tables, "", separatorOption("32")));
        QByteArray data = "Number,Northing,Easting\n";
        for (int row = 0; row < rows; ++row) {
            data += QByteArray::number(row + 1) + ',' + QByteArray::number((row * 7919) % 10007) + ".5," +
                    QByteArray::number(row) + ".25\n";
        }
        put("p.csv", data);
        put("job.json", R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 40, "charsPerRow": 80},
            "template": {"file": "t.xml", "name": "T"}, "data": {"p": {"csv": "p.csv"}}, "report": [)" +
                            step + "]}");
    }

    QString text() const { return fileText(path("t.xml")); }
};

TEST(TemplatePreview, ShowsWhatTheProgramWritesOfEveryExample)
{
    const QStringList jobs = exampleJobs();
    ASSERT_GT(jobs.size(), 15);
    for (const QString &job : jobs) {
        const QString folder = QFileInfo(job).path();
        QFile file(job);
        ASSERT_TRUE(file.open(QIODevice::ReadOnly));
        const QJsonObject content = QJsonDocument::fromJson(file.readAll()).object();
        const QString name = content[u"template"][u"file"].toString();
        const QString path = QDir(folder).filePath(name);
        Previewed preview(path);
        const auto wrong = preview.preview.useJob(JsonSource::read(job));
        ASSERT_FALSE(wrong) << wrong->message().toStdString();
        preview.show(fileText(path));
        const ProgramRun run = runProgram(
            folder, {QStringLiteral("render"), job, QStringLiteral("--set"),
                     QStringLiteral("now=") + content[u"now"].toString(QStringLiteral("2024-03-05T14:07:00")),
                     QStringLiteral("--quiet"), QStringLiteral("-o"), QStringLiteral("-")});
        ASSERT_EQ(run.status, 0) << job.toStdString() << run.err.toStdString();
        const QByteArray shown = preview.shown().toUtf8();
        ASSERT_TRUE(preview.result.pages) << job.toStdString() << shown.toStdString();
        EXPECT_GT(shown.size(), 100) << job.toStdString();
        EXPECT_EQ(run.out.left(shown.size()), shown) << job.toStdString();
        EXPECT_EQ(preview.result.pages->isWhole, run.out.size() == shown.size()) << job.toStdString();
        EXPECT_LE(preview.result.pages->starts.size(), std::size_t(kareport::TemplatePreview::mostPages));
    }
}

TEST(TemplatePreview, ShowsEveryExampleTemplateWithRowsMadeUp)
{
    for (const char *name : {"survey.xml", "totals.xml", "units.xml", "landxml.xml"}) {
        const QString path = QDir(QStringLiteral(KAREPORT_EXAMPLES_DIR)).filePath(QString::fromLatin1(name));
        const QString text = fileText(path);
        Previewed preview(path);
        for (const kareport::OutlineTemplate &one : kareport::outlineOf(text).templates) {
            preview.show(text, one.name.text);
            ASSERT_TRUE(preview.result.pages) << name << preview.shown().toStdString();
            EXPECT_GT(preview.result.pages->cells.size(), 20U) << name;
            const QString first = preview.shown();
            preview.show(text, one.name.text);
            EXPECT_EQ(preview.shown(), first) << "the same each time";
        }
    }
}

TEST(TemplatePreview, ReadsTheDataOnceForEveryChangeOfTheTemplate)
{
    const PointsFolder folder;
    Previewed preview(folder.path("t.xml"));
    ASSERT_FALSE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    QString text = folder.text();
    preview.show(text);
    EXPECT_EQ(preview.preview.openings(), 1);
    for (const char *label : {"Point", "P", "A very long label"}) {
        folder.put("t.xml", text.toUtf8());
        EXPECT_TRUE(wholeReport(folder.path("job.json")).startsWith(preview.shown())) << label;
        text.replace(QStringLiteral("<Label>Pt</Label>"),
                     QStringLiteral("<Label>%1</Label>").arg(QLatin1StringView(label)));
        preview.show(text);
        EXPECT_EQ(preview.preview.openings(), 1) << "a label does not change the data";
    }
    text.replace(QStringLiteral("<Sort></Sort>"), QStringLiteral("<Sort><VariableName>Northing</VariableName></Sort>"));
    preview.show(text);
    folder.put("t.xml", text.toUtf8());
    EXPECT_EQ(preview.preview.openings(), 2) << "another order";
    EXPECT_TRUE(wholeReport(folder.path("job.json")).startsWith(preview.shown()));
    EXPECT_FALSE(preview.result.pages->isWhole);
    text.replace(QStringLiteral("<Sort><VariableName>Northing</VariableName></Sort>"), QStringLiteral("<Sort></Sort>"));
    preview.show(text);
    EXPECT_EQ(preview.preview.openings(), 2) << "the order before is kept";
}

TEST(TemplatePreview, GroupsAndTotalsAreThoseOfTheWholeReport)
{
    const PointsFolder folder(200, R"({"table": "Points", "data": "p", "sort": "Number",
        "groups": [{"by": "Number", "heading": "Point {Number}, {count}", "totals": [{"label": "{count}", "sum": ["Northing"]}]}]})");
    Previewed preview(folder.path("t.xml"));
    const auto wrong = preview.preview.useJob(JsonSource::read(folder.path("job.json")));
    const QString whole = wholeReport(folder.path("job.json"));
    if (whole.startsWith(QStringLiteral("error"))) {
        FAIL() << whole.toStdString();
    }
    ASSERT_FALSE(wrong) << wrong->message().toStdString();
    preview.show(folder.text());
    EXPECT_TRUE(whole.startsWith(preview.shown())) << preview.shown().toStdString();
    EXPECT_FALSE(preview.result.pages->isWhole);
    ASSERT_FALSE(preview.result.pages->cells.empty());
    for (const PreviewCell &cell : preview.result.pages->cells) {
        EXPECT_FALSE(preview.textOf(cell).contains(u'\n'));
    }
}

TEST(TemplatePreview, EveryCellLeadsToItsField)
{
    const PointsFolder folder(100);
    Previewed preview(folder.path("t.xml"));
    ASSERT_FALSE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    const QString text = folder.text();
    preview.show(text);
    const auto &pages = *preview.result.pages;
    QStringList labels;
    int values = 0;
    for (const PreviewCell &cell : pages.cells) {
        const QString field = text.mid(cell.field.begin, cell.field.size());
        EXPECT_TRUE(field.startsWith(u"<Field>") && field.endsWith(u"</Field>")) << field.toStdString();
        if (cell.isLabel) {
            labels.append(preview.textOf(cell).trimmed());
            EXPECT_EQ(text.mid(cell.target.begin, cell.target.size()), labels.last());
        } else {
            ++values;
            EXPECT_EQ(preview.textOf(cell).contains(u'.'), !field.contains(QStringLiteral("Number")))
                << field.toStdString();
        }
    }
    EXPECT_EQ(labels.mid(0, 3), QStringList({QStringLiteral("Pt"), QStringLiteral("North"), QStringLiteral("East")}));
    EXPECT_EQ(labels.size(), 9) << "a heading on each page";
    EXPECT_EQ(values % 3, 0);
    EXPECT_GT(values, 250);
    const qint64 at = pages.text.indexOf(QStringLiteral("North"));
    ASSERT_NE(pages.cellAt(at), nullptr);
    EXPECT_TRUE(text.mid(pages.cellAt(at)->field.begin).startsWith(QStringLiteral("<Field><VariableName>Northing")));
    EXPECT_EQ(pages.cellAt(0), nullptr) << "the page header is of no field";
}

TEST(TemplatePreview, ColumnsThatChangePlacesLeadToTheirOwnFields)
{
    const PointsFolder folder(5);
    QByteArray job = folder.bytesOf("job.json");
    job.replace("\"data\": {\"p\"", "\"settings\": {\"northEastOrder\": \"EN\"}, \"data\": {\"p\"");
    folder.put("job.json", job);
    Previewed preview(folder.path("t.xml"));
    ASSERT_FALSE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    const QString text = folder.text();
    preview.show(text);
    const auto &pages = *preview.result.pages;
    const qint64 east = pages.text.indexOf(QStringLiteral("East"));
    EXPECT_LT(east, pages.text.indexOf(QStringLiteral("North"))) << pages.text.toStdString();
    ASSERT_NE(pages.cellAt(east), nullptr);
    EXPECT_TRUE(text.mid(pages.cellAt(east)->field.begin).startsWith(QStringLiteral("<Field><VariableName>Easting")));
}

TEST(TemplatePreview, ABlockLineLeadsToItsField)
{
    using namespace markup;
    const JobFolder folder;
    folder.put("t.xml", surveyTemplate("",
                                       output("Block", "Point", "Survey",
                                              {field("Number", "Pt ", "8"), field("Northing", "North ", "12.3")}),
                                       separatorOption("32")));
    Previewed preview(folder.path("t.xml"));
    const QString text = fileText(folder.path("t.xml"));
    preview.show(text, QStringLiteral("T"));
    ASSERT_TRUE(preview.result.pages) << preview.shown().toStdString();
    ASSERT_EQ(preview.result.pages->cells.size(), 2U);
    EXPECT_TRUE(preview.textOf(preview.result.pages->cells[1]).startsWith(QStringLiteral("North")));
    EXPECT_TRUE(text.mid(preview.result.pages->cells[1].field.begin).contains(QStringLiteral("Northing")));
}

TEST(TemplatePreview, SaysWhatKeepsThePagesFromBeingMade)
{
    const PointsFolder folder(5);
    Previewed preview(folder.path("t.xml"));
    ASSERT_FALSE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    QString text = folder.text();
    text.replace(QStringLiteral("<Name>Points</Name>"), QStringLiteral("<Name>Pints</Name>"));
    preview.show(text);
    EXPECT_FALSE(preview.result.pages);
    ASSERT_TRUE(preview.result.wrong);
    EXPECT_TRUE(preview.result.wrong->text.contains(QStringLiteral("Points")))
        << preview.result.wrong->text.toStdString();
    preview.show(QStringLiteral("nothing"));
    ASSERT_TRUE(preview.result.wrong);
    EXPECT_EQ(preview.result.wrong->file, folder.path("t.xml"))
        << "the author's file is named, not the one of the preview";
    EXPECT_FALSE(kareport::TemplatePreview::remarksOn(QStringLiteral("nothing")).empty());
    preview.show(folder.text());
    EXPECT_TRUE(preview.result.pages);
}

TEST(TemplatePreview, AJobOfAnotherTemplateIsRefused)
{
    const PointsFolder folder(5);
    folder.put("other.xml", folder.bytesOf("t.xml"));
    Previewed preview(folder.path("other.xml"));
    EXPECT_TRUE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    EXPECT_TRUE(preview.preview.usesSamples());
    EXPECT_TRUE(preview.preview.useJob(JsonSource::read(folder.path("none.json"))));
}

TEST(TemplatePreview, WorkThatIsStoppedIsDoneAgainWhole)
{
    const PointsFolder folder;
    Previewed preview(folder.path("t.xml"));
    ASSERT_FALSE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    QString text = folder.text();
    text.replace(QStringLiteral("<Sort></Sort>"), QStringLiteral("<Sort><VariableName>Easting</VariableName></Sort>"));
    folder.put("t.xml", text.toUtf8());
    const QString whole = wholeReport(folder.path("job.json"));
    int stops = 0;
    for (int asks = 0; asks < 12; ++asks) {
        int left = asks;
        preview.show(text, QString(), [&left] { return left-- <= 0; });
        stops += preview.result.isStopped ? 1 : 0;
        EXPECT_EQ(preview.result.isStopped, !preview.result.pages) << asks;
        preview.show(text);
        ASSERT_TRUE(preview.result.pages) << asks;
        EXPECT_TRUE(whole.startsWith(preview.shown())) << asks;
    }
    EXPECT_GE(stops, 2);
}

TEST(TemplatePreview, ABlockReadsAllRowsOnce)
{
    const PointsFolder folder(3000);
    QByteArray content = folder.bytesOf("t.xml");
    content.replace("<Blocks></Blocks>",
                    "<Blocks>" + markup::output("Block", "First", "Survey", {markup::field("Number", "Pt", "8")}) +
                        "</Blocks>");
    folder.put("t.xml", content);
    QByteArray job = folder.bytesOf("job.json");
    job.replace("\"table\": \"Points\"", "\"block\": \"First\"");
    folder.put("job.json", job);
    Previewed preview(folder.path("t.xml"));
    ASSERT_FALSE(preview.preview.useJob(JsonSource::read(folder.path("job.json"))));
    for (int run = 0; run < 3; ++run) {
        preview.show(QString::fromUtf8(content));
        EXPECT_EQ(preview.shown(), wholeReport(folder.path("job.json")));
        EXPECT_EQ(preview.preview.openings(), 1);
    }
    folder.put("p.csv", folder.bytesOf("p.csv") + "x,y,z\n");
    Previewed other(folder.path("t.xml"));
    ASSERT_FALSE(other.preview.useJob(JsonSource::read(folder.path("job.json"))));
    for (int run = 0; run < 2; ++run) {
        other.show(QString::fromUtf8(content));
        EXPECT_FALSE(other.result.pages) << "a row that is wrong is wrong in each run";
    }
}

} // namespace
