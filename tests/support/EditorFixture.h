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
    RecordedLaunches();
    ~RecordedLaunches() { kareport::setEditorLauncher({}); }
    RecordedLaunches(const RecordedLaunches &) = delete;
    RecordedLaunches &operator=(const RecordedLaunches &) = delete;

    QStringList files() const;

    std::vector<kareport::EditorLaunch> all;
    std::function<void()> meanwhile; ///< runs with every launch
};

void preferEditor(const QString &path);

/// An installed program that the user prefers as editor. It can be found, not started.
class PreferredEditor
{
public:
    explicit PreferredEditor(const QString &name);

private:
    QTemporaryDir folder_;

public:
    const QString path;
};
