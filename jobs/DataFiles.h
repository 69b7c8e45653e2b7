#pragma once

#include "FileBytes.h"

#include <QHash>
#include <QString>

#include <memory>

namespace kareport
{

/// The files that the data of a job is read from, each opened once: a pipe can be read once only, and its bytes serve
/// every step.
class DataFiles
{
public:
    /// @param path  "-" for standard input
    Expected<std::shared_ptr<const FileBytes>> open(const QString &path);

private:
    QHash<QString, std::shared_ptr<const FileBytes>> files_; ///< by their paths
};

/// Says that a file with data cannot be read.
QString unreadableData(const QString &path, const QString &why);

} // namespace kareport
