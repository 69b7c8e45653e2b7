#include "Commands.h"

#include "CommandOutputs.h"
#include "CommandSetup.h"
#include "FileBytes.h"
#include "FileIdentity.h"
#include "JobFiles.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "PageMeasurement.h"
#include "SavedText.h"
#include "TerminalProgress.h"
#include "Xlate.h"

#include <QJsonArray>

#include <new>

namespace kareport
{

namespace
{

/// What is wrong with an output that is the report that is read.
std::optional<InputError> sameFile(const QString &input, const Output &output)
{
    const QString identity = outputIdentity(output);
    if (identity.isEmpty() || identity != fileIdentity(input)) {
        return std::nullopt;
    }
    return InputError{input, std::nullopt,
                      Xlate("the output \"%1\" is the report being read: another file was expected").arg(output.file)};
}

Expected<SavedText> readSavedFile(const QString &path)
{
    const auto file = FileBytes::open(path);
    if (const InputError *error = errorOf(file)) {
        return *error;
    }
    const FileBytes &bytes = *std::get<std::shared_ptr<const FileBytes>>(file);
    auto saved = readSavedText(path, QByteArrayView(bytes.view().data(), static_cast<qsizetype>(bytes.view().size())));
    if (auto lost = bytes.lostBytes()) {
        return *std::move(lost);
    }
    return saved;
}

/// Fixes the page of a report that is written already. The pages of a PDF are those that it was written in; no other kind
/// has pages.
void fixPage(Job &job, const SavedText &saved)
{
    if (!job.page.linesPerPage) {
        job.page.linesPerPage =
            job.outputs.front().kind == OutputKind::Pdf ? linesOfPages(saved.text) : PageGeometry().linesPerPage;
    }
    job.page.charsPerRow = job.page.charsPerRow.value_or(PageGeometry().charsPerRow);
}

void writeSaved(UReportDoc &report, const QString &text)
{
    if (report.GetRTFDataFlag()) {
        writeLines(report, text);
    } else {
        report.Write(text, 0);
    }
    if (report.HasLostText()) {
        throw std::bad_alloc();
    }
    report.FindPageStarts();
}

} // namespace

std::optional<QString> ConvertCommand::usageError() const
{
    if (auto wrong = wrongKindName(as)) {
        return wrong;
    }
    for (const QString &set : sets) {
        if (!set.startsWith(u"page.")) {
            return Xlate("--set \"%1\": a key of the page was expected, such as page.linesPerPage=60").arg(set);
        }
    }
    if (auto wrong = wrongOutput(output, as)) {
        return wrong;
    }
    const OutputKind kind = *outputKindOf(output, outputKindFromName(as));
    if (isMadeOfResults(kind)) {
        return Xlate(
                   "\"%1\" cannot be made from a saved report, which holds only text: use \"render\" with the job of the report")
            .arg(output);
    }
    return std::nullopt;
}

ExitStatus ConvertCommand::run(int &argc, char **argv) const
{
    JsonSource source = JsonSource::fromObject({{QStringLiteral("report"), QJsonArray()}});
    if (const auto wrong = applySets(source, sets)) {
        return usageExit(*wrong);
    }
    auto read = readJob(source);
    if (const InputError *error = errorOf(read)) {
        return usageExit(error->message());
    }
    Job &job = std::get<Job>(read);
    job.outputs = {{output, *outputKindOf(output, outputKindFromName(as))}};
    if (const auto same = sameFile(input, job.outputs.front())) {
        printError(same->message());
        return exitInput;
    }
    auto file = readSavedFile(input);
    if (const InputError *error = errorOf(file)) {
        printError(error->message());
        return exitInput;
    }
    SavedText &saved = std::get<SavedText>(file);
    fixPage(job, saved);
    const auto application = startQt(argc, argv, !job.page.isFixed() || needsFonts(job.outputs));
    TerminalProgress bar(progress);
    UReportDoc report(surroundingsOf(job));
    if (const auto error = JobRunner(job, source, bar).run(report)) {
        return usageExit(Xlate("--set: %1").arg(error->text)); // all input has been checked
    }
    writeSaved(report, saved.text);
    saved.text = QString(); // the report holds it all now
    for (const QString &warning : quiet ? QStringList() : saved.warnings) {
        printError(Xlate("kareport: warning: \"%1\": %2").arg(input, warning));
    }
    const ExitStatus status = writeOutputs(report, job.outputs, bar, quiet, OutputFolders(parents));
    if (status == exitDone) {
        bar.complete();
    }
    return status;
}

} // namespace kareport
