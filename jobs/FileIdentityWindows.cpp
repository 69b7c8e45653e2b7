#include "FileIdentity.h"

#include "DevicePath.h"
#include "LinkTarget.h"
#include "WidePathWindows.h"

#include <QDir>
#include <QFileInfo>

#include <windows.h>

#include <optional>

namespace kareport
{

namespace
{

struct Status
{
    QString identity;
    bool isFolder = false;
};

std::optional<Status> statusOf(HANDLE file)
{
    BY_HANDLE_FILE_INFORMATION information = {};
    if (GetFileType(file) != FILE_TYPE_DISK || GetFileInformationByHandle(file, &information) == FALSE) {
        return std::nullopt;
    }
    const quint64 number = (quint64(information.nFileIndexHigh) << 32) | information.nFileIndexLow;
    return Status{QStringLiteral("%1:%2").arg(information.dwVolumeSerialNumber).arg(number),
                  (information.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0};
}

std::optional<Status> statusOf(const QString &path)
{
    constexpr DWORD shareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
    // Folders are opened with the semantics of a backup alone.
    HANDLE file = CreateFileW(widePath(path).c_str(), FILE_READ_ATTRIBUTES, shareAll, nullptr, OPEN_EXISTING,
                              FILE_FLAG_BACKUP_SEMANTICS, nullptr);
    if (file == INVALID_HANDLE_VALUE) {
        return std::nullopt;
    }
    const auto status = statusOf(file);
    CloseHandle(file);
    return status;
}

} // namespace

QString fileIdentity(const QString &path)
{
    if (!devicePath(path).isEmpty()) {
        return {};
    }
    if (const auto status = statusOf(path)) {
        return status->isFolder ? QString() : status->identity;
    }
    const QString target = linkTarget(path);
    const QString clean = QDir::cleanPath(QFileInfo(target.isEmpty() ? path : target).absoluteFilePath());
    QString folder = QFileInfo(clean).path();
    auto status = statusOf(folder);
    while (!status && folder != QFileInfo(folder).path()) {
        folder = QFileInfo(folder).path();
        status = statusOf(folder);
    }
    // Names that differ in their case mean one file.
    return status ? status->identity + u'/' + QDir(folder).relativeFilePath(clean).toCaseFolded()
                  : clean.toCaseFolded();
}

QString standardOutputIdentity()
{
    const auto status = statusOf(GetStdHandle(STD_OUTPUT_HANDLE));
    return status && !status->isFolder ? status->identity : QString();
}

} // namespace kareport
