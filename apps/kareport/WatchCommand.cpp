#include "Commands.h"

#include "CommandSetup.h"
#include "InputError.h"
#include "JobWatch.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

std::optional<QString> WatchCommand::usageError() const
{
    if (render.jobs.first() == u"-") {
        return Xlate("standard input can be read only once: a job file was expected");
    }
    return render.usageError();
}

ExitStatus WatchCommand::run(int &argc, char **argv) const
{
    const QString &job = render.jobs.first();
    // A misspelt name would be waited for without end.
    if (!QFileInfo(job).isFile()) {
        printError(QStringLiteral("kareport: ") + Xlate("there is no file \"%1\"").arg(job));
        return exitInput;
    }
    // A change may make the job need fonts.
    const auto application = startQt(argc, argv, true);
    return JobWatch(render).run();
}

} // namespace kareport
