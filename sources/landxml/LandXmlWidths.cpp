#include "LandXmlWidths.h"

#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

bool isWhole(const LandXmlWidth &width)
{
    return width.staEnd >= width.staStart && std::isfinite(width.atStart) && std::isfinite(width.atEnd);
}

double widthAt(const std::vector<LandXmlWidth> &pieces, double station)
{
    constexpr double rounding = 1e-4; // of stations
    const auto next = std::upper_bound(pieces.begin(), pieces.end(), station + rounding,
                                       [](double at, const LandXmlWidth &piece) { return at < piece.staStart; });
    if (next == pieces.begin() || station > (next - 1)->staEnd + rounding) {
        return notGiven;
    }
    const LandXmlWidth &piece = *(next - 1);
    const double length = piece.staEnd - piece.staStart;
    const double part = length > 0 ? std::clamp((station - piece.staStart) / length, 0.0, 1.0) : 1;
    return piece.atStart + (piece.atEnd - piece.atStart) * part;
}

} // namespace

bool LandXmlWidths::add(const LandXmlZone &stored, LandXmlNotes &notes)
{
    constexpr std::size_t most = 100;
    if (zones_.size() == most) {
        return false;
    }
    Zone zone{stored.isRight, stored.widths.empty() ? std::vector(1, stored.whole) : stored.widths};
    std::erase_if(zone.pieces, [&notes](const LandXmlWidth &piece) {
        const bool isNone =
            std::isnan(piece.atStart) && std::isnan(piece.atEnd); // the file does not say how wide it is
        if (!isWhole(piece) && !isNone && !piece.isUnreadable) {
            notes.add(piece.byte,
                      Xlate("the width is left out: staStart, a larger staEnd, startWidth and endWidth were expected"));
        }
        return !isWhole(piece);
    });
    std::stable_sort(zone.pieces.begin(), zone.pieces.end(), [](const LandXmlWidth &left, const LandXmlWidth &right) {
        return left.staStart < right.staStart;
    });
    zones_.push_back(std::move(zone));
    return true;
}

double LandXmlWidths::at(double station, bool isRight) const
{
    double sum = notGiven;
    for (const Zone &zone : zones_) {
        const double width = zone.isRight == isRight ? widthAt(zone.pieces, station) : notGiven;
        if (!std::isnan(width)) {
            sum = width + (std::isnan(sum) ? 0 : sum);
        }
    }
    return sum;
}

void LandXmlWidthTable::fill(const std::vector<LandXmlGradeSurface> &surfaces,
                             const std::vector<LandXmlAlignment> &alignments, LandXmlNotes &notes)
{
    for (const LandXmlAlignment &alignment : alignments) {
        byName_.try_emplace(alignment.name);
    }
    for (const LandXmlGradeSurface &surface : surfaces) {
        const auto known = byName_.find(surface.alignment);
        if (known == byName_.end()) {
            notes.add(surface.byte, Xlate("the widths belong to the alignment \"%1\", which is not in the file")
                                        .arg(QString::fromStdString(surface.alignment.substr(0, 100))));
            continue;
        }
        take(surface, known->second, notes);
    }
    for (const LandXmlAlignment &alignment : alignments) {
        std::size_t &others = byName_.find(alignment.name)->second.others;
        if (others > 0) {
            const QString sentence =
                others == 1 ? Xlate("the alignment \"%1\" has %2 more grade surface, whose widths are not listed")
                            : Xlate("the alignment \"%1\" has %2 more grade surfaces, whose widths are not listed");
            notes.addOfFile(
                sentence.arg(QString::fromStdString(alignment.name.substr(0, 100)), QString::number(others)));
        }
        others = 0; // several may have the name
    }
}

void LandXmlWidthTable::take(const LandXmlGradeSurface &surface, Known &known, LandXmlNotes &notes)
{
    bool isOther = false;
    for (const LandXmlZone &zone : surface.zones) {
        std::optional<std::size_t> &side = zone.isRight ? known.right : known.left;
        side = side.value_or(surface.byte);
        if (*side != surface.byte) {
            isOther = true;
        } else if (!known.widths.add(zone, notes)) {
            notes.add(surface.byte,
                      Xlate("the alignment has too many zones: the widths of the last ones are not listed"));
            break;
        }
    }
    known.others += isOther ? 1U : 0U;
}

const LandXmlWidths *LandXmlWidthTable::find(const std::string &alignment) const
{
    const auto known = byName_.find(alignment);
    return known != byName_.end() ? &known->second.widths : nullptr;
}

} // namespace kareport
