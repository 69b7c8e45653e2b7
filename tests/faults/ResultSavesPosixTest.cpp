#include "FailEachCall.h"

#include "JobOutputs.h"
#include "JobRunnerFixture.h"
#include "ResultOutputs.h"

#include <optional>

namespace
{

using namespace kareport;

/// A job whose outputs are made of its results, run again for each attempt to write them.
class ResultSaves : public testing::Test
{
protected:
    /// @param rows  of the table
    void read(const char *output, int rows)
    {
        folder_.put("t.xml", jobs::pointsTemplate());
        QByteArray data = "Number,Northing\n";
        for (int row = 0; row < rows; ++row) {
            data += 'P' + QByteArray::number(row) + ',' + QByteArray::number(row * 1.25) + '\n';
        }
        folder_.put("points.csv", data);
        folder_.put("job.json", jobs::fixedFront +
                                    jobs::templateJob(R"("points": {"csv": "points.csv"})",
                                                      R"({"table": "Points", "data": "points"})") +
                                    R"(, "output": [)" + output + "]}");
        auto source = JsonSource::read(folder_.path("job.json"));
        ASSERT_EQ(errorOf(source), nullptr);
        source_ = std::move(std::get<JsonSource>(source));
        auto job = readJob(source_);
        ASSERT_EQ(errorOf(job), nullptr) << errorOf(job)->message().toStdString();
        job_ = std::move(std::get<Job>(job));
    }

    void make()
    {
        results_.reset();
        report_.emplace(surroundingsOf(job_));
        report_->SetAutoDelete(false);
        results_.emplace(job_);
        Progress progress(false);
        JobRunner runner(job_, source_, progress);
        runner.setResults(&*results_);
        const auto error = runner.run(*report_);
        ASSERT_FALSE(error) << error->message().toStdString();
    }

    OutputResult write(const Output &output)
    {
        Progress progress(false);
        return writeOutput(*report_, output, progress, results_->fileOf(output));
    }

    FixedSurroundings surroundings_;
    JobFolder folder_;
    JsonSource source_;
    Job job_;
    std::optional<UReportDoc> report_;
    std::optional<ResultOutputs> results_;
};

TEST_F(ResultSaves, AreWholeOrNotWritten)
{
    struct Row
    {
        const char *output;
        int rows;
        const char *reason;
    };
    const int many = testSize(2'000, 20'000);
    const Row rows[] = {
        {R"({"file": "p.csv", "schema": "p.schema.json"})", 3, "rows of data, and what says their units"},
        {R"({"file": "p.jsonl"})", 3, "an object a line"},
        {R"({"file": "p.html"})", 3, "a web page"},
        {R"({"file": "p.xlsx"})", 3, "a workbook"},
        {R"({"file": "p.jsonl"})", many, "more than is kept in memory"},
        {R"({"file": "p.html"})", many, "a web page, likewise"},
        {R"({"file": "p.xlsx"})", many, "a workbook, likewise"},
    };
    for (const Row &row : rows) {
        SCOPED_TRACE(row.reason);
        read(row.output, row.rows);
        for (const Output &output : job_.outputs) {
            SCOPED_TRACE(output.file.toStdString());
            OutputResult result;
            failEachCall(
                output.file, [this] { make(); },
                [&] {
                    result = write(output);
                    return result.isWritten();
                },
                [&] {
                    EXPECT_TRUE(result.problem->contains(QStringLiteral("could not be written")))
                        << result.problem->toStdString();
                });
        }
    }
}

TEST_F(ResultSaves, APageThatFailsLeavesTheEarlierFirstPage)
{
    read(R"({"file": "p.html", "rowsPerPage": 2})", 5);
    const Output &output = job_.outputs.front();
    for (qint64 number = 1;; ++number) {
        SCOPED_TRACE(number);
        make();
        putFile(output.file, "earlier");
        bool isWritten = false;
        bool hasFailed = false;
        {
            const FailingFiles failing(FailingFiles::Call::Rename, number);
            isWritten = write(output).isWritten();
            hasFailed = failing.hasFailed();
        }
        EXPECT_EQ(isWritten, !hasFailed);
        EXPECT_EQ(contentOf(output.file) == "earlier", hasFailed) << "it leads to pages that are there";
        if (!hasFailed) {
            EXPECT_EQ(number, 4) << "three pages";
            return;
        }
    }
}

} // namespace
