#pragma once

#include <QString>

#include <vector>

namespace kareport
{

/// A job that is shipped with the programs.
struct ShippedExample
{
    QString path;
    QString title; ///< of its report; the file's name where the job has none
};

/// The folder of the shipped examples: beside the programs where they were built, or in the folder of shared data where they
/// are installed. Empty when there is none.
QString examplesFolder();
/// Sets what `examplesFolder` gives; an empty path goes back to looking for it.
void setExamplesFolder(const QString &path);

/// The jobs of a folder in the order of their titles. What cannot be read is left out.
std::vector<ShippedExample> shippedExamples(const QString &folder);

/// Whether a file is in the folder of the shipped examples: what is made of it is not kept beside it.
bool isShippedExample(const QString &path);

} // namespace kareport
