#pragma once

#include <QByteArray>
#include <QString>

#include <vector>

namespace kareport
{

/// A file of a new job.
struct StarterFile
{
    QString name; ///< without its folder
    QByteArray bytes;
};

/// A template, data and a job that makes a report of them, in this order. They are the same in every language: names of
/// templates, variables and keys are, and their texts are there to be replaced.
/// @param name   of the files, without an ending
/// @param title  of the report
std::vector<StarterFile> starterFiles(const QString &name, const QString &title);

} // namespace kareport
