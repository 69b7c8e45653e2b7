#include "EditorFixture.h"

RecordedLaunches::RecordedLaunches()
{
    kareport::setEditorLauncher([this](const kareport::EditorLaunch &launch) {
        all.push_back(launch);
        if (meanwhile) {
            meanwhile();
        }
    });
}

QStringList RecordedLaunches::files() const
{
    QStringList files;
    for (const kareport::EditorLaunch &launch : all) {
        files.append(launch.file);
    }
    return files;
}

void preferEditor(const QString &path)
{
    SetUsePreferredReportEditorFlag(true);
    WriteProfileString(QString(), GetPreferredReportEditorRegKey(), path);
}

PreferredEditor::PreferredEditor(const QString &name) : path(folder_.filePath(name))
{
    QFile file(path);
    file.open(QIODevice::WriteOnly);
    preferEditor(path);
}
