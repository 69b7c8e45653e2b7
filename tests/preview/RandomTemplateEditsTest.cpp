#include "PreviewFixture.h"
#include "RandomSequence.h"
#include "TestSize.h"

#include <gtest/gtest.h>

#include <cstdio>

namespace
{

using kareport::JsonSource;

const char *const pieces[] = {
    "<Field>",  "</Field>",
    "<Label>",  "</Label>",
    "</>",      "<Sort><VariableName>Northing</VariableName></Sort>",
    "x",        " ",
    "\t",       "\n",
    "12.3",     "RIGHT",
    "CENTER",   "<!--",
    "-->",      "<Table>",
    "</Table>", "FLAG",
    "FILLER",   "<Field><VariableName>Order</VariableName><Label>O</Label><Format>6</Format></Field>",
    "SUFFIX_+", "LENGTH",
    "INTEGER",  "STATION",
    "Ä",        "\xF0\x9F\x93\x90",
    "<",        ">",
    "&amp;",    "0",
    "32",       "9"};

QString edited(QString text, RandomNumbers &random)
{
    const int size = static_cast<int>(text.size());
    const int at = random.below(size + 1);
    switch (random.below(6)) {
    case 0:
    case 1:
    case 2: text.insert(at, QString::fromUtf8(pieces[random.below(int(std::size(pieces)))])); break;
    case 3: text.remove(at, 1 + random.below(3)); break;
    case 4: text.remove(at, random.below(60)); break;
    default: text.insert(random.below(size + 1), text.mid(at, random.below(120))); break;
    }
    return text;
}

/// A page that was made of kept data is the one that a fresh run makes, whatever the author has typed.
TEST(RandomTemplateEdits, EveryPageIsThatOfAFreshRun)
{
    const int edits = testSize(400, 10'000);
    const JobFolder folder;
    QFile file(QStringLiteral(KAREPORT_EXAMPLES_DIR "/survey.xml"));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    const QString whole = QString::fromUtf8(file.readAll());
    const qsizetype end = whole.indexOf(QStringLiteral("<Name>STAKEOUT</Name>"));
    const QString first = whole.left(whole.lastIndexOf(QStringLiteral("<ReportTemplate>"), end));
    QFile data(QStringLiteral(KAREPORT_EXAMPLES_DIR "/data/control.csv"));
    ASSERT_TRUE(data.open(QIODevice::ReadOnly));
    folder.put("p.csv", data.readAll());
    folder.put("t.xml", first.toUtf8());
    folder.put("job.json", R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 20, "charsPerRow": 100},
        "template": {"file": "t.xml", "name": "CONTROL"}, "data": {"p": {"csv": "p.csv", "delimiter": ","},
        "n": {"values": {"Project": "A", "Grid": "B", "ScaleFactor": 0.99987}}},
        "report": [{"block": "Network", "data": "n", "after": 1}, {"table": "Points", "data": "p"}]})");
    Previewed preview(folder.path("t.xml"));
    const auto wrong = preview.preview.useJob(JsonSource::read(folder.path("job.json")));
    ASSERT_FALSE(wrong) << wrong->message().toStdString();
    Previewed samples(folder.path("t.xml"));
    RandomNumbers random(20240305);
    QString text = first;
    int shown = 0;
    for (int edit = 0; edit < edits; ++edit) {
        text = random.below(8) == 0 ? first : edited(text, random);
        folder.put("t.xml", text.toUtf8());
        preview.show(text);
        const QString report = wholeReport(folder.path("job.json"));
        if (preview.result.pages) {
            ++shown;
            const QString pages = preview.shown();
            // A run that stops early does not see what is wrong with rows that are not shown.
            const bool isSame = preview.result.pages->isWhole ? report == pages : report.startsWith(pages);
            ASSERT_TRUE(isSame) << "edit " << edit << "\n"
                                << text.toStdString() << "\n"
                                << pages.toStdString() << "\n"
                                << report.toStdString();
            for (const kareport::PreviewCell &cell : preview.result.pages->cells) {
                ASSERT_LE(cell.at + cell.size, preview.result.pages->text.size());
                ASSERT_GE(cell.target.begin, 0);
                ASSERT_LE(cell.target.end, text.size());
                ASSERT_LE(cell.field.end, text.size());
            }
        } else {
            ASSERT_TRUE(preview.result.wrong) << edit;
            ASSERT_EQ(report, QStringLiteral("error: ") + preview.result.wrong->text) << "edit " << edit;
        }
        samples.show(text, QStringLiteral("CONTROL"));
        ASSERT_TRUE(samples.result.pages || samples.result.wrong) << edit;
    }
    std::printf("%d edits, %d with pages\n", edits, shown);
    EXPECT_GT(shown, edits / 4) << "most edits are to leave something to show";
}

} // namespace
