#include "TemplatePreview.h"

#include "JobRunner.h"
#include "SampleJob.h"
#include "StandardInput.h"
#include "StandardText.h"
#include "TemplateSource.h"
#include "TextFolding.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <algorithm>
#include <iterator>
#include <new>

namespace kareport
{

namespace
{

/// The end of the first pages in a report's text.
qint64 endOfPages(const QString &text, const std::vector<qint64> &starts)
{
    const auto pages = static_cast<std::size_t>(TemplatePreview::mostPages);
    const qint64 end = starts.size() > pages ? starts[pages] : text.size();
    qint64 lineEnd = 0;
    for (int line = 0; line < TemplatePreview::mostLines && lineEnd < end; ++line) {
        const qint64 found = text.indexOf(u'\n', lineEnd);
        lineEnd = found < 0 ? end : found + 1;
    }
    return std::min(lineEnd, end);
}

/// The field of a record that the template's text has for the field that is shown: two columns may have changed places.
const OutlineField *fieldOf(const OutlineOutput &output, const WrittenCells::Record &record, int field)
{
    const QString &name = record.variables[static_cast<std::size_t>(field)];
    const auto isSame = [&name](const QString &other) { return equalFolded(other, name); };
    auto before = std::count_if(record.variables.begin(), record.variables.begin() + field, isSame);
    for (const OutlineField &one : output.fields) {
        if (isSame(one.variable.text) && before-- == 0) {
            return &one;
        }
    }
    return nullptr;
}

std::vector<PreviewCell> cellsOf(const WrittenCells &written, const OutlineTemplate &outline, qint64 end)
{
    std::vector<PreviewCell> cells;
    for (const WrittenCell &cell : written.cells()) {
        const WrittenCells::Record &record = written.records()[static_cast<std::size_t>(cell.record)];
        const OutlineOutput *output = outline.output(record.isTable, record.name);
        const OutlineField *field = output != nullptr ? fieldOf(*output, record, cell.field) : nullptr;
        if (field == nullptr || cell.at + cell.size > end) {
            continue;
        }
        const OutlineValue &wanted = cell.isLabel && field->label.range.exists() ? field->label : field->variable;
        cells.push_back(
            {cell.at, cell.size, cell.isLabel, field->element, wanted.range.exists() ? wanted.range : field->element});
    }
    std::stable_sort(cells.begin(), cells.end(),
                     [](const PreviewCell &left, const PreviewCell &right) { return left.at < right.at; });
    return cells;
}

bool hasClear(const Job &job)
{
    return std::any_of(job.steps.begin(), job.steps.end(),
                       [](const Job::Step &step) { return std::holds_alternative<Job::Clear>(step.action); });
}

} // namespace

PreviewReport::PreviewReport() : UReportDoc(ReportSurroundings()) {}

void PreviewReport::SetTitle(const QString &title)
{
    GetTitle() = title;
    SetHeader();
}

const PreviewCell *PreviewPages::cellAt(qint64 at) const
{
    auto after = std::upper_bound(cells.begin(), cells.end(), at,
                                  [](qint64 sought, const PreviewCell &cell) { return sought < cell.at; });
    if (after == cells.begin()) {
        return nullptr;
    }
    --after;
    return at < after->at + after->size ? &*after : nullptr;
}

TemplatePreview::TemplatePreview(QString path, QDateTime now) : path_(std::move(path)), now_(std::move(now)) {}

TemplatePreview::~TemplatePreview() = default;

void TemplatePreview::useSamples()
{
    openings_ = openings();
    data_.reset();
}

std::optional<InputError> TemplatePreview::useJob(const Expected<JsonSource> &source)
{
    if (const InputError *error = errorOf(source)) {
        return *error;
    }
    const auto &read = std::get<JsonSource>(source);
    auto job = readJob(read);
    if (const InputError *error = errorOf(job)) {
        return *error;
    }
    auto &known = std::get<Job>(job);
    const JsonPath place = {QStringLiteral("template")};
    if (!known.reportTemplate) {
        return read.errorAt(place, Xlate("a job with this template was expected"));
    }
    if (QFileInfo(known.reportTemplate->file).canonicalFilePath() != QFileInfo(path_).canonicalFilePath()) {
        return read.errorAt(
            place, Xlate("a job with this template was expected: it has \"%1\"").arg(known.reportTemplate->file));
    }
    for (const Job::DataSet &set : known.data) {
        if (set.source->readsStandardInput()) {
            return read.errorAt(place, noStandardInputText());
        }
    }
    openings_ = openings();
    data_ = std::make_shared<KeptData>(read, std::move(known));
    return std::nullopt;
}

QString TemplatePreview::jobTemplate() const
{
    return data_ ? data_->job().reportTemplate->name : QString();
}

QStringList TemplatePreview::dataFiles() const
{
    QStringList files;
    if (data_) {
        files.append(data_->source().path());
        const Job job = data_->job();
        for (const Job::DataSet &set : job.data) {
            files.append(set.source->files());
        }
        files.removeAll(QString()); // a job that is in no file
    }
    return files;
}

InputError TemplatePreview::withOwnPath(InputError error, const QString &file) const
{
    if (error.file == file) {
        error.file = path_;
    }
    error.text.replace(file, path_);
    return error;
}

std::optional<InputError> TemplatePreview::write(const QByteArray &bytes, const QString &file) const
{
    QFile out(file);
    if (!out.open(QIODevice::WriteOnly) || out.write(bytes) != bytes.size() || !out.flush()) {
        return InputError{path_, std::nullopt,
                          Xlate("the template file cannot be written for its preview: %1").arg(out.errorString())};
    }
    return std::nullopt;
}

/// The data of the job, or of one that is made up for the template.
Expected<std::shared_ptr<KeptData>> TemplatePreview::dataFor(const QString &file, const QString &name)
{
    if (data_) {
        return data_;
    }
    UXmlReportTpl reportTemplate;
    if (!reportTemplate.LoadTemplate(file, name)) {
        const auto source = readTemplateSource(file);
        const InputError *error = errorOf(source);
        return error != nullptr ? *error : whyNotLoaded(file, std::get<TemplateFile>(source), name);
    }
    const JsonSource source = JsonSource::fromObject(sampleJob(reportTemplate, file, name));
    auto job = readJob(source);
    if (const InputError *error = errorOf(job)) {
        return *error;
    }
    return std::make_shared<KeptData>(source, std::get<Job>(std::move(job)));
}

std::optional<InputError> TemplatePreview::makePages(const QString &text, const QByteArray &bytes, const QString &name,
                                                     PreviewReport &report, const std::function<bool()> &isStopped,
                                                     const TemplateOutline *outline, std::optional<PreviewPages> &pages)
{
    const QString file = folder_.filePath(QFileInfo(path_).fileName());
    if (auto error = write(bytes, file)) {
        return error;
    }
    const auto found = dataFor(file, name);
    if (const InputError *error = errorOf(found)) {
        return withOwnPath(*error, file);
    }
    KeptData &data = *std::get<std::shared_ptr<KeptData>>(found);
    Job job = data.job();
    job.reportTemplate->file = file;
    job.now = job.now ? job.now : now_;
    job.outputs.clear();
    job.strict = false; // what is noted on the whole data is not known yet
    // A heading of several lines counts twice.
    const bool mayStopEarly = !hasClear(job);
    const auto isFull = [&report, mayStopEarly] {
        return mayStopEarly && (report.GetPageNumber() > mostPages || report.GetLineCount() > 2 * mostLines);
    };
    data.begin(isFull, isStopped);
    WrittenCells written;
    Progress progress(false);
    JobRunner runner(job, data.source(), progress);
    runner.ignoreInterrupts();
    runner.setCells(&written);
    runner.stopWhen([&] { return isStopped() || isFull(); });
    const auto wrong = runner.run(report);
    const bool isWhole = !isFull();
    data.end();
    if (wrong) {
        return withOwnPath(*wrong, file);
    }
    if (isStopped()) {
        return std::nullopt;
    }
    PreviewPages made;
    made.templateName = job.reportTemplate->name;
    made.text = report.CopyText();
    const std::vector<qint64> &starts = report.GetPageStarts();
    const qint64 end = endOfPages(made.text, starts);
    made.isWhole = isWhole && end == made.text.size();
    made.text.truncate(end);
    std::copy_if(starts.begin(), starts.end(), std::back_inserter(made.starts), [end](qint64 at) { return at < end; });
    const TemplateOutline own = outline == nullptr ? outlineOf(text) : TemplateOutline();
    if (const OutlineTemplate *shown = (outline != nullptr ? *outline : own).templateOf(made.templateName)) {
        made.cells = cellsOf(written, *shown, end);
    }
    pages = std::move(made);
    return std::nullopt;
}

std::vector<TemplateRemark> TemplatePreview::remarksOn(const QString &text)
{
    const QByteArray plain = QString(text).replace(QChar(u'\0'), QChar::ReplacementCharacter).toUtf8();
    return checkTemplates(TemplateFile{QByteArrayView(plain)});
}

PreviewResult TemplatePreview::make(const QString &text, const QByteArray &bytes, const QString &name,
                                    PreviewReport &report, const std::function<bool()> &isStopped,
                                    const TemplateOutline *outline)
{
    PreviewResult result;
    try {
        result.wrong = makePages(text, bytes, name, report, isStopped, outline, result.pages);
    } catch (const std::bad_alloc &) {
        result.pages.reset();
        result.wrong = InputError{path_, std::nullopt, noMemoryText()};
    }
    result.isStopped = !result.pages && !result.wrong;
    return result;
}

} // namespace kareport
