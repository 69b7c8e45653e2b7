#include "RandomTable.h"
#include "ResultJob.h"
#include "TestSize.h"

#include <gtest/gtest.h>

// Random tables of all types in random units and settings: what is written as CSV and JSON lines, read as the data of the
// same job, gives the same report.

namespace
{

using jobs::RandomTable;
using jobs::ResultJob;

TEST(ResultRoundTrip, WhatIsWrittenIsReadAsTheSameReport)
{
    const int runs = testSize(300, 5000);
    int rows = 0;
    for (int run = 0; run < runs && !testing::Test::HasFailure(); ++run) {
        const auto seed = static_cast<quint64>(run) + 1;
        SCOPED_TRACE(testing::Message() << "seed " << seed);
        RandomTable table(seed);
        ResultJob job;
        job.folder.put("t.xml", table.templateFile());
        table.chooseUnits();
        job.folder.put("in.csv", table.csv());
        job.run(
            table.job("csv", "in.csv", R"("out.csv", "out.jsonl", {"file": "semi", "as": "csv", "delimiter": ";"})"));
        ASSERT_EQ(job.error.toStdString(), "");
        const QString text = job.text;
        const auto files = job.files;
        rows += static_cast<int>(text.count(u'\n'));
        for (const auto &[name, bytes] : files) {
            job.folder.put(name.c_str(), QByteArray::fromStdString(bytes));
        }
        job.run(table.job("csv", "out.csv", R"("out.csv")"));
        EXPECT_EQ(job.error.toStdString() + job.text.toStdString(), text.toStdString()) << files.at("out.csv");
        EXPECT_EQ(job.bytes("out.csv"), files.at("out.csv")) << "written again, it is the same";
        job.run(table.job("csv", R"(semi", "delimiter": ";)", R"("out.csv")"));
        EXPECT_EQ(job.error.toStdString() + job.text.toStdString(), text.toStdString()) << files.at("semi");
        if (files.at("out.jsonl").empty()) {
            continue; // data in JSON lines has a row at least
        }
        job.run(table.job("json", "out.jsonl", R"("out.jsonl")"));
        EXPECT_EQ(job.error.toStdString() + job.text.toStdString(), text.toStdString()) << files.at("out.jsonl");
        EXPECT_EQ(job.bytes("out.jsonl"), files.at("out.jsonl"));
    }
    EXPECT_GT(rows, runs) << "there were rows to write";
}

} // namespace
