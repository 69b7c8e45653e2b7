#include "Xlate.h"

#include "TranslatorNote.h"

#include <QCoreApplication>

QString Xlate(const char *text)
{
    const kareport::NotedText noted(text);
    return QCoreApplication::translate("KaReport", noted.text.constData(), noted.noteOrNull());
}
