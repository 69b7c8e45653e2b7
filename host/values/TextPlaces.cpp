#include "TextPlaces.h"

#include <algorithm>

namespace kareport
{

TextPlaces::TextPlaces(QStringView text) : text_(text), lineStarts_{0}
{
    for (qsizetype at = text.indexOf(u'\n'); at >= 0; at = text.indexOf(u'\n', at + 1)) {
        lineStarts_.push_back(at + 1);
    }
    hasSurrogates_ = std::any_of(text.begin(), text.end(), [](QChar unit) { return unit.isLowSurrogate(); });
}

TextPlace TextPlaces::of(qsizetype position) const
{
    position = std::clamp<qsizetype>(position, 0, text_.size());
    const auto next = std::upper_bound(lineStarts_.begin(), lineStarts_.end(), position);
    const QStringView before = text_.sliced(*(next - 1), position - *(next - 1));
    qsizetype pairs = 0;
    if (hasSurrogates_) {
        pairs = std::count_if(before.begin(), before.end(), [](QChar unit) { return unit.isLowSurrogate(); });
    }
    return {next - lineStarts_.begin(), before.size() - pairs + 1};
}

} // namespace kareport
