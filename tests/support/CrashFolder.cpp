#include "CrashFolder.h"

#include "FrameFixture.h"

#include <QDir>
#include <QProcess>
#include <QSysInfo>

namespace
{

qint64 deadProcess()
{
    QProcess process;
    process.start(QStringLiteral("true"), QStringList());
    process.waitForStarted();
    const qint64 id = process.processId();
    process.waitForFinished();
    return id;
}

} // namespace

QStringList CrashFolder::programs() const
{
    return QDir(path()).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
}

QStringList CrashFolder::files(const QString &program) const
{
    return QDir(path() + u'/' + program).entryList(QDir::Files, QDir::Name);
}

void CrashFolder::crash(std::unique_ptr<kareport::Recovery> recovery) const
{
    const QString program = programs().value(0);
    const QString kept = folder_.filePath(QStringLiteral("kept"));
    QDir().mkpath(kept);
    for (const QString &file : files(program)) {
        QFile::copy(path() + u'/' + program + u'/' + file, kept + u'/' + file);
    }
    recovery.reset();
    QDir().rename(kept, path() + QStringLiteral("/crashed"));
    // The lock of a process that is no longer there.
    putFile(path() + QStringLiteral("/crashed/lock"),
            QByteArray::number(deadProcess()) + "\nka_tests\n" + QSysInfo::machineHostName().toUtf8() + "\n");
}
