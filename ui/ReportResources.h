#pragma once

#include <QFont>
#include <QIcon>
#include <QRect>
#include <QString>

#include <vector>

namespace kareport
{

/// Numbers of the module's windows, commands and texts.
inline constexpr unsigned reportWindowDialog = 155;
inline constexpr unsigned moduleTitle = 11001;
inline constexpr unsigned reportLinesControl = 11005;
inline constexpr unsigned commandSaveReport = 11007;
inline constexpr unsigned commandShowReport = 11009;
inline constexpr unsigned commandPrintReport = 11011;
inline constexpr unsigned reportToolBar = 11018;

/// The untranslated text of a number; empty for a number that has none.
const char *reportString(unsigned number);

/// The icon of a report command: drawn as lines in the colour of the text, so that it reads on light and dark at any size
/// and resolution. Null for a command that has none.
QIcon reportIcon(unsigned command);

/// A bar: the size of its buttons in pixels, and their commands in order.
struct ToolBarResource
{
    QSize buttonSize;
    std::vector<unsigned> commands;
};

/// The bar of a number; without commands for a number that has none.
ToolBarResource reportBar(unsigned number);

/// A dialog with one control. Sizes are in dialog units: quarters of an average character and eighths of a line of its font.
struct DialogResource
{
    QSize size;
    QString fontFace;
    int fontPoints = 0;
    unsigned control = 0;
    QRect controlPlace;

    QFont font() const { return QFont(fontFace, fontPoints); }
};

/// The dialog of a number; empty for a number that has none.
DialogResource reportDialog(unsigned number);

/// A place in dialog units in pixels. @param font  the dialog's, on the screen that shows it
QRect pixelsOfDialogUnits(const QRect &units, const QFontMetrics &font);

} // namespace kareport
