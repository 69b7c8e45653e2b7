#pragma once

#include "EditorLauncher.h"
#include "Preferences.h"
#include "Profile.h"

#include <QFile>
#include <QStringList>
#include <QTemporaryDir>

#include <functional>
#include <vector>

/// Takes the place of the programs that would be started, and keeps what they were to be started with.
class RecordedLaunches
{
public:
    RecordedLaunches()
    {
        kareport::setEditorLauncher([this](const kareport::EditorLaunch &launch) {
            all.push_back(launch);
            if (meanwhile) {
                meanwhile();
            }
        });
    }
    ~RecordedLaunches() { kareport::setEditorLauncher({}); }
    RecordedLaunches(const RecordedLaunches &) = delete;
    RecordedLaunches &operator=(const RecordedLaunches &) = delete;

    QStringList files() const
    {
        QStringList files;
        for (const kareport::EditorLaunch &launch : all) {
            files.append(launch.file);
        }
        return files;
    }

    std::vector<kareport::EditorLaunch> all;
    std::function<void()> meanwhile; ///< runs with every launch
};

inline void preferEditor(const QString &path)
{
    SetUsePreferredReportEditorFlag(true);
    WriteProfileString(QString(), GetPreferredReportEditorRegKey(), path);
}

/// An installed program that the user prefers as editor. It can be found, not started.
class PreferredEditor
{
public:
    explicit PreferredEditor(const QString &name) : path(folder_.filePath(name))
    {
        QFile file(path);
        file.open(QIODevice::WriteOnly);
        preferEditor(path);
    }

private:
    QTemporaryDir folder_;

public:
    const QString path;
};
