#include "Commands.h"

#include "Progress.h"
#include "TemplateCheck.h"
#include "TemplateSource.h"

#include <cstdio>

namespace kareport
{

void printLine(const QString &line)
{
    std::fprintf(stdout, "%s\n", line.toUtf8().constData());
}

void printError(const QString &line)
{
    eraseProgress();
    std::fprintf(stderr, "%s\n", line.toUtf8().constData());
}

ExitStatus CheckCommand::run() const
{
    const auto source = readTemplateSource(file);
    if (const InputError *error = errorOf(source)) {
        printLine(error->message());
        return exitInput;
    }
    ExitStatus status = exitDone;
    for (const TemplateRemark &remark : checkTemplates(std::get<TemplateFile>(source))) {
        printLine(QStringLiteral("%1:%2:%3: %4: %5")
                      .arg(file, QString::number(remark.place.line), QString::number(remark.place.column),
                           remark.isError ? QStringLiteral("error") : QStringLiteral("warning"), remark.text));
        if (remark.isError) {
            status = exitInput;
        }
    }
    return status;
}

} // namespace kareport
