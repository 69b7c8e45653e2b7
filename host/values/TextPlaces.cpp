#include "TextPlaces.h"

#include <algorithm>

namespace kareport
{

TextPlaces::TextPlaces(QStringView text) : text_(text), lineStarts_{0}
{
    for (qsizetype at = text.indexOf(u'\n'); at >= 0; at = text.indexOf(u'\n', at + 1)) {
        lineStarts_.push_back(at + 1);
    }
    for (qsizetype at = 1; at < text.size(); ++at) {
        if (text[at].isLowSurrogate() && text[at - 1].isHighSurrogate()) {
            pairs_.push_back(at);
        }
    }
}

TextPlace TextPlaces::of(qsizetype position) const
{
    position = std::clamp<qsizetype>(position, 0, text_.size());
    const auto nextLine = std::upper_bound(lineStarts_.begin(), lineStarts_.end(), position);
    const qsizetype lineStart = *(nextLine - 1);
    // Inside a pair is the place of the pair: its second half is counted with the pairs before.
    const auto firstPair = std::lower_bound(pairs_.begin(), pairs_.end(), lineStart);
    const auto pairs = std::upper_bound(firstPair, pairs_.end(), position) - firstPair;
    return {nextLine - lineStarts_.begin(), position - lineStart - pairs + 1};
}

} // namespace kareport
