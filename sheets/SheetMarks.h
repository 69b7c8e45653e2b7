#pragma once

#include "PageRow.h"
#include "TextSearch.h"

#include <QPoint>
#include <QRectF>
#include <QTextCursor>

#include <vector>

class QTextDocument;

namespace kareport
{

// Places of characters on a sheet, whose rows `SheetLayout::rows` gives. All in dots.

/// The rectangles of the characters from `start` to before `stop`, one a row.
std::vector<QRectF> rectsOf(const std::vector<PageRow> &rows, qint64 start, qint64 stop);
/// The same of all that a search finds in the lines of these rows.
std::vector<QRectF> rectsOf(const std::vector<PageRow> &rows, const QTextDocument &text, const TextSearch &search);
/// Where a cursor is, without width; a null rectangle where it is on another sheet.
QRectF cursorRect(const std::vector<PageRow> &rows, qint64 position);
/// The place between two characters that is nearest to a point. @return -1 on a sheet without rows
qint64 positionAt(const std::vector<PageRow> &rows, QPointF point);

} // namespace kareport
