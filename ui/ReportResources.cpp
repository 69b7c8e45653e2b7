#include "ReportResources.h"

#include <QFontMetrics>
#include <QtGlobal>

namespace kareport
{

const char *reportString(unsigned number)
{
    switch (number) {
    case moduleTitle: return QT_TRANSLATE_NOOP("KaReport", "KaReport");
    case commandSaveReport: return QT_TRANSLATE_NOOP("KaReport", "Save");
    case commandShowReport: return QT_TRANSLATE_NOOP("KaReport", "View\\Edit Report");
    case commandPrintReport: return QT_TRANSLATE_NOOP("KaReport", "Print");
    default: return "";
    }
}

ToolBarResource reportBar(unsigned number)
{
    if (number != reportToolBar) {
        return {};
    }
    return {QSize(16, 16), {commandSaveReport, commandShowReport, commandPrintReport}};
}

DialogResource reportDialog(unsigned number)
{
    if (number != reportWindowDialog) {
        return {};
    }
    return {QSize(220, 89), QStringLiteral("MS Shell Dlg"), 8, reportLinesControl, QRect(0, 0, 219, 88)};
}

QRect pixelsOfDialogUnits(const QRect &units, const QFontMetrics &font)
{
    const auto across = [&font](int unit) { return unit * font.averageCharWidth() / 4; };
    const auto down = [&font](int unit) { return unit * font.height() / 8; };
    return {across(units.x()), down(units.y()), across(units.width()), down(units.height())};
}

} // namespace kareport
