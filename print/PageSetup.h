#pragma once

#include <QMargins>
#include <QSize>
#include <QSizeF>
#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace kareport
{

/// A sheet that a printer takes, upright.
struct PageSheet
{
    QString name;       ///< as the user is shown it
    QSize points;       ///< width and height in points
    QSizeF millimetres; ///< the same in millimetres
};

/// What a page is set up with.
struct PageSetup
{
    QMargins margins;     ///< hundredths of a millimetre
    bool portrait = true; ///< whether paper is upright
    QString printer;      ///< empty for the built-in page device
    QStringList printers; ///< to choose from
    QSize sheet;          ///< upright, in points; empty for the printer's own
    /// Whether there is a report to ask for its pages.
    bool asksForPages = false;
    /// The lines of the page that the report was made for; nothing for a report whose page has only been measured.
    std::optional<int> givenLines;
    /// Whether each of those pages is printed on a sheet of its own, or as many lines on a sheet as it takes.
    bool keepsGivenPages = false;
    /// Whether lengths are shown in inches, not in millimetres.
    bool inInches = false;
    /// The sheets that a printer takes, its own first.
    std::function<std::vector<PageSheet>(const QString &printer)> sheetsOf;
};

} // namespace kareport
