#pragma once

#include "Job.h"
#include "Progress.h"
#include "ReportRecipe.h"
#include "WorkDialog.h"

#include <QString>

#include <functional>

class QWidget;

namespace kareport
{

/// Shows the progress of a job in a dialog, which can stop it, and lets the windows answer while it runs.
class DialogProgress : public Progress
{
public:
    explicit DialogProgress(QWidget *parent);

    void finish() override { dialog_.hide(); }

protected:
    void show(std::size_t done) override;

private:
    WorkDialog dialog_;
};

/// Whether a job is running now: its report must not be closed.
bool isJobRunning();

/// Does work while no other job runs. @param error  receives why it was not done, as when another one runs
/// @return whether it was done
bool doAsOnlyJob(QString &error, const std::function<void()> &work);

/// Reads the job of a recipe with the user's preferences, and does work with it while no other job runs.
/// @param error  receives why it was not done: what is wrong with the job, or that another one runs
/// @return whether it was done
bool doWithJob(const ReportRecipe &recipe, QString &error,
               const std::function<void(const Job &job, const JsonSource &source)> &work);

} // namespace kareport
