#include "ProcessSetup.h"

#include <QCoreApplication>
#include <QDir>
#include <QFontDatabase>

#include <windows.h>

#include <fcntl.h>
#include <io.h>

#include <cstdio>
#include <cstdlib>

namespace kareport
{

namespace
{

UINT outerCodePage = 0;

/// The console is the caller's as well.
void restoreCodePage()
{
    SetConsoleOutputCP(outerCodePage);
}

void writeUtf8ToConsole()
{
    outerCodePage = GetConsoleOutputCP();
    if (outerCodePage != 0 && outerCodePage != CP_UTF8 && SetConsoleOutputCP(CP_UTF8) != FALSE) {
        std::atexit(restoreCodePage);
    }
}

} // namespace

void prepareProcess()
{
    // Reports hold their own line ends, and a character 26 is not the end of what is read.
    for (std::FILE *stream : {stdin, stdout, stderr}) {
        if (_fileno(stream) >= 0) {
            _setmode(_fileno(stream), _O_BINARY);
        }
    }
    writeUtf8ToConsole();
    // A missing disk is a failed read, and not a question to the user.
    SetErrorMode(SEM_FAILCRITICALERRORS | SEM_NOOPENFILEERRORBOX);
}

bool isOutputReaderGone()
{
    HANDLE output = GetStdHandle(STD_OUTPUT_HANDLE);
    if (GetFileType(output) != FILE_TYPE_PIPE) {
        return false;
    }
    DWORD written = 0;
    if (WriteFile(output, "", 0, &written, nullptr) != FALSE) {
        return false;
    }
    const DWORD error = GetLastError();
    return error == ERROR_NO_DATA || error == ERROR_BROKEN_PIPE;
}

void addShippedFaces()
{
    const QDir folder(QCoreApplication::applicationDirPath() + QStringLiteral("/fonts"));
    for (const QString &file : folder.entryList({QStringLiteral("*.ttf"), QStringLiteral("*.ttc")}, QDir::Files)) {
        QFontDatabase::addApplicationFont(folder.filePath(file));
    }
}

} // namespace kareport
