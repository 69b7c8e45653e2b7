#include "LandXmlRoute.h"

#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// Makes the geometry of one alignment.
class RouteMaker
{
public:
    RouteMaker(const LandXmlAlignment &stored, const LandXmlGeometry &geometry, LandXmlNotes &notes)
        : stored_(stored), geometry_(geometry), notes_(notes)
    {
        route_.stored = &stored;
        route_.stationing = Stationing(stored.staStart);
    }

    /// @param budget  pieces of curves that may still be made
    LandXmlRoute make(std::size_t &budget)
    {
        for (std::size_t i = 0; i < stored_.elements.size(); ++i) {
            addElement(i, budget);
        }
        if (route_.isLengthKnown) {
            geometry_.compareLength(stored_.byte, "length", stored_.length, route_.length);
        }
        addEquations();
        for (const LandXmlGradeLine &line : stored_.gradeLines) {
            route_.profiles.push_back(geometry_.profileOf(line));
            if (const auto *fault = std::get_if<LandXmlFault>(&route_.profiles.back())) {
                notes_.add(fault->byte, fault->text);
            }
        }
        return std::move(route_);
    }

    /// Whether its places have names; otherwise the fault says why not.
    bool hasStations() const { return hasStations_; }

private:
    void addElement(std::size_t index, std::size_t &budget)
    {
        if (budget == 0) {
            return;
        }
        const LandXmlElement &element = stored_.elements[index];
        LandXmlRoute::Piece piece{index, route_.length, 0, {}};
        LandXmlCurves made = geometry_.curvesOf(element);
        double length = 0;
        if (auto *curves = std::get_if<std::vector<PlaneCurve>>(&made)) {
            for (const PlaneCurve &curve : *curves) {
                length += curve.length();
                takeBudget(curve.pieces(), element, budget);
            }
            piece.curves = std::move(*curves);
        }
        piece.length = element.length > 0 && std::isfinite(element.length) ? element.length : length;
        if (!(piece.length > 0) && isNowhere(element)) {
            notes_.add(element.byte, Xlate("the element has no length and is passed over"));
            return;
        }
        if (const auto *fault = std::get_if<LandXmlFault>(&made)) {
            notes_.add(fault->byte, fault->text);
            route_.fault = route_.fault ? route_.fault : *fault;
        }
        piece.isPlaced = route_.isLengthKnown;
        if (piece.isPlaced) {
            geometry_.compareLength(element.byte, "staStart", element.staStart, stored_.staStart + route_.length);
        }
        route_.isLengthKnown = route_.isLengthKnown && piece.length > 0;
        addCurves(piece, length);
        route_.length += piece.length;
        route_.pieces.push_back(std::move(piece));
    }

    /// A small file can hold curves that would take minutes to make.
    void takeBudget(std::size_t pieces, const LandXmlElement &element, std::size_t &budget)
    {
        if (pieces > budget && !route_.fault) {
            route_.fault = LandXmlFault{Xlate("the elements wind round too often"), element.byte};
        }
        budget -= std::min(pieces, budget);
    }

    bool isNowhere(const LandXmlElement &element) const
    {
        if (!element.start.isGiven() || !element.end.isGiven()) {
            return false;
        }
        const auto start = geometry_.positionOf(element.start);
        const auto end = geometry_.positionOf(element.end);
        const auto *from = std::get_if<PlanePoint>(&start);
        const auto *to = std::get_if<PlanePoint>(&end);
        return from != nullptr && to != nullptr && distanceBetween(*from, *to) == 0;
    }

    void addCurves(const LandXmlRoute::Piece &piece, double length)
    {
        if (route_.fault) {
            return;
        }
        if (!route_.alignment.elements().empty()) {
            const PlanePoint before = route_.alignment.elements().back().curve.end().point;
            const double gap = distanceBetween(before, piece.curves.front().start().point);
            geometry_.compareLength(stored_.elements[piece.element].byte, "Start", gap, 0);
        }
        for (const PlaneCurve &curve : piece.curves) {
            route_.alignment.add(curve, curve.length() * (piece.length / length));
        }
    }

    void addEquations()
    {
        double before = stored_.staStart; // where the last equation was, and the station ahead of it
        double ahead = stored_.staStart;
        double direction = 1;
        for (const LandXmlEquation &equation : stored_.equations) {
            double internal = equation.internal;
            if (std::isnan(internal)) {
                internal = before + (equation.back - ahead) * direction;
            }
            if (!route_.stationing.add({internal, equation.ahead, equation.isDecreasing})) {
                route_.fault = LandXmlFault{Xlate("the station equation is not ahead of the start and of the equations "
                                                  "before it, or has no numbers: staInternal or staBack, and staAhead "
                                                  "were expected"),
                                            equation.byte};
                hasStations_ = false;
                return;
            }
            geometry_.compareLength(equation.byte, "staBack", equation.back,
                                    route_.stationing.nameOf(internal, true).station);
            before = internal;
            ahead = equation.ahead;
            direction = equation.isDecreasing ? -1 : 1;
        }
    }

    const LandXmlAlignment &stored_;
    const LandXmlGeometry &geometry_;
    LandXmlNotes &notes_;
    LandXmlRoute route_;
    bool hasStations_ = true;
};

template <typename Line>
std::size_t indexOf(const std::vector<Line> &lines, const std::string &name)
{
    const auto found =
        std::find_if(lines.begin(), lines.end(), [&](const Line &line) { return name.empty() || line.name == name; });
    return static_cast<std::size_t>(found - lines.begin());
}

} // namespace

const VerticalProfile *LandXmlRoute::profile(const std::string &name) const
{
    const std::size_t index = indexOf(stored->gradeLines, name);
    const auto *profile = index < profiles.size() ? std::get_if<LandXmlProfile>(&profiles[index]) : nullptr;
    return profile != nullptr ? &profile->heights : nullptr;
}

const LandXmlHeightLine *LandXmlRoute::surface(const std::string &name) const
{
    const std::size_t index = indexOf(stored->surfaceLines, name);
    return index < stored->surfaceLines.size() ? &stored->surfaceLines[index] : nullptr;
}

std::optional<double> heightOn(const LandXmlHeightLine &line, double station)
{
    const auto &points = line.points;
    constexpr double rounding = 1e-4; // of the stations of such lists
    const auto next = std::lower_bound(points.begin(), points.end(), station,
                                       [](const auto &point, double at) { return point.first < at; });
    if (next == points.end()) {
        const bool isAtEnd = !points.empty() && station <= points.back().first + rounding;
        return isAtEnd ? std::optional(points.back().second) : std::nullopt;
    }
    if (next == points.begin()) {
        return station >= next->first - rounding ? std::optional(next->second) : std::nullopt;
    }
    const auto &[from, height] = *(next - 1);
    return height + (next->second - height) * ((station - from) / (next->first - from));
}

std::variant<std::vector<LandXmlRoute>, LandXmlFault> routesOf(const std::vector<LandXmlAlignment> &alignments,
                                                               const LandXmlGeometry &geometry, LandXmlNotes &notes)
{
    std::vector<LandXmlRoute> routes;
    std::size_t elements = 0;
    for (const LandXmlAlignment &alignment : alignments) {
        elements += alignment.elements.size();
    }
    std::size_t budget = 500000 + 16 * elements;
    for (const LandXmlAlignment &alignment : alignments) {
        RouteMaker maker(alignment, geometry, notes);
        routes.push_back(maker.make(budget));
        const auto &fault = routes.back().fault;
        if (fault && (!maker.hasStations() || budget == 0)) {
            return *fault;
        }
    }
    return routes;
}

} // namespace kareport
