#include "LandXmlRoute.h"

#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

/// Counts the pieces of the curves of a file. A small file can hold curves that would take minutes to make.
class PieceBudget
{
public:
    explicit PieceBudget(std::size_t elements) : left_(500000 + 16 * elements) {}

    bool isSpent() const { return isSpent_; }
    void take(std::size_t pieces)
    {
        isSpent_ = isSpent_ || pieces > left_;
        left_ -= std::min(pieces, left_);
    }

private:
    std::size_t left_;
    bool isSpent_ = false;
};

/// Makes the geometry of one alignment.
class RouteMaker
{
public:
    RouteMaker(const LandXmlAlignment &stored, LandXmlComparison &comparison, LandXmlNotes &notes)
        : stored_(stored), comparison_(comparison), notes_(notes)
    {
        route_.stored = &stored;
        route_.stationing = Stationing(stored.staStart);
    }

    LandXmlRoute make(PieceBudget &budget)
    {
        if (budget.isSpent()) {
            route_.stationFault = LandXmlFault{windsTooOften(), stored_.byte};
        }
        for (std::size_t i = 0; i < stored_.elements.size() && !budget.isSpent(); ++i) {
            addElement(i, budget);
        }
        if (route_.stationFault) {
            return std::move(route_);
        }
        if (route_.isLengthKnown) {
            comparison_.length(stored_.byte, "length", stored_.length, route_.length);
        }
        addEquations();
        for (const LandXmlGradeLine &line : stored_.gradeLines) {
            route_.profiles.push_back(profileOf(line));
            if (const auto *fault = std::get_if<LandXmlFault>(&route_.profiles.back())) {
                notes_.add(fault->byte, fault->text);
            }
        }
        for (const LandXmlHeightLine &line : stored_.surfaceLines) {
            route_.isSurfaceSound.push_back(checkSurface(line));
        }
        return std::move(route_);
    }

private:
    void addElement(std::size_t index, PieceBudget &budget)
    {
        const LandXmlElement &element = stored_.elements[index];
        LandXmlRoute::Piece piece{index, route_.length, 0, {}};
        const bool isPoint = endsWhereItStarts(element);
        // One of a fraction of a millimetre has no direction.
        const bool isTooShort = isPoint && element.length <= comparison_.tolerance().length;
        LandXmlCurves made = isTooShort ? LandXmlCurves() : curvesOf(element, comparison_);
        double length = 0;
        if (auto *curves = std::get_if<std::vector<PlaneCurve>>(&made)) {
            for (const PlaneCurve &curve : *curves) {
                length += curve.length();
                budget.take(curve.pieces());
            }
            piece.curves = std::move(*curves);
        }
        if (budget.isSpent()) {
            route_.stationFault = LandXmlFault{windsTooOften(), element.byte};
            return;
        }
        piece.length = element.length > 0 ? element.length : length;
        if (isTooShort || (isPoint && piece.length == 0)) {
            notes_.add(element.byte, Xlate("the element has no length and was left out"));
            return;
        }
        if (const auto *fault = std::get_if<LandXmlFault>(&made)) {
            notes_.add(fault->byte, fault->text);
            route_.fault = route_.fault ? route_.fault : *fault;
        }
        piece.isPlaced = route_.isLengthKnown;
        if (piece.isPlaced) {
            comparison_.length(element.byte, "staStart", element.staStart, stored_.staStart + route_.length);
        }
        route_.isLengthKnown = route_.isLengthKnown && piece.length > 0;
        addCurves(piece, length);
        route_.length += piece.length;
        route_.pieces.push_back(std::move(piece));
    }

    static QString windsTooOften() { return Xlate("the elements turn too many times"); }

    static bool endsWhereItStarts(const LandXmlElement &element)
    {
        const auto &start = element.start.position;
        const auto &end = element.end.position;
        return start && end && distanceBetween(*start, *end) == 0;
    }

    void addCurves(const LandXmlRoute::Piece &piece, double length)
    {
        if (route_.fault) {
            return;
        }
        if (!route_.alignment.elements().empty()) {
            const PlanePoint before = route_.alignment.elements().back().curve.end().point;
            comparison_.gap(stored_.elements[piece.element].byte,
                            distanceBetween(before, piece.curves.front().start().point));
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
                route_.stationFault = LandXmlFault{
                    Xlate("the station equation is before the start or not ahead of the equation before it, "
                          "or has no numbers: staInternal or staBack, and staAhead were expected"),
                    equation.byte};
                return;
            }
            comparison_.length(equation.byte, "staBack", equation.back,
                               route_.stationing.nameOf(internal, true).station);
            before = internal;
            ahead = equation.ahead;
            direction = equation.isDecreasing ? -1 : 1;
        }
    }

    bool checkSurface(const LandXmlHeightLine &line)
    {
        const bool isSound =
            std::is_sorted(line.points.begin(), line.points.end(),
                           [](const auto &left, const auto &right) { return left.first < right.first; });
        if (!isSound) {
            notes_.add(line.byte,
                       Xlate("the stations of the surface \"%1\" do not ascend: no heights are taken from it")
                           .arg(QString::fromStdString(line.name)));
        }
        return isSound;
    }

    const LandXmlAlignment &stored_;
    LandXmlComparison &comparison_;
    LandXmlNotes &notes_;
    LandXmlRoute route_;
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
    return index < isSurfaceSound.size() && isSurfaceSound[index] ? &stored->surfaceLines[index] : nullptr;
}

std::optional<double> heightOn(const LandXmlHeightLine &line, double station)
{
    const auto &points = line.points;
    constexpr double rounding = 1e-4; // of the stations of such lists
    const auto next = std::lower_bound(points.begin(), points.end(), station,
                                       [](const auto &point, double at) { return point.first < at; });
    const auto index = static_cast<std::size_t>(next - points.begin());
    const bool isFirst = std::binary_search(line.pieces.begin(), line.pieces.end(), index);
    if (next != points.begin() && next != points.end() && !isFirst) {
        const auto &[from, height] = *(next - 1);
        return height + (next->second - height) * ((station - from) / (next->first - from));
    }
    if (next != points.end() && next->first - station <= rounding) {
        return next->second;
    }
    if (next != points.begin() && station - (next - 1)->first <= rounding) {
        return (next - 1)->second;
    }
    return std::nullopt;
}

std::vector<LandXmlRoute> routesOf(const std::vector<const LandXmlAlignment *> &alignments,
                                   LandXmlComparison &comparison, LandXmlNotes &notes)
{
    std::size_t elements = 0;
    for (const LandXmlAlignment *alignment : alignments) {
        elements += alignment->elements.size();
    }
    PieceBudget budget(elements);
    std::vector<LandXmlRoute> routes;
    for (const LandXmlAlignment *alignment : alignments) {
        routes.push_back(RouteMaker(*alignment, comparison, notes).make(budget));
    }
    comparison.noteDirections();
    return routes;
}

} // namespace kareport
