#include "ApplicationTitle.h"

namespace
{

const QString baseTitle = QStringLiteral("TALVEN");

QString &currentTitle()
{
    static QString title = baseTitle;
    return title;
}

} // namespace

QString GetApplicationTitle()
{
    return currentTitle();
}

bool SetApplicationTitle(const QString &title)
{
    if (!title.startsWith(baseTitle)) {
        return false;
    }
    currentTitle() = title;
    return true;
}
