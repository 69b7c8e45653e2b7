#include "StarterFiles.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>

static void initializeStarterFiles()
{
    Q_INIT_RESOURCE(starter); // outside of any namespace
}

namespace kareport
{

namespace
{

/// A text as it is written between the quotes of a JSON text.
QByteArray inJson(const QString &text)
{
    constexpr qsizetype brackets = 2; // and quotes
    const QByteArray list = QJsonDocument(QJsonArray{text}).toJson(QJsonDocument::Compact);
    return list.mid(brackets, list.size() - 2 * brackets);
}

} // namespace

std::vector<StarterFile> starterFiles(const QString &name, const QString &title)
{
    initializeStarterFiles();
    std::vector<StarterFile> files;
    for (const char *ending : {".xml", ".csv", ".json"}) {
        QFile file(QStringLiteral(":/kareport/starter") + QLatin1StringView(ending));
        file.open(QIODevice::ReadOnly); // it is part of the program
        // The marks are in the job alone.
        const QByteArray bytes = file.readAll().replace("@FILE@", inJson(name)).replace("@TITLE@", inJson(title));
        files.push_back({name + QLatin1StringView(ending), bytes});
    }
    return files;
}

} // namespace kareport
