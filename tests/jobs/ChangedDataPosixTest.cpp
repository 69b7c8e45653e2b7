#include "GeoPackageFile.h"
#include "JobRunnerFixture.h"
#include "RandomRuns.h"
#include "RandomSequence.h"

#include <cmath>
#include <cstdlib>

#include <sys/resource.h>

// Files of data that are changed anywhere are read or refused, soon and without much memory.

namespace
{

using jobs::templateJob;
using jobs::TestJob;

struct Source
{
    const char *set;    ///< of the job, whose file is data
    QByteArray content; ///< of the file
};

QByteArray layer()
{
    const JobFolder folder;
    QByteArray sql = geo::packageSql() +
                     "CREATE TABLE points (fid INTEGER PRIMARY KEY, Number TEXT, geom BLOB);"
                     "INSERT INTO gpkg_geometry_columns VALUES ('points', 'geom', 'POINT', 25832, 0, 0);";
    for (int i = 0; i < 200; ++i) {
        sql += "INSERT INTO points VALUES (" + QByteArray::number(i + 1) + ", 'P" + QByteArray::number(i) + "', " +
               geo::pointLiteral(i, i / 2.0, i % 2 == 0 ? 5 : std::nan(""), std::nan(""), 25832, i % 3 != 0, i % 5) +
               ");";
    }
    geo::runSql(folder.path("p.gpkg"), sql);
    return folder.bytesOf("p.gpkg");
}

std::vector<Source> sources()
{
    QByteArray csv = "Number,Northing,\"Note\"\r\n";
    QByteArray blanks;
    QByteArray json = "[";
    QByteArray lines;
    for (int i = 0; i < 40; ++i) {
        const QByteArray number = QByteArray::number(i);
        csv += number + "," + number + ".5,\"a \"\"" + number + "\"\"\"\r\n";
        blanks += " " + number + "  1'234,5 3,25\t" + number + " \"tree, oak\"\n# remark\n\n";
        const QByteArray object =
            R"({"Number": ")" + number + R"(\u00e4", "Northing": -1.25e2, "Done": true, "x": [1, {}]})";
        json += (i > 0 ? ",\n" : "") + object;
        lines += object + "\n";
    }
    QByteArray wide = "\xFF\xFE";
    for (const char byte : csv) {
        wide += byte;
        wide += '\0';
    }
    std::vector<Source> made;
    made.push_back({R"("csv": "data")", csv});
    made.push_back({R"("csv": "data", "delimiter": "auto", "encoding": "windows-1252")", csv});
    made.push_back({R"("csv": "data", "encoding": "utf-16")", wide});
    made.push_back({R"("csv": "data", "delimiter": "whitespace", "header": false, "order": "PNEZD", "decimal": ",",
                       "thousands": "'", "comment": "#", "skipBlankLines": true)",
                    blanks});
    made.push_back({R"("json": "data")", json + "]"});
    made.push_back({R"("json": "data")", lines});
    made.push_back({R"("sqlite": "data", "table": "points", "columns": {"Northing": "@y", "Note": "@srs"})", layer()});
    made.push_back({R"("sqlite": "data", "query": "SELECT Number, geom FROM points ORDER BY Number DESC",
                       "columns": {"Northing": "@x"})",
                    layer()});
    return made;
}

QByteArray changed(QByteArray content, RandomNumbers &random)
{
    constexpr const char *pieces[] = {"\"", ",", "\n",   "\r",       "\xFF", "{", "]",  "9e999",
                                      "'",  ";", "\x80", "\xC3\xA4", "NAN",  "-", "\\", "1+5"};
    for (int i = random.below(6); i >= 0; --i) {
        const int at = random.below(int(content.size()) + 1);
        switch (random.below(6)) {
        case 0: content.remove(at, random.below(40)); break;
        case 1: content.insert(at, pieces[random.below(std::size(pieces))]); break;
        case 2: content.insert(at, content.mid(random.below(int(content.size()) + 1), random.below(300))); break;
        case 3: content.truncate(std::max(at, 1)); break;
        default:
            if (at < content.size()) {
                content[at] = static_cast<char>(random.below(256));
            }
        }
    }
    return content;
}

long peakKilobytes()
{
    rusage usage = {};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss;
}

void readChanged(const char *what, int count)
{
    const std::vector<Source> all = sources();
    const char *const steps[] = {R"({"table": "Points", "data": "p"})", R"({"table": "Sorted", "data": "p"})",
                                 R"({"block": "Point", "data": "p"})"};
    const auto job = [&](const Source &source, int step) {
        return templateJob(QByteArray(R"("p": {)") + source.set + "}", steps[step]);
    };
    TestJob test;
    for (const Source &source : all) {
        for (int step = 0; step < 3; ++step) {
            test.folder.put("data", source.content);
            test.run(job(source, step));
            ASSERT_FALSE(test.error) << source.set << ": " << test.text().toStdString();
        }
    }
    [[maybe_unused]] const long before = peakKilobytes(); // under the sanitizers memory is not looked at
    std::vector<int> sound(all.size());
    RandomRuns runs(what, 1, count);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        const auto index = static_cast<std::size_t>(random.below(int(all.size())));
        const Source &source = all[index];
        test.folder.put("data", changed(source.content, random));
        test.run(job(source, random.below(3)));
        sound[index] += test.error ? 0 : 1;
        ASSERT_TRUE(!test.error || !test.error->text.isEmpty()) << "seed " << runs.seed();
        ASSERT_TRUE(!test.error || !test.error->file.isEmpty()) << "seed " << runs.seed();
    }
    for (std::size_t i = 0; i < all.size(); ++i) {
        EXPECT_GT(sound[i], 0) << "some changes do no harm: " << all[i].set;
    }
#if !defined(__SANITIZE_ADDRESS__)
    constexpr long mostKilobytes = 64 * 1024; // the largest file has 0.1 MB
    EXPECT_LT(peakKilobytes() - before, mostKilobytes);
#endif
}

TEST(ChangedData, IsReadOrRefused)
{
    readChanged("changed data", 2000);
}

TEST(ManyChangedData, AreReadOrRefused)
{
    readChanged("many changed data", 10'000);
}

} // namespace
