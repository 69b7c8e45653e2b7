#include "PageFit.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// What the last place of a calculation may add to a length.
constexpr double rounding = 1e-6;

/// The part of `needed` that there is room for: 1 for all of it.
double share(double room, double needed)
{
    return needed > 0 ? std::clamp(room / needed, 0.0, 1.0) : 1;
}

} // namespace

PageFit fitPage(const PageText &text, const SheetRoom &room)
{
    const double least = std::min(text.points, smallestType);
    const double wanted = text.points * std::min(share(room.width, text.widestRow),
                                                 share(room.height, static_cast<double>(text.rows) * text.rowHeight));
    PageFit fit;
    fit.points = std::max(least, wanted);
    const double scale = text.points > 0 ? fit.points / text.points : 1;
    fit.breaksRows = text.widestRow * scale > room.width * (1 + rounding);
    if (text.rows > 1 && text.rowHeight > 0) {
        // A sheet takes one row at least, however low it is. More than all rows is the same as all.
        const auto rows = static_cast<double>(text.rows);
        const double perSheet = std::clamp(std::floor(room.height / (text.rowHeight * scale) + rounding), 1.0, rows);
        fit.pieces = static_cast<qint64>(std::ceil(rows / perSheet));
    }
    return fit;
}

} // namespace kareport
