#pragma once

#include "Job.h"
#include "JobNotes.h"
#include "Progress.h"
#include "ResultFile.h"
#include "UReportDoc.h"

#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace kareport
{

/// How writing an output ended.
struct OutputResult
{
    std::optional<QString> problem = std::nullopt; ///< a sentence that says what went wrong
    bool isReaderGone = false;                     ///< standard output has no reader any more: there is nothing to say
    QStringList warnings = {};                     ///< what a reader of the output should know
    std::vector<JobNote> notes = {}; ///< the characters that it does not show; `warnings` names them as well

    bool isWritten() const { return !problem && !isReaderGone; }
};

/// Gives the PDFs among the outputs of a job what they say of themselves, where the job asks for it.
/// @param report  that was made, for its title
void describePdfs(const Job &job, const UReportDoc &report, std::vector<Output> &outputs);

/// Writes a report to where an output says. An empty report makes no report file.
/// @param results  the file of an output that is made of results, which is finished here; null for any other
OutputResult writeOutput(UReportDoc &report, const Output &output, Progress &progress, ResultFile *results = nullptr);

/// The characters of a report that an output would not show: those that no font has for a PDF. All other kinds show every
/// character.
std::vector<JobNote> unshownCharacters(UReportDoc &report, const Output &output, Progress &progress);

/// Writes the content of an output. @param problem  receives what went wrong, where the device does not know it
/// @return whether all was written
using WriteContent = std::function<bool(QIODevice &device, QString &problem)>;

/// Puts a file into an output's place in one step. @return what went wrong; nothing when it was written
std::optional<QString> replaceOutput(const Output &output, const WriteContent &write);

/// The output that the text of a job's report can go to while it is written; null when the whole report must be there first:
/// for any other kind, for several outputs, for what is not a file and so cannot be taken back, and for a report that is
/// emptied on the way. @param job  has one output at least
const Output *streamedOutput(const Job &job);

/// Whether an output is made with fonts of the screen, which needs a running QGuiApplication.
bool needsFonts(const std::vector<Output> &outputs);

/// Whether a report would give a PDF without a page, which readers refuse: it is empty, or rich text that shows nothing.
bool makesNoPage(const UReportDoc &report);

} // namespace kareport
