#include "JobLauncher.h"

#include "Interrupt.h"
#include "JobReader.h"
#include "JobRunner.h"
#include "Progress.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QProgressDialog>

#include <new>

namespace kareport
{

namespace
{

/// Shows progress in a dialog, which also lets the windows answer while the work runs.
class DialogProgress : public Progress
{
public:
    explicit DialogProgress(QWidget *parent) : Progress(true), dialog_(QString(), Xlate("Cancel"), 0, 100, parent)
    {
        dialog_.setWindowModality(Qt::ApplicationModal);
        dialog_.setMinimumDuration(500);
        QObject::connect(&dialog_, &QProgressDialog::canceled, &dialog_, [] { setInterrupted(true); });
    }

    void finish() override { dialog_.reset(); }

protected:
    void show(std::size_t done) override
    {
        dialog_.setLabelText(what());
        dialog_.setRange(0, total() > 0 ? 100 : 0);
        dialog_.setValue(total() > 0 ? static_cast<int>(std::min(done, total()) * 100 / total()) : 0);
        QCoreApplication::processEvents();
    }

private:
    QProgressDialog dialog_;
};

UReportDoc *runJob(const QString &path, QWidget *parent, QString &error)
{
    auto read = JsonSource::read(path);
    if (const InputError *wrong = errorOf(read)) {
        error = wrong->message();
        return nullptr;
    }
    auto &source = std::get<JsonSource>(read);
    const Job job = readJob(source);
    if (source.error()) {
        error = source.error()->message();
        return nullptr;
    }
    DialogProgress progress(parent);
    UReportDoc *report = nullptr;
    bool isMade = false;
    {
        JobRunner runner(job, source, progress);
        const auto wrong = runner.run();
        report = runner.madeReport();
        if (wrong) {
            error = wrong->message();
        }
        isMade = !wrong && !isInterrupted();
    }
    if (report != nullptr && !isMade) {
        report->OnCloseDocument();
        return nullptr;
    }
    if (report != nullptr) {
        report->UpdateAllViews(nullptr, 0, nullptr);
    }
    return report;
}

} // namespace

UReportDoc *launchJob(const QString &path, QWidget *parent, QString &error)
{
    setInterrupted(false);
    try {
        return runJob(path, parent, error);
    } catch (const std::bad_alloc &) {
        error = Xlate("there is not enough memory for this input");
        return nullptr;
    }
}

} // namespace kareport
