#include "JobRunner.h"

#include "Clock.h"
#include "DataRemarks.h"
#include "Interrupt.h"
#include "JobSteps.h"
#include "LabelPlaceholders.h"
#include "LeastSize.h"
#include "ReportAccess.h"
#include "ReportTextCodec.h"
#include "ReportTextWriter.h"
#include "ResultOutputs.h"
#include "SizeLimit.h"
#include "TemplateSource.h"
#include "Xlate.h"

#include <QFileInfo>
#include <QScopeGuard>

#include <algorithm>
#include <limits>

namespace kareport
{

namespace
{

/// The time that a reproducible build gives its programs, if one does.
std::optional<QDateTime> buildTime()
{
    bool isNumber = false;
    const qint64 seconds = qEnvironmentVariable("SOURCE_DATE_EPOCH").toLongLong(&isNumber);
    return isNumber ? std::optional(QDateTime::fromSecsSinceEpoch(seconds, Qt::UTC)) : std::nullopt;
}

QDateTime timeOf(const Job &job)
{
    const auto time = job.now ? job.now : buildTime();
    return time ? *time : currentTime();
}

/// Restores the surroundings that a report had before its job. Margins and font size stay: the pages were made with them.
void putBack(UReportDoc &report, std::optional<ReportSurroundings> before)
{
    if (before) {
        before->margins = report.GetMargins();
        before->fontSize = report.GetFontSize();
    }
    report.SetSurroundings(before);
}

} // namespace

ReportSurroundings surroundingsOf(const Job &job)
{
    ReportSurroundings surroundings;
    surroundings.application = job.application;
    surroundings.time = timeOf(job);
    surroundings.printer = job.page.printer;
    if (job.page.isFixed()) {
        surroundings.printer.source = PrinterSource::BuiltIn; // no printer is asked
    }
    surroundings.isPortrait = job.page.portrait;
    surroundings.margins = job.page.margins.value_or(surroundings.margins);
    surroundings.fontSize = job.page.fontSize ? static_cast<unsigned>(*job.page.fontSize) : surroundings.fontSize;
    surroundings.printHash = job.options.printHash;
    return surroundings;
}

std::size_t readingsOf(const Job &job)
{
    const auto count = std::count_if(job.steps.begin(), job.steps.end(), [](const Job::Step &step) {
        return std::holds_alternative<Job::Block>(step.action) || std::holds_alternative<Job::Table>(step.action);
    });
    return static_cast<std::size_t>(count);
}

std::optional<InputError> JobRunner::run(UReportDoc &report, ReportTextWriter *stream)
{
    DataRemarks remarks;
    const ReportSurroundings surroundings = surroundingsOf(job_);
    remarks.measures = isMeasuring_;
    placeholders_.reset();
    if (job_.options.placeholders) {
        placeholders_ = std::make_unique<Placeholders>(job_.settings, job_.application, surroundings.time, job_.title);
    }
    const auto restored = qScopeGuard([&report, before = report.GetSurroundings()] { putBack(report, before); });
    report.SetSurroundings(surroundings);
    const auto restoredHooks =
        qScopeGuard([&report, before = ReportAccess::hooks(report)] { ReportAccess::setHooks(report, before); });
    ReportAccess::setHooks(report, {placeholders_.get(), &remarks, results_, cells_});
    if (auto error = prepare(report)) {
        return error;
    }
    if (results_ != nullptr) {
        results_->beginReport({report.GetTitle(), job_.application, surroundings.time});
    }
    SizeLimit nowhere(nullptr, std::numeric_limits<qint64>::max());
    ReportTextWriter noText(nowhere, LineEnds::PlainText);
    if (stream == nullptr && discardsText_ && ResultOutputs::isTextUnwanted(job_)) {
        stream = &noText;
    }
    report.StreamText(stream);
    const auto kept = qScopeGuard([&report] { report.StreamText(nullptr); });
    const std::function<bool()> isStopped = [this, stream, &report] {
        return (heedsInterrupts_ && isInterrupted()) || (stream != nullptr && stream->hasFailed()) ||
               isTooLarge(job_, leastSize(report)) || (isToStop_ && isToStop_());
    };
    JobData data(job_, source_, progress_, isStopped);
    notes_ = JobNotes();
    JobSteps steps(job_, source_, data, report, {notes_, isStrict_ || job_.strict, remarks}, isStopped);
    steps.setPlaceholders(placeholders_.get());
    steps.setResults(results_);
    fits_.clear();
    if (isMeasuring_ && job_.reportTemplate) {
        steps.measureInto(fits_, FormatWidths(job_.reportTemplate->file, job_.reportTemplate->name));
    }
    return steps.write();
}

std::optional<InputError> JobRunner::prepare(UReportDoc &report)
{
    report.SetHeaderFlag(job_.header);
    if (job_.title) {
        report.SetReportFileName(*job_.title);
    }
    report.SetRTFDataFlag(std::any_of(job_.outputs.begin(), job_.outputs.end(),
                                      [](const Output &output) { return output.kind == OutputKind::RichTextImage; }));
    if (job_.page.fontName) {
        report.SetFontName(*job_.page.fontName);
    }
    report.FixPage(job_.page.linesPerPage, job_.page.charsPerRow);
    report.SetPageSize();
    if (report.GetLinesPerPage() < 1 || report.GetCharsPerRow() < 1) {
        return source_.errorAt(
            {QStringLiteral("page")},
            Xlate("the margins leave no room on the page: smaller margins or a smaller font were expected"));
    }
    report.SetJobSettings(job_.settings);
    if (auto error = loadTemplate(report)) {
        return error;
    }
    applyOptions(report);
    // A title is set when the page is known: its header line is built then.
    if (job_.title) {
        report.SetTitle(*job_.title);
    } else if (!job_.reportTemplate) {
        report.SetHeader();
    }
    return std::nullopt;
}

std::optional<InputError> JobRunner::loadTemplate(UReportDoc &report)
{
    if (!job_.reportTemplate) {
        return std::nullopt;
    }
    const auto &[path, name] = *job_.reportTemplate;
    if (!QFileInfo(path).isFile()) {
        return source_.errorAt({QStringLiteral("template"), QStringLiteral("file")},
                               Xlate("there is no template file \"%1\"").arg(path));
    }
    if (auto wrong = wrongTemplateSource(path)) {
        return wrong;
    }
    if (placeholders_) {
        if (auto wrong = wrongLabelPlaceholder(path, name)) {
            return wrong;
        }
    }
    if (report.LoadTemplateFile(path, name, QString(), QString())) {
        return std::nullopt;
    }
    const auto file = readTemplateSource(path);
    const InputError *error = errorOf(file);
    return error != nullptr ? *error : whyNotLoaded(path, std::get<TemplateFile>(file), name);
}

void JobRunner::applyOptions(UReportDoc &report)
{
    report.SetZeroBlank(job_.options.zeroBlank);
    report.WriteTableName(job_.options.writeTableName);
    if (job_.options.chainageLabel) {
        const QString title = report.GetTemplate() != nullptr ? report.GetTemplate()->GetTemplateTitle() : QString();
        const QString &label = *job_.options.chainageLabel;
        report.SetChainageLabel(placeholders_ ? placeholders_->textOf(label, title) : label);
    }
    if (job_.options.excel) {
        report.SetExcelFormat();
    }
    if (job_.options.separator) {
        report.SetDataColumnSeparator(*job_.options.separator, false);
    }
}

} // namespace kareport
