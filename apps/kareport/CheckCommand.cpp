#include "Commands.h"

#include "TemplateCheck.h"
#include "TemplateSource.h"

namespace kareport
{

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
