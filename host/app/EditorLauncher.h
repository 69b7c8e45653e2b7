#pragma once

#include "KaReportExport.h"

#include <QString>

#include <functional>

class UDocument;

namespace kareport
{

/// A program to be started with a file.
struct EditorLaunch
{
    QString program; ///< full path
    QString file;    ///< full path; the program's only argument, whatever characters it holds
    QString folder;  ///< the folder that the program works in; empty for the one that this process works in
    UDocument *document = nullptr; ///< whose text the file holds; may be null
};

/// Starts a program with a file and lets it run on by itself, also beyond the end of this process. No shell reads the
/// paths. A program that cannot be started is not reported.
/// @param program, file  where they are relative, they are taken from the folder that this process works in
/// @param document  whose text the file holds; may be null
KAREPORT_EXPORT void launchEditor(const QString &program, const QString &file, const QString &folder,
                                  UDocument *document = nullptr);

/// Starts a program with a file.
using EditorLauncher = std::function<void(const EditorLaunch &launch)>;

/// Installs what starts programs in place of a process of their own; an empty one takes it away again.
KAREPORT_EXPORT void setEditorLauncher(EditorLauncher launcher);

} // namespace kareport
