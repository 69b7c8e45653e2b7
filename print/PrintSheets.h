#pragma once

#include "ReportPages.h"

#include <QRect>
#include <QtGlobal>

#include <vector>

namespace kareport
{

class LinePager;

/// A sheet of paper, and what is printed on it: the characters from `start` to before `stop`.
struct PrintSheet
{
    qint64 start = 0;
    qint64 stop = 0;
    qreal scale = 1; ///< of the type
};

/// The sheets that pages take, each of which begins on one of its own. All pages have type of one size: the largest that
/// has room for the widest row of the text and for every page of `usualLines` lines at most. A page of more lines has its own,
/// and one that has no room in the smallest type continues on further sheets.
/// @param twips  the part of a sheet that takes text
std::vector<PrintSheet> printSheets(LinePager &pager, const QRect &twips, const std::vector<ReportPage> &pages,
                                    qint64 usualLines);

} // namespace kareport
