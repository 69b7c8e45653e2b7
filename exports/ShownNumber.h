#pragma once

#include "ResultSink.h"

#include <optional>

namespace kareport
{

/// Whether a column shows numbers, which are aligned at their decimal sign.
bool showsNumbers(const ResultColumn &column);
/// Whether a column shows numbers with a letter for their side, such as 12.500R.
bool hasSideLetter(const ResultColumn &column);
/// How many decimals a column of numbers shows.
int shownDecimals(const ResultColumn &column, const UJobSettings &settings);
/// The number that a value shows, in the unit that it is shown in; of a bearing, degrees from the north. Nothing for what is
/// missing, no number, or infinite.
std::optional<double> shownNumber(const ResultColumn &column, const ResultCell &cell, const UJobSettings &settings);

} // namespace kareport
