#pragma once

#include <QString>

#include <optional>

namespace kareport
{

/// The first folder on the way to a file that is not there; empty when all are, or a file is in its place.
QString missingFolder(const QString &file);

/// Says that a folder is missing, and which option creates it.
QString noFolderText(const QString &folder);

/// Makes a folder and those that it is in. @return the system's reason when that is not possible
std::optional<QString> makeFolders(const QString &folder);

/// The folders that outputs are written into.
class OutputFolders
{
public:
    /// @param areMade  whether missing folders are made
    explicit OutputFolders(bool areMade) : areMade_(areMade) {}

    /// Makes the folder of an output that is going to be written, where it is missing and to be made. It stays if the report
    /// fails after that: another process may be writing into it by then.
    void prepare(const QString &file) const;
    /// Why an output could not be written: its folder is missing. Nothing when the folder is there.
    std::optional<QString> whyNotWritten(const QString &file) const;

private:
    bool areMade_;
};

} // namespace kareport
