#include "Commands.h"

#include "Display.h"
#include "FileKind.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <QProcess>
#include <QStandardPaths>

namespace kareport
{

namespace
{

/// The desktop program: the one in this program's folder, else the one on the path.
QString deskProgram()
{
    const QString name = QStringLiteral("kareport-desk");
    const QString beside = QStandardPaths::findExecutable(name, {QCoreApplication::applicationDirPath()});
    return beside.isEmpty() ? QStandardPaths::findExecutable(name) : beside;
}

ExitStatus fail(ExitStatus status, const QString &text)
{
    printError(QStringLiteral("kareport: ") + text);
    return status;
}

} // namespace

ExitStatus ViewCommand::run(int &argc, char **argv) const
{
    const QCoreApplication application(argc, argv);
    const QFileInfo shown(file);
    if (!shown.isFile()) {
        return fail(exitInput, Xlate("there is no file \"%1\"").arg(file));
    }
    if (isPdfFile(file)) {
        return fail(exitInput, QStringLiteral("\"%1\": ").arg(file) + Xlate("A PDF cannot be opened as a report"));
    }
    const QString desk = deskProgram();
    if (desk.isEmpty()) {
        return fail(exitOutput, Xlate("the program kareport-desk is not installed"));
    }
    if (!hasDisplay()) {
        return fail(exitOutput,
                    Xlate("there is no display to show a window on: DISPLAY or WAYLAND_DISPLAY was expected"));
    }
    // The full path, so that a name that begins with "-" is not taken for an option.
    if (!QProcess::startDetached(desk, {shown.absoluteFilePath()})) {
        return fail(exitOutput, Xlate("\"%1\" could not be started").arg(desk));
    }
    return exitDone;
}

} // namespace kareport
