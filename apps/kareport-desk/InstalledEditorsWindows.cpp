#include "InstalledEditors.h"

#include <QDir>
#include <QFileInfo>
#include <QSettings>

#include <windows.h>

#include <shlwapi.h>

#include <algorithm>
#include <optional>

namespace kareport
{

namespace
{

QString associated(ASSOCSTR what, const wchar_t *ending)
{
    DWORD size = 0;
    AssocQueryStringW(ASSOCF_INIT_IGNOREUNKNOWN, what, ending, L"open", nullptr, &size);
    std::wstring text(size, L'\0');
    if (size == 0 || FAILED(AssocQueryStringW(ASSOCF_INIT_IGNOREUNKNOWN, what, ending, L"open", text.data(), &size))) {
        return {};
    }
    return QString::fromWCharArray(text.c_str());
}

/// The program that opens files of an ending when they are double-clicked.
std::optional<InstalledEditor> associatedEditor(const wchar_t *ending)
{
    const QString program = QDir::fromNativeSeparators(associated(ASSOCSTR_EXECUTABLE, ending));
    if (!QFileInfo(program).isFile()) {
        return std::nullopt;
    }
    const QString name = associated(ASSOCSTR_FRIENDLYAPPNAME, ending);
    return InstalledEditor{name.isEmpty() ? QFileInfo(program).completeBaseName() : name, program};
}

/// A program by the name that it is registered under for the Run dialog.
std::optional<InstalledEditor> registeredEditor(const QString &name, const QString &file)
{
    const QString key = QStringLiteral("SOFTWARE/Microsoft/Windows/CurrentVersion/App Paths/") + file + u'/';
    for (const auto *root : {"HKEY_CURRENT_USER\\", "HKEY_LOCAL_MACHINE\\"}) {
        const QSettings registry(QString::fromLatin1(root), QSettings::NativeFormat);
        QString program = registry.value(key + QStringLiteral("Default")).toString();
        program.remove(u'"');
        if (QFileInfo(program).isFile()) {
            return InstalledEditor{name, QDir::fromNativeSeparators(program)};
        }
    }
    return std::nullopt;
}

std::optional<InstalledEditor> notepad()
{
    std::wstring folder(MAX_PATH, L'\0');
    folder.resize(GetSystemDirectoryW(folder.data(), MAX_PATH));
    const QString program =
        QDir::fromNativeSeparators(QString::fromStdWString(folder)) + QStringLiteral("/notepad.exe");
    return QFileInfo(program).isFile() ? std::optional(InstalledEditor{QStringLiteral("Notepad"), program})
                                       : std::nullopt;
}

} // namespace

std::vector<InstalledEditor> installedEditors(const QStringList & /*folders*/)
{
    std::vector<InstalledEditor> editors;
    const auto add = [&editors](const std::optional<InstalledEditor> &editor) {
        const auto isSame = [&](const InstalledEditor &other) {
            return other.path.compare(editor->path, Qt::CaseInsensitive) == 0;
        };
        if (editor && std::none_of(editors.begin(), editors.end(), isSame)) {
            editors.push_back(*editor);
        }
    };
    add(associatedEditor(L".txt"));
    add(associatedEditor(L".rtf"));
    add(registeredEditor(QStringLiteral("Word"), QStringLiteral("winword.exe")));
    add(registeredEditor(QStringLiteral("WordPad"), QStringLiteral("wordpad.exe")));
    add(registeredEditor(QStringLiteral("LibreOffice Writer"), QStringLiteral("swriter.exe")));
    add(notepad());
    std::sort(editors.begin(), editors.end(), [](const InstalledEditor &a, const InstalledEditor &b) {
        return QString::localeAwareCompare(a.name, b.name) < 0;
    });
    return editors;
}

QString programsFolder()
{
    return QDir::fromNativeSeparators(qEnvironmentVariable("ProgramFiles", QStringLiteral("C:/Program Files")));
}

} // namespace kareport
