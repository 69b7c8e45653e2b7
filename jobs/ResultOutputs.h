#pragma once

#include "DataUnits.h"
#include "Job.h"
#include "JobFiles.h"
#include "ResultFile.h"
#include "ResultSink.h"
#include "sXmlReportDictionary.h"

#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// The outputs of a job that are made of typed results: spreadsheets, web pages and tables of data. All of them are made in
/// the one run of the job, each with the steps that it wants.
class ResultOutputs : public ResultSink
{
public:
    /// @param job  must have been found good by `wrongResult`, and outlive this
    explicit ResultOutputs(const Job &job);

    /// The first output of a job that does not say which of the steps it has.
    static std::optional<OutputClash> wrongResult(const Job &job);

    /// The steps whose rows an output of one table may have, by their places in the job: one where it says which.
    static std::vector<std::size_t> possibleSteps(const Job &job, const ResultOptions &options);

    /// Whether the text of a job's report is of no use once its values are written: no output has it, no limit measures it,
    /// and no step takes it back.
    static bool isTextUnwanted(const Job &job);

    /// Whether the job has no such outputs.
    bool isEmpty() const { return files_.empty(); }
    /// The file of one of the job's outputs; null for an output of another kind.
    ResultFile *fileOf(const Output &output) const;

    /// The files of the pages after the first of outputs that have several, when the report is made.
    std::vector<Output> furtherPages() const;

    /// Says what the report is called, before its steps.
    void beginReport(const ResultReport &report);
    /// What is known of the data that a step writes.
    struct Data
    {
        DataUnits units;
        const sXmlReportDictionary *dictionary = nullptr; ///< of its variables
        QStringList needed; ///< variables without which the rows are not written the same again
    };
    /// Says that a step of the job comes.
    void beginStep(const Job::Step &step);
    /// Says what is known of the data of the step, before it is written.
    void describe(const Data &data) { data_ = data; }

    bool beginTable(const ResultTable &table) override;
    void addRow(const ResultRow &row) override;
    void endTable() override;
    void addText(ResultText kind, QStringView text, int style) override;

private:
    struct File
    {
        const Output *output;
        std::optional<std::size_t> step; ///< the one that it has; nothing for all
        std::unique_ptr<ResultFile> file;
        bool wantsRows = false; ///< of the table that is written
    };

    bool isWanted(const File &file) const;
    void addHiddenColumns(ResultTable &table);

    const Job &job_;
    std::vector<File> files_;
    std::size_t firstStep_ = 0; ///< that is not discarded
    std::size_t step_ = 0;
    Data data_;
    std::vector<unsigned> hidden_; ///< the identifiers of columns that the table does not show
    ResultRow row_;
};

} // namespace kareport
