#include "ReplaceFile.h"

#include "DevicePath.h"
#include "LinkTarget.h"
#include "UnfinishedFile.h"
#include "WriteFailure.h"
#include "Xlate.h"

#include <QFile>
#include <QSaveFile>

namespace kareport
{

namespace
{

bool finish(bool done, QString *error, const QString &reason)
{
    if (!done && error != nullptr) {
        *error = reason;
    }
    return done;
}

/// Why a file was not written. If the disk takes a part of a piece, the file does not report an error yet.
QString reasonOf(const QFileDevice &file)
{
    const bool isSaid = file.error() != QFileDevice::NoError && file.errorString() != QFile().errorString();
    return isSaid ? file.errorString() : QString();
}

} // namespace

bool replaceFile(const QString &path, const std::function<bool(QIODevice &)> &write, QString *error)
{
    const QString target = linkTarget(path, error);
    if (target.isEmpty() && !path.isEmpty()) {
        return false;
    }
    const QString device = devicePath(path);
    if (!device.isEmpty()) {
        // It is written to: putting a file into its place would destroy it.
        QFile file(device);
        const bool done = file.open(QIODevice::WriteOnly) && write(file) && file.flush();
        return finish(done, error, file.errorString());
    }
    // A link stays a link: what it points to is replaced.
    QSaveFile file(target);
    if (!file.open(QIODevice::WriteOnly)) {
        return finish(false, error, file.errorString());
    }
    const UnfinishedFile unfinished(file.handle());
    // Without the flush a commit does not notice that the last bytes did not fit.
    if (!write(file) || !file.flush()) {
        QString reason = reasonOf(file);
        reason = reason.isEmpty() ? whyWritingFails(file.handle()) : reason;
        return finish(false, error, reason.isEmpty() ? Xlate("not all of it could be written") : reason);
    }
    // A commit ignores an error that the disk reports only now, as network disks do.
    const QString reason = whySyncFails(file.handle());
    if (!reason.isEmpty()) {
        return finish(false, error, reason);
    }
    // The reason is there after the commit only, and needs memory, which must not fail after a commit that is done.
    return file.commit() || finish(false, error, file.errorString());
}

} // namespace kareport
