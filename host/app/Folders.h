#pragma once

#include "KaReportExport.h"

#include <QString>

/// The folder of the installed templates. @param reserved  false
KAREPORT_EXPORT QString GetLibraryDir(bool reserved);
/// The folder that the host was started in; for the command line, the job file's.
KAREPORT_EXPORT QString GetStartPathName();
/// The system's folder for temporary files. @param reserved  false
KAREPORT_EXPORT QString GetTempDir(bool reserved);
/// Non-zero when there is a file of that name; 0 for a folder and for an empty name.
KAREPORT_EXPORT int IsFileExisting(const QString &path);
/// The folder last used for a purpose, kept in the profile under a key; empty when there is none or it is gone.
KAREPORT_EXPORT QString GetInitialOpenDir(const QString &key);
/// Keeps the folder of a file as the one last used for a purpose.
KAREPORT_EXPORT void SetLastOpenDir(const QString &path, const QString &key);

namespace kareport
{

/// Sets what `GetLibraryDir` gives; an empty path goes back to the folder of the installed templates.
KAREPORT_EXPORT void setLibraryDir(const QString &path);
/// Sets what `GetStartPathName` gives; an empty path goes back to the folder that the program was started in.
KAREPORT_EXPORT void setStartPathName(const QString &path);

} // namespace kareport
