#include "ReportSteps.h"

QString textOf(const ReportStep &step)
{
    return QStringLiteral("    {ReportOp::%1, %2, %3, %4, %5},\n")
        .arg(QLatin1StringView(reportOpNames[int(step.op)]))
        .arg(step.a)
        .arg(step.b)
        .arg(step.c)
        .arg(step.report);
}
