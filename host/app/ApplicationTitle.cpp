#include "ApplicationTitle.h"

namespace
{

QString &currentTitle()
{
    static QString title = baseApplicationTitle;
    return title;
}

} // namespace

QString GetApplicationTitle()
{
    return currentTitle();
}

bool SetApplicationTitle(const QString &title)
{
    if (!title.startsWith(baseApplicationTitle)) {
        return false;
    }
    currentTitle() = title;
    return true;
}
