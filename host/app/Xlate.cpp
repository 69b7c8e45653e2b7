#include "Xlate.h"

#include <QByteArrayView>
#include <QCoreApplication>

QString Xlate(const char *text)
{
    const QByteArrayView whole(text);
    const qsizetype mark = whole.indexOf("@@");
    if (mark < 0) {
        return QCoreApplication::translate("KaReport", text);
    }
    const QByteArray shown = whole.first(mark).toByteArray();
    const QByteArray note = whole.sliced(mark + 2).toByteArray();
    return QCoreApplication::translate("KaReport", shown.constData(), note.constData());
}
