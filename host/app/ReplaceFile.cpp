#include "ReplaceFile.h"

#include <QFile>
#include <QFileInfo>
#include <QSaveFile>

namespace kareport
{

namespace
{

bool finish(const QFileDevice &file, bool done, QString *error)
{
    if (!done && error != nullptr) {
        *error = file.errorString();
    }
    return done;
}

} // namespace

bool replaceFile(const QString &path, const std::function<bool(QIODevice &)> &write, QString *error)
{
    const QFileInfo info(path);
    if (info.exists() && !info.isFile() && !info.isDir()) {
        // A pipe or a device is written to: putting a file into its place would destroy it.
        QFile file(path);
        return finish(file, file.open(QIODevice::WriteOnly) && write(file) && file.flush(), error);
    }
    // A link stays a link: what it points to is replaced.
    QSaveFile file(info.isSymLink() && info.exists() ? info.canonicalFilePath() : path);
    // Without the flush a commit overlooks that the last bytes did not fit.
    return finish(file, file.open(QIODevice::WriteOnly) && write(file) && file.flush() && file.commit(), error);
}

} // namespace kareport
