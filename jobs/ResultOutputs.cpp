#include "ResultOutputs.h"

#include "CsvResult.h"
#include "HtmlResult.h"
#include "JsonLinesResult.h"
#include "ResultColumns.h"
#include "ResultSchema.h"
#include "TextFolding.h"
#include "UDataObject.h"
#include "Xlate.h"
#include "XlsxResult.h"

#include <QFileInfo>

#include <algorithm>
#include <variant>

namespace kareport
{

namespace
{

/// The first step that none after it discards.
std::size_t firstKeptStep(const Job &job)
{
    std::size_t first = 0;
    for (std::size_t i = 0; i < job.steps.size(); ++i) {
        first = std::holds_alternative<Job::Clear>(job.steps[i].action) ? i + 1 : first;
    }
    return first;
}

bool isNamed(const QString &wanted, const QString &name)
{
    return wanted.isEmpty() || equalFolded(wanted, name);
}

/// The steps of one sort that an output asks for.
template <typename Action>
std::vector<std::size_t> stepsOf(const Job &job, const QString &name, const QString &data)
{
    std::vector<std::size_t> steps;
    for (std::size_t i = firstKeptStep(job); i < job.steps.size(); ++i) {
        const auto *action = std::get_if<Action>(&job.steps[i].action);
        if (action != nullptr && isNamed(name, action->name) && (data.isEmpty() || data == action->data)) {
            steps.push_back(i);
        }
    }
    return steps;
}

/// The name of the data set that a step writes; empty for one without data.
QString dataOf(const Job::Step &step)
{
    if (const auto *table = std::get_if<Job::Table>(&step.action)) {
        return table->data;
    }
    const auto *block = std::get_if<Job::Block>(&step.action);
    return block != nullptr ? block->data : QString();
}

/// @param step  whose rows it has; null where it has those of all
std::unique_ptr<ResultFile> makeFile(const Output &output, const Job::Step *step)
{
    ResultOptions options = output.results;
    options.data = step != nullptr ? dataOf(*step) : QString();
    switch (output.kind) {
    case OutputKind::Html:
        return std::make_unique<HtmlResult>(options,
                                            output.isStandardOutput() ? QString() : QFileInfo(output.file).fileName());
    case OutputKind::Xlsx: return std::make_unique<XlsxResult>(options);
    case OutputKind::Csv: return std::make_unique<CsvResult>(options);
    case OutputKind::JsonLines: return std::make_unique<JsonLinesResult>(options);
    case OutputKind::Schema: return std::make_unique<ResultSchema>(options);
    default: return nullptr;
    }
}

} // namespace

std::optional<OutputClash> ResultOutputs::wrongResult(const Job &job)
{
    for (std::size_t i = 0; i < job.outputs.size(); ++i) {
        const Output &output = job.outputs[i];
        const auto steps = isOfOneTable(output.kind) ? possibleSteps(job, output.results) : std::vector<std::size_t>(1);
        if (steps.size() == 1) {
            continue;
        }
        const QString text =
            steps.empty() ? Xlate("\"%1\" has the rows of a table or a block, and no such step of the job writes one")
                          : Xlate("\"%1\" has the rows of one step, and %2 steps may be meant: keys \"table\", "
                                  "\"block\" or \"data\" that leave one of them were expected");
        return OutputClash{static_cast<qsizetype>(output.sideOf.value_or(i)),
                           steps.empty() ? text.arg(output.file)
                                         : text.arg(output.file, QString::number(steps.size()))};
    }
    return std::nullopt;
}

/// Those of a table or, where the output does not ask for one, of a block.
std::vector<std::size_t> ResultOutputs::possibleSteps(const Job &job, const ResultOptions &options)
{
    if (options.step) {
        return {*options.step};
    }
    auto steps = options.block.isEmpty() ? stepsOf<Job::Table>(job, options.table, options.data)
                                         : stepsOf<Job::Block>(job, options.block, options.data);
    if (steps.empty() && options.table.isEmpty() && options.block.isEmpty()) {
        steps = stepsOf<Job::Block>(job, QString(), options.data);
    }
    return steps;
}

bool ResultOutputs::isTextUnwanted(const Job &job)
{
    return std::all_of(job.outputs.begin(), job.outputs.end(),
                       [](const Output &output) { return isMadeOfResults(output.kind) && !output.mostBytes; }) &&
           firstKeptStep(job) == 0;
}

ResultOutputs::ResultOutputs(const Job &job) : job_(job), firstStep_(firstKeptStep(job))
{
    for (const Output &output : job.outputs) {
        const auto steps = isOfOneTable(output.kind) ? possibleSteps(job, output.results) : std::vector<std::size_t>();
        auto file = makeFile(output, steps.empty() ? nullptr : &job.steps[steps.front()]);
        if (!file) {
            continue;
        }
        if (output.mostBytes) {
            file->limitTo(*output.mostBytes);
        }
        files_.push_back(
            {&output, steps.empty() ? std::nullopt : std::optional(steps.front()), std::move(file), false});
    }
}

ResultFile *ResultOutputs::fileOf(const Output &output) const
{
    const auto found =
        std::find_if(files_.begin(), files_.end(), [&output](const File &file) { return file.output == &output; });
    return found != files_.end() ? found->file.get() : nullptr;
}

std::vector<Output> ResultOutputs::furtherPages() const
{
    std::vector<Output> pages;
    for (const File &file : files_) {
        for (std::size_t page = 2; page <= file.file->pageCount(); ++page) {
            Output output = *file.output;
            output.file = HtmlResult::pageName(output.file, page);
            output.sideOf = static_cast<std::size_t>(file.output - job_.outputs.data());
            pages.push_back(output);
        }
    }
    return pages;
}

void ResultOutputs::beginReport(const ResultReport &report)
{
    for (const File &file : files_) {
        file.file->beginReport(report);
    }
}

void ResultOutputs::beginStep(const Job::Step &step)
{
    step_ = static_cast<std::size_t>(&step - job_.steps.data());
    data_ = Data();
}

bool ResultOutputs::isWanted(const File &file) const
{
    return step_ >= firstStep_ && (!file.step || *file.step == step_);
}

/// Makes columns of the variables that the table does not show and that make its rows what they are.
void ResultOutputs::addHiddenColumns(ResultTable &table)
{
    hidden_.clear();
    for (const QString &name : data_.needed) {
        auto column = hiddenColumn(name, *data_.dictionary);
        const bool isColumn = column && std::any_of(table.columns.begin(), table.columns.end(), [&](const auto &other) {
                                  return other.field.ID == column->field.ID && other.isVariable;
                              });
        if (column && !isColumn) {
            hidden_.push_back(static_cast<unsigned>(column->field.ID));
            describeColumn(*column, *data_.dictionary, data_.units);
            table.columns.push_back(*column);
        }
    }
}

bool ResultOutputs::beginTable(const ResultTable &table)
{
    if (data_.dictionary == nullptr || step_ < firstStep_) {
        return false;
    }
    ResultTable described = table;
    if (const auto *block = std::get_if<Job::Block>(&job_.steps[step_].action)) {
        described.name = block->name;
    }
    for (ResultColumn &column : described.columns) {
        describeColumn(column, *data_.dictionary, data_.units);
    }
    addHiddenColumns(described);
    bool isAnyWanted = false;
    for (File &file : files_) {
        file.wantsRows = isWanted(file) && file.file->beginTable(described);
        isAnyWanted = isAnyWanted || file.wantsRows;
    }
    return isAnyWanted;
}

void ResultOutputs::addRow(const ResultRow &row)
{
    const ResultRow *whole = &row;
    if (!hidden_.empty()) {
        row_ = row;
        for (const unsigned key : hidden_) {
            row_.cells.push_back({row.object != nullptr ? row.object->Find(key) : nullptr, QStringView()});
        }
        whole = &row_;
    }
    for (const File &file : files_) {
        if (file.wantsRows) {
            file.file->addRow(*whole);
        }
    }
}

void ResultOutputs::endTable()
{
    for (File &file : files_) {
        if (file.wantsRows) {
            file.file->endTable();
        }
        file.wantsRows = false;
    }
}

void ResultOutputs::addText(ResultText kind, QStringView text, int style)
{
    for (const File &file : files_) {
        if (isWanted(file)) {
            file.file->addText(kind, text, style);
        }
    }
}

} // namespace kareport
