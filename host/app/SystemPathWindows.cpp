#include "SystemPath.h"
#include "WidePathWindows.h"

#include "DevicePath.h"

#include <QDir>

#include <windows.h>

#include <array>

namespace kareport
{

namespace
{

/// The text in the code page of the system; empty where that lacks a character.
QByteArray inCodePage(const std::wstring &text)
{
    // Not of UTF-8, which has them all, and whose conversion refuses to say so.
    const bool isUnicode = GetACP() == CP_UTF8;
    BOOL isReplaced = FALSE;
    const auto convert = [&](char *to, int room) {
        return WideCharToMultiByte(CP_ACP, isUnicode ? 0 : WC_NO_BEST_FIT_CHARS, text.data(),
                                   static_cast<int>(text.size()), to, room, nullptr, isUnicode ? nullptr : &isReplaced);
    };
    const int size = convert(nullptr, 0);
    QByteArray bytes(size, '\0');
    convert(bytes.data(), size);
    return isReplaced != FALSE ? QByteArray() : bytes;
}

/// The name that the system keeps for programs that know names of eight letters; empty where it keeps none.
std::wstring shortPath(const std::wstring &path)
{
    std::wstring name(GetShortPathNameW(path.c_str(), nullptr, 0), L'\0');
    const DWORD size = GetShortPathNameW(path.c_str(), name.data(), static_cast<DWORD>(name.size()));
    name.resize(size < name.size() ? size : 0);
    return name;
}

} // namespace

std::wstring widePath(const QString &path)
{
    const QString device = devicePath(path);
    if (!device.isEmpty()) {
        return device.toStdWString();
    }
    const QString native = QDir::toNativeSeparators(QDir::cleanPath(QDir::current().absoluteFilePath(path)));
    if (native.startsWith(u"\\\\?\\") || native.startsWith(u"\\\\.\\")) {
        return native.toStdWString();
    }
    const bool isOnServer = native.startsWith(u"\\\\");
    const QString whole =
        isOnServer ? QStringLiteral("\\\\?\\UNC") + native.sliced(1) : QStringLiteral("\\\\?\\") + native;
    return whole.toStdWString();
}

QByteArray pathForLibrary(const QString &path)
{
    const QByteArray bytes = inCodePage(QDir::toNativeSeparators(path).toStdWString());
    if (!bytes.isEmpty()) {
        return bytes;
    }
    // A file that is not there yet has no short name, but its folder has.
    const qsizetype slash = QDir::fromNativeSeparators(path).lastIndexOf(u'/');
    const std::wstring folder = shortPath(slash < 0 ? L"." : widePath(path.first(slash)));
    const std::wstring whole = shortPath(widePath(path));
    return inCodePage(!whole.empty() ? whole : folder + L'\\' + path.sliced(slash + 1).toStdWString());
}

std::filesystem::path standardPath(const QString &path)
{
    return widePath(path);
}

QString textOfSystem(const QByteArray &bytes)
{
    return QString::fromUtf8(bytes);
}

} // namespace kareport
