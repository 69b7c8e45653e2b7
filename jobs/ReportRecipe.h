#pragma once

#include "InputError.h"
#include "Job.h"
#include "JsonSource.h"

#include <QJsonObject>
#include <QString>

#include <variant>

namespace kareport
{

/// Where the job of a report is: in a file, or in a template and a data file that the user has chosen.
using JobOrigin = std::variant<QString, TemplateJob>;

/// What a report is made of, so that it can be made again.
struct ReportRecipe
{
    ReportRecipe(const QString &jobFile) : origin(jobFile) {}
    ReportRecipe(const TemplateJob &job) : origin(job) {}

    JobOrigin origin;
    /// Keys of the job's `settings`, with the values that count for this report instead of the job's own.
    QJsonObject settings = {};

    /// The job file; empty where there is none.
    QString jobFile() const;
};

/// Reads the job of a recipe, with the settings of the recipe in it.
Expected<JsonSource> sourceOf(const ReportRecipe &recipe);

} // namespace kareport
