#include "OutputWriter.h"

#include "Interrupt.h"
#include "PdfExport.h"
#include "ReplaceFile.h"
#include "ReportContent.h"
#include "RichTextWriter.h"
#include "Xlate.h"

#include <QFile>
#include <QTextDocument>

#include <cstdio>

namespace kareport
{

namespace
{

/// Writes one report to one output.
class OutputWriting
{
public:
    OutputWriting(UReportDoc &report, const Output &output, Progress &progress, QStringList &warnings)
        : report_(report), output_(output), progress_(progress), warnings_(warnings)
    {}

    std::optional<QString> write()
    {
        if (output_.isStandardOutput()) {
            QFile file;
            const bool done = file.open(stdout, QIODevice::WriteOnly) && writeTo(file) && file.flush();
            return done ? std::nullopt
                        : std::optional(
                              Xlate("the report could not be written to standard output: %1").arg(reason(file)));
        }
        if (output_.kind == OutputKind::Report && report_.IsEmpty()) {
            // Saving an empty report makes no file.
            return std::nullopt;
        }
        return replaceOutput(
            output_, [this](QIODevice &device) { return writeTo(device); }, problem_);
    }

private:
    QString reason(const QFile &file) const { return problem_.isEmpty() ? file.errorString() : problem_; }

    bool writeTo(QIODevice &device)
    {
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
        // What this writes must not hang on another output that wants the report in rich-text mode.
        const bool isImageOn = report_.GetRTFDataFlag();
        report_.SetRTFDataFlag(false);
        QTextDocument document;
        RichTextNotes notes;
        const auto error = showReportContent(report_, document, &notes);
        report_.SetRTFDataFlag(isImageOn);
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
            return !isInterrupted();
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
    return replaceFile(output.file, write, &error)
               ? std::nullopt
               : std::optional(
                     Xlate("\"%1\" could not be written: %2").arg(output.file, problem.isEmpty() ? error : problem));
}

std::optional<QString> writeOutput(UReportDoc &report, const Output &output, Progress &progress, QStringList &warnings)
{
    return OutputWriting(report, output, progress, warnings).write();
}

} // namespace kareport
