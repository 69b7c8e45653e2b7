#include "ProgramArguments.h"

#include <QByteArray>
#include <QDir>
#include <QFileInfo>
#include <QString>
#include <QStringList>

#include <windows.h>

#include <shellapi.h>

#include <vector>

namespace kareport
{

namespace
{

QStringList givenWords()
{
    QStringList words;
    int count = 0;
    wchar_t **list = CommandLineToArgvW(GetCommandLineW(), &count);
    for (int i = 0; list != nullptr && i < count; ++i) {
        words.append(QString::fromWCharArray(list[i]));
    }
    LocalFree(list);
    return words;
}

/// The files that match a name with * or ? in its last part, by their names; the word itself where there are none, as in
/// a shell.
QStringList filesOf(const QString &word)
{
    const qsizetype end = QDir::fromNativeSeparators(word).lastIndexOf(u'/') + 1;
    const QString name = word.sliced(end);
    const bool isPattern = name.contains(u'*') || name.contains(u'?');
    if (!isPattern || word.startsWith(u'-') || word.contains(u'=')) {
        return QStringList(word);
    }
    QStringList filters;
    QString filter = name;
    filters.append(filter.replace(u'[', QStringLiteral("[[]")));
    QStringList files;
    const QString folder = word.first(end);
    for (const QString &file :
         QDir(folder.isEmpty() ? QStringLiteral(".") : folder).entryList(filters, QDir::Files, QDir::Name))
    {
        files.append(folder + file);
    }
    return files.isEmpty() ? QStringList(word) : files;
}

} // namespace

ProgramArguments ProgramArguments::of(int /*argc*/, char ** /*argv*/)
{
    static std::vector<QByteArray> bytes;
    static std::vector<char *> words;
    bool isProgram = true;
    for (const QString &word : givenWords()) {
        for (const QString &one : isProgram ? QStringList(word) : filesOf(word)) {
            bytes.push_back(one.toUtf8());
        }
        isProgram = false;
    }
    for (QByteArray &word : bytes) {
        words.push_back(word.data());
    }
    words.push_back(nullptr);
    return {static_cast<int>(bytes.size()), words.data()};
}

} // namespace kareport
