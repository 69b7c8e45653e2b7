#pragma once

#include <QJsonObject>
#include <QString>

namespace kareport
{

/// A data file written through one table or block of a template.
struct TemplateJob
{
    QString templateFile;
    QString templateName;
    QString table; ///< or a block
    QString block;
    QString data; ///< a CSV file

    /// The job that it stands for.
    QJsonObject toJson() const;
};

} // namespace kareport
