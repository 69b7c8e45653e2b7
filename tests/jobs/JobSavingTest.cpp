#include "JobSaving.h"

#include "JobRunnerFixture.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

class SavedJob : public testing::Test
{
protected:
    SavedJob()
    {
        folder.put("t.xml", jobs::pointsTemplate());
        folder.put("p.csv", "Number;Northing\n1;2,5\n");
        QDir(folder.path()).mkdir(QStringLiteral("sub"));
        QDir(folder.path()).mkdir(QStringLiteral("installed"));
        folder.put("installed/own.xml", jobs::pointsTemplate());
        defaults.templateFolder = folder.path("installed");
        chosen.templateFile = folder.path("t.xml");
        chosen.templateName = QStringLiteral("T");
        chosen.table = QStringLiteral("Points");
        chosen.data = folder.path("p.csv");
        chosen.dataOptions = {{QStringLiteral("delimiter"), QStringLiteral(";")},
                              {QStringLiteral("decimal"), QStringLiteral(",")}};
    }

    QJsonObject saved(const ReportRecipe &recipe, const char *file)
    {
        const auto made = jobFileOf(recipe, defaults, folder.path(file));
        if (const InputError *wrong = errorOf(made)) {
            ADD_FAILURE() << wrong->message().toStdString();
            return {};
        }
        return QJsonDocument::fromJson(std::get<QByteArray>(made)).object();
    }
    QString wrong(const ReportRecipe &recipe, const char *file) const
    {
        const auto made = jobFileOf(recipe, defaults, folder.path(file));
        const InputError *error = errorOf(made);
        return error != nullptr ? error->message() : QString();
    }

    JobFolder folder;
    JobDefaults defaults;
    TemplateJob chosen;
};

TEST_F(SavedJob, FilesAreNamedFromItsFolder)
{
    const QJsonObject beside = saved(chosen, "job.json");
    EXPECT_EQ(beside[u"template"][u"file"], QJsonValue("t.xml"));
    EXPECT_EQ(beside[u"data"][u"data"][u"csv"], QJsonValue("p.csv"));
    EXPECT_EQ(beside[u"data"][u"data"][u"delimiter"], QJsonValue(";"));
    EXPECT_EQ(beside[u"data"][u"data"][u"decimal"], QJsonValue(","));
    EXPECT_EQ(beside[u"output"], QJsonValue(QJsonArray{"job.pdf"}));
    const QJsonObject below = saved(chosen, "sub/a.b.json");
    EXPECT_EQ(below[u"template"][u"file"], QJsonValue("../t.xml"));
    EXPECT_EQ(below[u"data"][u"data"][u"csv"], QJsonValue("../p.csv"));
    EXPECT_EQ(below[u"output"], QJsonValue(QJsonArray{"a.b.pdf"}));

    // The way up from a linked folder leads to the folder above the real one.
    QDir(folder.path()).mkpath(QStringLiteral("deep/er"));
    ASSERT_TRUE(QFile::link(folder.path("deep/er"), folder.path("link")));
    EXPECT_EQ(saved(chosen, "link/job.json")[u"data"][u"data"][u"csv"], QJsonValue("../../p.csv"));

    chosen.data = folder.path("-");
    folder.put("-", "Number;Northing\n");
    EXPECT_EQ(saved(chosen, "job.json")[u"data"][u"data"][u"csv"], QJsonValue("./-")) << "a file, not standard input";
}

TEST_F(SavedJob, HoldsWhatTheProgramHadForIt)
{
    defaults.settings.lengthUnit = LengthUnit::UsSurveyFoot;
    defaults.settings.lengthDecimals = 1;
    defaults.page.portrait = false;
    defaults.page.margins = QMargins(1, 2, 3, 4);
    defaults.page.fontSize = 11;
    defaults.page.printer.paper = PaperSize::Letter;
    ReportRecipe recipe(chosen);
    recipe.settings = {{QStringLiteral("lengthDecimals"), 2},
                       {QStringLiteral("stationFormat"), QStringLiteral("0+00")}};
    const auto made = jobFileOf(recipe, defaults, folder.path("job.json"));
    ASSERT_EQ(errorOf(made), nullptr);
    const auto read = JsonSource::fromBytes(folder.path("job.json"), std::get<QByteArray>(made));
    ASSERT_EQ(errorOf(read), nullptr);
    const auto again = readJob(std::get<JsonSource>(read)); // where nothing of these preferences is known
    ASSERT_EQ(errorOf(again), nullptr);
    const auto &job = std::get<Job>(again);
    EXPECT_EQ(job.settings.lengthUnit, LengthUnit::UsSurveyFoot);
    EXPECT_EQ(job.settings.lengthDecimals, 2) << "what was chosen for the report counts";
    EXPECT_EQ(job.settings.stationFormat, UJobSettings::StationFormat::HundredsPlus);
    EXPECT_FALSE(job.page.portrait);
    EXPECT_EQ(job.page.margins, QMargins(1, 2, 3, 4));
    EXPECT_EQ(job.page.fontSize, 11);
    EXPECT_EQ(job.page.printer.paper, PaperSize::Letter);
    defaults.page.printer.paper = PaperSize::ByLocale;
    const QJsonValue paper = saved(chosen, "job.json")[u"page"][u"paper"];
    EXPECT_TRUE(paper == QJsonValue("A4") || paper == QJsonValue("Letter"));
}

TEST_F(SavedJob, AJobKeepsWhatItSays)
{
    const QByteArray content = R"({"title": "Mine", "now": "2024-03-05T14:07:00", "strict": true,
        "page": {"paper": "A3", "linesPerPage": 50}, "settings": {"lengthUnit": "km"},
        "template": {"file": "own.xml", "name": "T"},
        "data": {"v": {"values": [{"Number": "1"}]}, "c": {"csv": "p.csv", "delimiter": ";", "decimal": ","},
                 "q": {"postgresql": "service=x", "query": "SELECT 1"}},
        "report": [{"table": "Points", "data": "c", "after": 2}], "output": ["out.rep", "-"],
        "pdf": {"author": "A"}})";
    folder.put("job.json", content);
    const QJsonObject expected = QJsonDocument::fromJson(content).object();
    const QJsonObject job = saved(folder.path("job.json"), "sub/new.json");
    for (const char *key : {"title", "now", "strict", "report", "output", "pdf"}) {
        EXPECT_EQ(job[QLatin1StringView(key)], expected[QLatin1StringView(key)]) << key;
    }
    EXPECT_EQ(job[u"template"][u"file"], QJsonValue("own.xml")) << "it is installed";
    EXPECT_EQ(job[u"data"][u"v"], expected[u"data"][u"v"]);
    EXPECT_EQ(job[u"data"][u"q"], expected[u"data"][u"q"]);
    EXPECT_EQ(job[u"data"][u"c"][u"csv"], QJsonValue("../p.csv"));
    EXPECT_EQ(job[u"page"][u"paper"], QJsonValue("A3"));
    EXPECT_EQ(job[u"page"][u"linesPerPage"], QJsonValue(50));
    EXPECT_EQ(job[u"settings"][u"lengthUnit"], QJsonValue("km"));
    // Another file of the installed one's name would be taken for it.
    folder.put("sub/own.xml", "x");
    EXPECT_EQ(saved(folder.path("job.json"), "sub/new.json")[u"template"][u"file"], QJsonValue("../installed/own.xml"));
    EXPECT_TRUE(wrong(folder.path("job.json"), "job.json").isEmpty()) << "it may be written again";
}

TEST_F(SavedJob, TakesThePlaceOfNothingThatItIsMadeOf)
{
    EXPECT_TRUE(wrong(chosen, "p.csv").contains(QStringLiteral("is data of the job")));
    EXPECT_TRUE(wrong(chosen, "t.xml").contains(QStringLiteral("is the template of the job")));
    EXPECT_TRUE(wrong(chosen, "sub/../p.csv").contains(QStringLiteral("is data of the job"))) << "by another way";
    folder.put("job.json", R"({"report": [{"line": "x"}], "output": ["out.rep"]})");
    EXPECT_TRUE(wrong(folder.path("job.json"), "out.rep").contains(QStringLiteral("is the job itself")))
        << "its own output would replace it";
    EXPECT_TRUE(wrong(folder.path("gone.json"), "job.json").contains(QStringLiteral("gone.json")));

    const QByteArray before = folder.bytesOf("p.csv");
    EXPECT_TRUE(saveJob(chosen, defaults, folder.path("p.csv")).has_value());
    EXPECT_EQ(folder.bytesOf("p.csv"), before);
    EXPECT_TRUE(saveJob(chosen, defaults, folder.path("gone/job.json")).has_value()) << "there is no such folder";
    EXPECT_FALSE(saveJob(chosen, defaults, folder.path("job.json")).has_value());
    EXPECT_TRUE(folder.bytesOf("job.json").startsWith("{\n    \"page\"")) << "in the order in which people read";
}

} // namespace
