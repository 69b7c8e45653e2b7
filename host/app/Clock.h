#pragma once

#include "KaReportExport.h"

#include <QDateTime>

#include <optional>

namespace kareport
{

/// The date and time that reports are dated with: the local time, unless a host or a test has fixed it.
KAREPORT_EXPORT QDateTime currentTime();
/// Fixes the time; `std::nullopt` lets the clock run again.
KAREPORT_EXPORT void fixTime(const std::optional<QDateTime> &time);

} // namespace kareport
