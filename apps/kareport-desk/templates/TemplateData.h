#pragma once

#include "InputError.h"
#include "JsonSource.h"

#include <QString>
#include <QStringList>

#include <optional>

namespace kareport
{

/// What the pages of a template are made with: a job or a data file; empty for sample rows.
struct TemplateData
{
    QString file;
    // Of a data file alone: what it is written through.
    QString templateName = QString();
    QString table = QString();
    QString block = QString();

    bool isSample() const { return file.isEmpty(); }
    bool operator==(const TemplateData &) const = default;
    /// The job with the data: the one in the file, or one that writes the data file through its table or block.
    /// @param templateFile  of the template
    Expected<JsonSource> source(const QString &templateFile) const;
};

/// The jobs in the folder of a template that use it.
QStringList jobsOfTemplate(const QString &templateFile);

/// What was chosen for a template last; sample rows where it is gone.
TemplateData rememberedData(const QString &templateFile);
void rememberData(const QString &templateFile, const TemplateData &data);

} // namespace kareport
