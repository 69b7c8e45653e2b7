#pragma once

#include "Recovery.h"

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <memory>

/// A folder as programs leave it that crash: what one of them kept, without the program.
class CrashFolder
{
public:
    QString path() const { return folder_.filePath(QStringLiteral("recovery")); }
    /// The folders of programs in it.
    QStringList programs() const;
    QStringList files(const QString &program) const;
    /// Ends a program as a crash does: its files stay, its lock has no owner.
    void crash(std::unique_ptr<kareport::Recovery> recovery) const;

private:
    QTemporaryDir folder_;
};
