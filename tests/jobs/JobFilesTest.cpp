#include "JobFiles.h"

#include "JobFolder.h"
#include "JobReader.h"
#include "JsonSource.h"

#include <QFileInfo>

#include <gtest/gtest.h>

namespace
{

TEST(JobFiles, WhatIsWatchedNeedNotBeThere)
{
    struct Row
    {
        const char *job;
        const char *files; ///< names in the folder, sorted
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"({"report": []})", "job.json", "the job alone"},
        {R"({"report": [], "template": {"file": "t.xml", "name": "T"}})", "job.json t.xml", "a template"},
        {R"({"report": [], "data": {"a": {"csv": "a.csv"}, "b": {"values": []}, "c": {"json": "c.json"}}})",
         "a.csv c.json job.json", "data in files"},
        {R"({"report": [], "data": {"a": {"sqlite": "a.db", "table": "t"}}})", "a.db a.db-wal job.json",
         "a database, whose last changes may come to a file of their own"},
        {R"({"report": [], "data": {"a": {"csv": "-"}}})", "job.json", "standard input is not a file"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        folder.put("job.json", row.job);
        const auto source = kareport::JsonSource::read(folder.path("job.json"));
        const auto job = kareport::readJob(std::get<kareport::JsonSource>(source));
        ASSERT_TRUE(std::holds_alternative<kareport::Job>(job)) << row.reason;
        QStringList names;
        for (const QString &file : kareport::watchedFiles(std::get<kareport::Job>(job), folder.path("job.json"))) {
            EXPECT_EQ(QFileInfo(file).absolutePath(), QFileInfo(folder.path()).absoluteFilePath()) << row.reason;
            names.append(QFileInfo(file).fileName());
        }
        names.sort();
        EXPECT_EQ(names.join(u' ').toStdString(), row.files) << row.reason;
    }
}

} // namespace
