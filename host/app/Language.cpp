#include "Language.h"

#include "TranslatorNote.h"

#include <QCoreApplication>
#include <QDir>
#include <QLibraryInfo>
#include <QLocale>
#include <QPointer>
#include <QTranslator>

#include <memory>
#include <utility>
#include <vector>

// The files are in the library, so every program that links it has them.
static void registerTranslations()
{
    Q_INIT_RESOURCE(translations);
}

namespace kareport
{

namespace
{

const QString folder = QStringLiteral(":/kareport/translations");

/// Translators in use, owned by the application; they are deleted with the next language.
std::vector<QPointer<QTranslator>> &installed()
{
    static std::vector<QPointer<QTranslator>> translators;
    return translators;
}

bool install(const QString &file, const QString &path)
{
    auto translator = std::make_unique<QTranslator>();
    if (!translator->load(file, path)) {
        return false;
    }
    translator->setParent(QCoreApplication::instance());
    installed().emplace_back(translator.get());
    QCoreApplication::installTranslator(translator.release());
    return true;
}

} // namespace

QStringList translatedLanguages()
{
    registerTranslations();
    QStringList languages;
    for (const QString &file : QDir(folder).entryList({QStringLiteral("kareport_*.qm")}, QDir::Files, QDir::Name)) {
        languages.append(file.section(u'_', 1).section(u'.', 0, 0));
    }
    return languages;
}

QStringList inAllLanguages(const char *text)
{
    const NotedText noted(text);
    QStringList texts(QString::fromUtf8(noted.text));
    for (const QString &language : translatedLanguages()) {
        QTranslator translator;
        const QString translated = translator.load(QStringLiteral("kareport_") + language, folder)
                                       ? translator.translate("KaReport", noted.text.constData(), noted.noteOrNull())
                                       : QString();
        if (!translated.isEmpty()) {
            texts.append(translated);
        }
    }
    return texts;
}

QString setLanguage(const QString &language)
{
    for (const auto &translator : std::exchange(installed(), {})) {
        delete translator; // which takes it out of use
    }
    const QString name = language.isEmpty() ? QLocale::system().name() : language;
    QString code = name.section(u'_', 0, 0);
    if (!translatedLanguages().contains(code) || !install(QStringLiteral("kareport_") + code, folder)) {
        return QStringLiteral("en");
    }
    install(QStringLiteral("qtbase_") + code, QLibraryInfo::path(QLibraryInfo::TranslationsPath));
    return code;
}

} // namespace kareport
