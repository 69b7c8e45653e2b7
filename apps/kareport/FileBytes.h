#pragma once

#include "InputError.h"

#include <QByteArray>
#include <QFile>
#include <QString>

#include <memory>
#include <string_view>

namespace kareport
{

/// The bytes of a file. A large one is mapped where the system can, so that it is never in memory as a whole.
class FileBytes
{
public:
    static Expected<std::shared_ptr<const FileBytes>> open(const QString &path);

    std::string_view view() const { return view_; }
    const QString &path() const { return path_; }

private:
    QString path_;
    QFile file_;
    QByteArray content_; ///< of a file that is not mapped
    std::string_view view_;
};

} // namespace kareport
