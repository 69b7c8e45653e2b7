#include "JobOutputs.h"

#include "HtmlResult.h"
#include "Interrupt.h"
#include "JobRunner.h"
#include "PdfExport.h"
#include "ProcessSetup.h"
#include "ReplaceFile.h"
#include "ReportContent.h"
#include "ReportGuards.h"
#include "ReportPages.h"
#include "ReportTextCodec.h"
#include "RichTextWriter.h"
#include "SizeLimit.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>
#include <QTextDocument>

#include <algorithm>
#include <cstdio>
#include <limits>

namespace kareport
{

namespace
{

constexpr std::size_t copiedAtOnce = std::size_t(1) << 20; ///< bytes, between which an interrupt is looked for

QString tooLarge(const Output &output)
{
    return Xlate("\"%1\" was not written: it would have more than %2").arg(output.file, sizeText(*output.mostBytes));
}

QString couldNotBeWritten(const Output &output, const QString &reason)
{
    return Xlate("\"%1\" could not be written: %2").arg(output.file, reason);
}

/// More characters than this are not worth a note each: there is no font for a whole script.
constexpr std::size_t mostNotes = 100;

/// Whether an output is a file, which is replaced in one step. Anything else cannot be taken back.
bool isReplaced(const Output &output)
{
    const QFileInfo file(output.file);
    return !output.isStandardOutput() && (file.isFile() || !file.exists());
}

/// Writes one report to one output.
class OutputWriting
{
public:
    OutputWriting(UReportDoc &report, const Output &output, Progress &progress, ResultFile *results)
        : report_(report), output_(output), progress_(progress), results_(results)
    {}

    OutputResult write()
    {
        if (results_ != nullptr && !results_->finish()) {
            return {results_->isTooLarge() ? tooLarge(output_) : couldNotBeWritten(output_, results_->problem())};
        }
        if (results_ != nullptr) {
            warnings_ = results_->warnings();
        }
        if (output_.mostBytes && !isReplaced(output_) && isTooLarge()) {
            return {tooLarge(output_)};
        }
        if (output_.isStandardOutput()) {
            return writeStandardOutput();
        }
        if (output_.kind == OutputKind::Report && report_.IsEmpty() && !report_.HasLostText()) {
            return {};
        }
        // The pages after the first one come before it: it never leads to one that is not there.
        for (std::size_t page = results_ != nullptr ? results_->pageCount() : 1; page > 1; --page) {
            Output output = output_;
            output.file = HtmlResult::pageName(output.file, page);
            const auto problem = replaceOutput(output, [this, page](QIODevice &device, QString &) {
                return writeBytes(device, results_->page(page));
            });
            if (problem) {
                return {problem};
            }
        }
        const auto problem =
            replaceOutput(output_, [this](QIODevice &device, QString &wrong) { return writeTo(device, wrong); });
        return {problem, false, warnings_, notes_};
    }

    /// The notes on what would be written.
    std::vector<JobNote> notes()
    {
        SizeLimit nowhere(nullptr, std::numeric_limits<qint64>::max());
        QString problem;
        writeTo(nowhere, problem);
        return notes_;
    }

private:
    OutputResult writeStandardOutput()
    {
        QFile file;
        QString problem;
        if (file.open(stdout, QIODevice::WriteOnly) && writeTo(file, problem) && file.flush()) {
            return {std::nullopt, false, warnings_, notes_};
        }
        if (isOutputReaderGone()) {
            return {std::nullopt, true, warnings_};
        }
        return {Xlate("the report could not be written to standard output: %1")
                    .arg(problem.isEmpty() ? file.errorString() : problem),
                false, warnings_};
    }

    /// What is written piece by piece to where it cannot be taken back is measured before.
    bool isTooLarge()
    {
        SizeLimit count(nullptr, *output_.mostBytes);
        QString problem;
        const bool isExceeded = !writeTo(count, problem) && count.isExceeded();
        // Those of the writing come again.
        warnings_ = results_ != nullptr ? results_->warnings() : QStringList();
        notes_.clear();
        return isExceeded;
    }

    bool writeTo(QIODevice &device, QString &problem)
    {
        if (report_.HasLostText()) {
            return false; // half a report counts as none
        }
        switch (output_.kind) {
        case OutputKind::Report: return report_.WriteText(device, LineEnds::ReportFile);
        case OutputKind::Text: return report_.WriteText(device, LineEnds::PlainText);
        case OutputKind::RichText: return writeRichTextTo(device, problem);
        case OutputKind::Pdf: return writePdfTo(device, problem);
        case OutputKind::RichTextImage: return report_.WriteRichTextFile(device);
        case OutputKind::Xlsx:
        case OutputKind::Html:
        case OutputKind::Csv:
        case OutputKind::JsonLines:
        case OutputKind::Schema: return results_ != nullptr && writeBytes(device, results_->page(1));
        }
        return false;
    }

    bool writeRichTextTo(QIODevice &device, QString &problem)
    {
        QTextDocument document;
        RichTextNotes notes;
        std::optional<RichTextError> error;
        {
            // What this writes must not depend on another output that needs the report in rich-text mode.
            const auto guard = withoutRichTextMode(report_);
            error = showReportContent(report_, document, &notes);
        }
        if (error) {
            problem = Xlate("the report begins as rich text, but %1 (line %2, column %3)")
                          .arg(error->text, QString::number(error->place.line), QString::number(error->place.column));
            return false;
        }
        warnings_ += notes.texts();
        return writeRichText(device, document);
    }

    bool writeBytes(QIODevice &device, std::string_view bytes)
    {
        for (std::size_t at = 0; at < bytes.size();) {
            const std::string_view piece = bytes.substr(at, copiedAtOnce);
            if (isInterrupted() ||
                device.write(piece.data(), static_cast<qint64>(piece.size())) != qint64(piece.size())) {
                return false;
            }
            at += piece.size();
            results_->release(piece); // no output is in memory as a whole
        }
        return true;
    }

    bool writePdfTo(QIODevice &device, QString &problem)
    {
        PdfNotes notes;
        const auto progress = [this](qint64 page, qint64 pages) {
            progress_.advance(static_cast<std::size_t>(page), static_cast<std::size_t>(pages));
            return !isInterrupted() && !(output_.isStandardOutput() && isOutputReaderGone());
        };
        const bool done = report_.WritePdf(device, &notes, progress, output_.pdf.get());
        problem = notes.problem;
        warnings_ += notes.warnings();
        for (const MissingCharacter &missing : notes.missing) {
            if (notes_.size() == mostNotes) {
                break;
            }
            notes_.push_back({JobNote::Kind::UnshownCharacter,
                              {output_.file, std::nullopt, PdfNotes::sentenceOf(missing)},
                              missing.firstLine,
                              static_cast<quint64>(missing.count)});
        }
        return done;
    }

    UReportDoc &report_;
    const Output &output_;
    Progress &progress_;
    ResultFile *results_;
    QStringList warnings_;
    std::vector<JobNote> notes_;
};

} // namespace

std::optional<QString> replaceOutput(const Output &output, const WriteContent &write)
{
    QString error;
    QString problem;
    bool isTooLarge = false;
    const auto writeLimited = [&](QIODevice &device) {
        if (!output.mostBytes) {
            return write(device, problem);
        }
        SizeLimit limited(&device, *output.mostBytes);
        const bool done = write(limited, problem);
        isTooLarge = limited.isExceeded();
        return done;
    };
    const bool done = replaceFile(output.file, writeLimited, &error);
    if (isTooLarge) {
        return tooLarge(output);
    }
    return done ? std::nullopt : std::optional(couldNotBeWritten(output, problem.isEmpty() ? error : problem));
}

void describePdfs(const Job &job, const UReportDoc &report, std::vector<Output> &outputs)
{
    if (job.pdf == nullptr) {
        return;
    }
    auto details = std::make_shared<PdfDetails>();
    details->title = job.pdf->title.value_or(report.GetTitle());
    details->author = job.pdf->author;
    details->creator = job.pdf->creator.value_or(job.application);
    details->created = surroundingsOf(job).time;
    details->language = job.pdf->language;
    details->hasOutline = job.pdf->outline;
    details->hasPageLabels = job.pdf->pageLabels;
    for (Output &output : outputs) {
        output.pdf = output.kind == OutputKind::Pdf ? details : nullptr;
    }
}

OutputResult writeOutput(UReportDoc &report, const Output &output, Progress &progress, ResultFile *results)
{
    return OutputWriting(report, output, progress, results).write();
}

std::vector<JobNote> unshownCharacters(UReportDoc &report, const Output &output, Progress &progress)
{
    return output.kind == OutputKind::Pdf && !makesNoPage(report)
               ? OutputWriting(report, output, progress, nullptr).notes()
               : std::vector<JobNote>();
}

const Output *streamedOutput(const Job &job)
{
    const Output &output = job.outputs.front();
    const bool isText = output.kind == OutputKind::Report || output.kind == OutputKind::Text;
    const bool isEmptied = std::any_of(job.steps.begin(), job.steps.end(), [](const Job::Step &step) {
        return std::holds_alternative<Job::Clear>(step.action);
    });
    return job.outputs.size() == 1 && isText && isReplaced(output) && !isEmptied ? &output : nullptr;
}

bool needsFonts(const std::vector<Output> &outputs)
{
    return std::any_of(outputs.begin(), outputs.end(),
                       [](const Output &output) { return output.kind == OutputKind::RichText; });
}

bool makesNoPage(const UReportDoc &report)
{
    return report.IsEmpty() || (report.HoldsRichTextSource() && report.GetPages().empty());
}

} // namespace kareport
