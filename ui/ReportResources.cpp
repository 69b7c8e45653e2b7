#include "ReportResources.h"

#include <QtGlobal>

namespace kareport
{

const char *reportString(unsigned number)
{
    switch (number) {
    case reportWindowTitle: return QT_TRANSLATE_NOOP("KaReport", "KaReport");
    case commandSaveReport: return QT_TRANSLATE_NOOP("KaReport", "Save");
    case commandShowReport: return QT_TRANSLATE_NOOP("KaReport", "View\\Edit Report");
    case commandPrintReport: return QT_TRANSLATE_NOOP("KaReport", "Print");
    default: return "";
    }
}

} // namespace kareport
