#include "OutputWriter.h"

#include "Interrupt.h"
#include "PdfExport.h"
#include "ProcessSetup.h"
#include "ReplaceFile.h"
#include "ReportContent.h"
#include "ReportGuards.h"
#include "ReportTextCodec.h"
#include "RichTextWriter.h"
#include "SizeLimit.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>
#include <QTextDocument>

#include <cstdio>

namespace kareport
{

namespace
{

QString tooLarge(const Output &output)
{
    return Xlate("\"%1\" was not written: it would have more than %2").arg(output.file, sizeText(*output.mostBytes));
}

/// Writes one report to one output.
class OutputWriting
{
public:
    OutputWriting(UReportDoc &report, const Output &output, Progress &progress, QStringList &warnings)
        : report_(report), output_(output), progress_(progress), warnings_(warnings)
    {}

    std::optional<QString> write()
    {
        if (const auto wrong = wrongSize()) {
            return wrong;
        }
        if (output_.isStandardOutput()) {
            return writeStandardOutput();
        }
        if (output_.kind == OutputKind::Report && report_.IsEmpty() && !report_.HasLostText()) {
            // Saving an empty report makes no file.
            return std::nullopt;
        }
        return replaceOutput(
            output_, [this](QIODevice &device) { return writeTo(device); }, problem_);
    }

private:
    std::optional<QString> writeStandardOutput()
    {
        QFile file;
        if (file.open(stdout, QIODevice::WriteOnly) && writeTo(file) && file.flush()) {
            return std::nullopt;
        }
        if (isOutputReaderGone()) {
            return QString();
        }
        return Xlate("the report could not be written to standard output: %1")
            .arg(problem_.isEmpty() ? file.errorString() : problem_);
    }

    /// What is written piece by piece to where it cannot be taken back is measured before.
    std::optional<QString> wrongSize()
    {
        const QFileInfo info(output_.file);
        if (!output_.mostBytes || (!output_.isStandardOutput() && (info.isFile() || !info.exists()))) {
            return std::nullopt;
        }
        SizeLimit count(nullptr, *output_.mostBytes);
        const bool isTooLarge = !writeTo(count) && count.isExceeded();
        warnings_.clear(); // they come again
        return isTooLarge ? std::optional(tooLarge(output_)) : std::nullopt;
    }

    bool writeTo(QIODevice &device)
    {
        if (report_.HasLostText()) {
            return false; // half a report is none
        }
        switch (output_.kind) {
        case OutputKind::Report: return report_.WriteText(device, LineEnds::ReportFile);
        case OutputKind::Text: return report_.WriteText(device, LineEnds::PlainText);
        case OutputKind::RichText: return writeRichTextTo(device);
        case OutputKind::Pdf: return writePdfTo(device);
        case OutputKind::RichTextImage: return report_.WriteRichTextFile(device);
        }
        return false;
    }

    bool writeRichTextTo(QIODevice &device)
    {
        QTextDocument document;
        RichTextNotes notes;
        std::optional<RichTextError> error;
        {
            // What this writes must not hang on another output that wants the report in rich-text mode.
            const auto guard = withoutRichTextMode(report_);
            error = showReportContent(report_, document, &notes);
        }
        if (error) {
            problem_ = Xlate("the report begins as rich text, but %1 (line %2, column %3)")
                           .arg(error->text, QString::number(error->place.line), QString::number(error->place.column));
            return false;
        }
        warnings_ += notes.texts();
        return writeRichText(device, document);
    }

    bool writePdfTo(QIODevice &device)
    {
        PdfNotes notes;
        const bool done = report_.WritePdf(device, &notes, [this](qint64 page, qint64 pages) {
            progress_.advance(static_cast<std::size_t>(page), static_cast<std::size_t>(pages));
            return !isInterrupted() && !(output_.isStandardOutput() && isOutputReaderGone());
        });
        problem_ = notes.problem;
        warnings_ += notes.warnings();
        return done;
    }

    UReportDoc &report_;
    const Output &output_;
    Progress &progress_;
    QStringList &warnings_;
    QString problem_;
};

} // namespace

std::optional<QString> replaceOutput(const Output &output, const std::function<bool(QIODevice &)> &write,
                                     const QString &problem)
{
    QString error;
    bool isTooLarge = false;
    const auto writeLimited = [&](QIODevice &device) {
        SizeLimit limited(&device, *output.mostBytes);
        const bool done = write(limited);
        isTooLarge = limited.isExceeded();
        return done;
    };
    const bool done =
        output.mostBytes ? replaceFile(output.file, writeLimited, &error) : replaceFile(output.file, write, &error);
    if (isTooLarge) {
        return tooLarge(output);
    }
    return done ? std::nullopt
                : std::optional(
                      Xlate("\"%1\" could not be written: %2").arg(output.file, problem.isEmpty() ? error : problem));
}

std::optional<QString> writeOutput(UReportDoc &report, const Output &output, Progress &progress, QStringList &warnings)
{
    return OutputWriting(report, output, progress, warnings).write();
}

} // namespace kareport
