#pragma once

#include <QtGlobal>

namespace kareport
{

/// One page of a report.
struct ReportPage
{
    qint64 begin = 0; ///< its first character, from 0
    qint64 end = 0;   ///< after the line end of its last line; blank lines at its end are left out
    qint64 lines = 0; ///< from `begin` to `end`; 0 for a blank page
};

} // namespace kareport
