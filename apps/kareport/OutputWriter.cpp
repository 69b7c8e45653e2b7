#include "OutputWriter.h"

#include "ReplaceFile.h"
#include "Xlate.h"

#include <QFile>

#include <cstdio>

namespace kareport
{

namespace
{

LineEnds lineEndsOf(OutputKind kind)
{
    return kind == OutputKind::Report ? LineEnds::ReportFile : LineEnds::PlainText;
}

} // namespace

std::optional<QString> writeOutput(UReportDoc &report, const Output &output)
{
    const LineEnds lineEnds = lineEndsOf(output.kind);
    if (output.isStandardOutput()) {
        QFile file;
        const bool done = file.open(stdout, QIODevice::WriteOnly) && report.WriteText(file, lineEnds) && file.flush();
        return done ? std::nullopt
                    : std::optional(
                          Xlate("the report could not be written to standard output: %1").arg(file.errorString()));
    }
    if (output.kind == OutputKind::Report && report.IsEmpty()) {
        // Saving an empty report makes no file.
        return std::nullopt;
    }
    QString error;
    const bool done = replaceFile(
        output.file, [&](QIODevice &device) { return report.WriteText(device, lineEnds); }, &error);
    return done ? std::nullopt : std::optional(Xlate("\"%1\" could not be written: %2").arg(output.file, error));
}

} // namespace kareport
