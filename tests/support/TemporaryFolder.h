#pragma once

#include <QByteArray>
#include <QDir>
#include <QString>
#include <QTemporaryDir>

/// Lets a folder be the system's folder for temporary files. A new one, as names are handed out once while a program runs.
class TemporaryFolder
{
public:
    explicit TemporaryFolder(const QString &suffix = QString());
    ~TemporaryFolder();
    TemporaryFolder(const TemporaryFolder &) = delete;
    TemporaryFolder &operator=(const TemporaryFolder &) = delete;

    static void set(const QString &path);
    /// The path of a file in the folder.
    QString at(const QString &name) const { return folder_.path() + QDir::separator() + name; }

private:
    static void restore(const char *name, const QByteArray &value, bool isSet);

    QTemporaryDir folder_;
    QByteArray unix_;
    QByteArray windows_;
    bool isUnixSet_;
    bool isWindowsSet_;
};
