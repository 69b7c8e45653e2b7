#include "EditorLauncher.h"

#include <QDir>
#include <QFileInfo>
#include <QProcess>

namespace kareport
{

namespace
{

EditorLauncher &editorLauncher()
{
    static EditorLauncher launcher;
    return launcher;
}

} // namespace

void launchEditor(const QString &program, const QString &file, const QString &folder, UDocument *document)
{
    // A relative path would be looked for in the program's folder; a bare name of a program even along the search path,
    // and one of a file that begins with "-" would be read as an option.
    // Programs of a system whose separator is another one may read a slash as the beginning of an option as well.
    const EditorLaunch launch{QFileInfo(program).absoluteFilePath(),
                              QDir::toNativeSeparators(QFileInfo(file).absoluteFilePath()), folder, document};
    if (editorLauncher()) {
        editorLauncher()(launch);
    } else {
        QStringList arguments;
        arguments.append(launch.file); // a list made of its members does not look whether there is memory
        QProcess::startDetached(launch.program, arguments, launch.folder);
    }
}

void setEditorLauncher(EditorLauncher launcher)
{
    editorLauncher() = std::move(launcher);
}

} // namespace kareport
