#include "DataFiles.h"

#include "Xlate.h"

namespace kareport
{

Expected<std::shared_ptr<const FileBytes>> DataFiles::open(const QString &path)
{
    if (const auto known = files_.constFind(path); known != files_.constEnd()) {
        return *known;
    }
    auto opened = path == u"-" ? FileBytes::openStandardInput() : FileBytes::open(path);
    if (errorOf(opened) == nullptr) {
        files_.insert(path, std::get<std::shared_ptr<const FileBytes>>(opened));
    }
    return opened;
}

QString unreadableData(const QString &path, const QString &why)
{
    return Xlate("the data file \"%1\" cannot be read: %2").arg(path, why);
}

} // namespace kareport
