#include "DataFiles.h"

#include "FileIdentity.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

/// The same for all names of a file. What is not a file is known by the name that it is given.
QString keyOf(const QString &path)
{
    const QString identity = path == u"-" ? QString() : fileIdentity(path);
    return identity.isEmpty() ? path : identity;
}

} // namespace

std::shared_ptr<SqliteFile> &DataFiles::database(const QString &path)
{
    return databases_[keyOf(path)];
}

Expected<std::shared_ptr<const FileBytes>> DataFiles::open(const QString &path)
{
    const QString key = keyOf(path);
    if (const auto known = files_.constFind(key); known != files_.constEnd()) {
        return *known;
    }
    auto opened = path == u"-" ? FileBytes::openStandardInput() : FileBytes::open(path);
    if (errorOf(opened) == nullptr) {
        files_.insert(key, std::get<std::shared_ptr<const FileBytes>>(opened));
    }
    return opened;
}

QString unreadableData(const QString &path, const QString &why)
{
    return Xlate("the data file \"%1\" cannot be read: %2").arg(path, why);
}

} // namespace kareport
