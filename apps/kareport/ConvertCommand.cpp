#include "Commands.h"

#include "CommandSetup.h"
#include "FileBytes.h"
#include "FileIdentity.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "LineEndings.h"
#include "OutputClash.h"
#include "OutputsWriter.h"
#include "PageMeasurement.h"
#include "ReportTextDecoder.h"
#include "RichTextReader.h"
#include "SavedText.h"
#include "TerminalProgress.h"
#include "Xlate.h"

#include <QJsonArray>

#include <new>

namespace kareport
{

namespace
{

/// What stands in a saved report.
struct SavedReport
{
    QString text; ///< lines ended by CR LF
    QStringList warnings;
};

/// Reads a report file or plain text. @return what is wrong with it; nothing when all was read
std::optional<InputError> readText(const QString &path, QByteArrayView bytes, SavedReport &saved)
{
    if (bytes.startsWith("%PDF")) {
        return InputError{path, TextPlace(), Xlate("a saved report was expected; this is a PDF")};
    }
    if (const auto place = decodeReportText(bytes, saved.text)) {
        return InputError{path, *place, Xlate("a report file was expected; this is no UTF-8")};
    }
    return std::nullopt;
}

std::optional<InputError> readRichText(const QString &path, QByteArrayView bytes, SavedReport &saved)
{
    RichTextNotes notes;
    if (const auto error = readRichTextCharacters(bytes, saved.text, &notes)) {
        return InputError{path, error->place, error->text};
    }
    for (QChar &character : saved.text) {
        if (character == QChar::ParagraphSeparator || character == QChar::LineSeparator) {
            character = u'\n';
        }
    }
    if (!saved.text.isEmpty() && !saved.text.endsWith(u'\n')) {
        saved.text += u'\n'; // the last paragraph is a line as well
    }
    saved.text = withCrLf(saved.text);
    saved.warnings = notes.texts();
    return std::nullopt;
}

} // namespace

std::optional<QString> ConvertCommand::usageError() const
{
    if (const auto wrong = wrongKindName(as)) {
        return wrong;
    }
    for (const QString &set : sets) {
        if (!set.startsWith(u"page.")) {
            return Xlate("--set \"%1\": a key of the page was expected, as page.linesPerPage=60").arg(set);
        }
    }
    return wrongOutput(output, as);
}

ExitStatus ConvertCommand::run(int &argc, char **argv) const
{
    JsonSource source = JsonSource::fromObject({{QStringLiteral("report"), QJsonArray()}});
    if (const auto wrong = applySets(source, sets)) {
        return usageExit(*wrong);
    }
    Job job = readJob(source, std::nullopt);
    if (source.error()) {
        return usageExit(source.error()->message());
    }
    job.outputs = {{output, *outputKindOf(output, outputKindFromName(as))}};

    const QString identity = outputIdentity(job.outputs.front());
    if (!identity.isEmpty() && identity == fileIdentity(input)) {
        printError(
            InputError{input, std::nullopt,
                       Xlate("the output \"%1\" is the report that is read: another one was expected").arg(output)}
                .message());
        return exitInput;
    }
    auto file = FileBytes::open(input);
    if (const InputError *error = errorOf(file)) {
        printError(error->message());
        return exitInput;
    }
    const std::string_view view = std::get<std::shared_ptr<const FileBytes>>(file)->view();
    const QByteArrayView bytes(view.data(), static_cast<qsizetype>(view.size()));
    const QByteArrayView richText = richTextIn(bytes);
    const bool isRich = !richText.isEmpty();
    SavedReport saved;
    std::optional<InputError> error = isRich ? readRichText(input, richText, saved) : readText(input, bytes, saved);
    if (const auto lost = std::get<std::shared_ptr<const FileBytes>>(file)->lostBytes()) {
        error = lost;
    }
    if (error) {
        printError(error->message());
        return exitInput;
    }
    // The pages of a PDF are those that the report was written in; no other kind has pages.
    if (!job.page.linesPerPage) {
        job.page.linesPerPage =
            job.outputs.front().kind == OutputKind::Pdf ? linesOfPages(saved.text) : PageGeometry().linesPerPage;
    }
    job.page.charsPerRow = job.page.charsPerRow.value_or(PageGeometry().charsPerRow);
    const auto application = startQt(argc, argv, JobRunner::needsFonts(job) || needsFonts(job.outputs));
    TerminalProgress bar(progress);
    JobRunner runner(job, source, bar);
    error = runner.run();
    if (error) {
        return usageExit(Xlate("--set: %1").arg(error->text)); // no input is left that could be wrong
    }
    UReportDoc &report = runner.report();
    if (report.GetRTFDataFlag()) {
        writeLines(report, saved.text);
    } else {
        report.Write(saved.text, 0);
    }
    if (report.HasLostText()) {
        throw std::bad_alloc();
    }
    report.FindPageStarts();
    // The report holds it all now.
    file = InputError();
    saved.text = QString();
    for (const QString &warning : quiet ? QStringList() : saved.warnings) {
        printError(Xlate("kareport: warning: \"%1\": %2").arg(input, warning));
    }
    return writeOutputs(report, job.outputs, bar, quiet);
}

} // namespace kareport
