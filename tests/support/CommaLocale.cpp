#include "CommaLocale.h"

#include <QProcess>

#include <clocale>

CommaLocale::CommaLocale() : before_(std::setlocale(LC_NUMERIC, nullptr)), pathBefore_(qgetenv("LOCPATH"))
{
    for (const char *name : {"de_DE.UTF-8", "de_DE.utf8", "German_Germany.1252"}) {
        if (take(name)) {
            return;
        }
    }
    QProcess process;
    process.start(QStringLiteral("localedef"),
                  {QStringLiteral("-i"), QStringLiteral("de_DE"), QStringLiteral("-f"), QStringLiteral("UTF-8"),
                   QStringLiteral("--no-archive"), folder_.filePath(QStringLiteral("de_DE.UTF-8"))});
    if (process.waitForFinished()) {
        qputenv("LOCPATH", folder_.path().toUtf8());
        take("de_DE.UTF-8");
    }
}

CommaLocale::~CommaLocale()
{
    std::setlocale(LC_NUMERIC, before_.constData());
    if (pathBefore_.isEmpty()) {
        qunsetenv("LOCPATH");
    } else {
        qputenv("LOCPATH", pathBefore_);
    }
}

bool CommaLocale::take(const char *name)
{
    name_ = std::setlocale(LC_NUMERIC, name);
    return isThere();
}
