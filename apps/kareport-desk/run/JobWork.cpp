#include "JobWork.h"

#include "DataKind.h"
#include "DeskPreferences.h"
#include "Interrupt.h"
#include "JobReader.h"
#include "StandardInput.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QFileInfo>

#include <algorithm>
#include <new>
#include <optional>

namespace kareport
{

namespace
{

bool &runningJob()
{
    static bool isRunning = false;
    return isRunning;
}

/// The data file of a job that is not a regular file: reading a pipe or a device might never end, and nothing could
/// stop it.
std::optional<InputError> dataThatIsNoFile(const Job &job, const JsonSource &source)
{
    QStringList names = job.data.keys();
    names.sort();
    for (const QString &name : names) {
        const Job::DataSet &set = *job.data.constFind(name);
        const JsonPath place = {QStringLiteral("data"), name, set.kind};
        if (set.source->readsStandardInput()) {
            return source.errorAt(place, noStandardInputText());
        }
        for (const QString &file : set.source->files()) {
            if (QFileInfo(file).exists() && !QFileInfo(file).isFile()) {
                return source.errorAt(place, unreadableData(file, Xlate("it is a folder, a pipe or a device")));
            }
        }
    }
    return std::nullopt;
}

} // namespace

DialogProgress::DialogProgress(QWidget *parent) : Progress(true), dialog_(parent, [] { setInterrupted(true); }) {}

void DialogProgress::show(std::size_t done)
{
    if (!dialog_.isDue()) {
        QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
        return;
    }
    dialog_.show(what(), total() > 0 ? static_cast<int>(std::min(done, total()) * 100 / total()) : -1);
    QCoreApplication::processEvents();
}

bool isJobRunning()
{
    return runningJob();
}

bool doAsOnlyJob(QString &error, const std::function<void()> &work)
{
    if (runningJob()) {
        error = Xlate("Another job is running. Wait until it has finished, or cancel it.");
        return false;
    }
    const ValueGuard running(runningJob(), true, [](bool on) { runningJob() = on; });
    setInterrupted(false);
    try {
        work();
    } catch (const std::bad_alloc &) {
        error = Xlate("There is not enough memory for this input.");
        return false;
    }
    return true;
}

bool doWithJob(const ReportRecipe &recipe, QString &error,
               const std::function<void(const Job &job, const JsonSource &source)> &work)
{
    bool isDone = false;
    doAsOnlyJob(error, [&] {
        const auto read = sourceOf(recipe);
        if (const InputError *wrong = errorOf(read)) {
            error = wrong->message();
            return;
        }
        const auto &source = std::get<JsonSource>(read);
        const auto job = readJob(source, loadPreferences().jobDefaults());
        if (const InputError *wrong = errorOf(job)) {
            error = wrong->message();
            return;
        }
        if (const auto wrong = dataThatIsNoFile(std::get<Job>(job), source)) {
            error = wrong->message();
            return;
        }
        work(std::get<Job>(job), source);
        isDone = true;
    });
    return isDone;
}

} // namespace kareport
