#include "ReportResources.h"

namespace kareport
{

const char *reportString(unsigned number)
{
    switch (number) {
    case reportWindowTitle: return "KaReport";
    case commandSaveReport: return "Save";
    case commandShowReport: return "View\\Edit Report";
    case commandPrintReport: return "Print";
    default: return "";
    }
}

} // namespace kareport
