// Makes the geometry of alignments.
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
            route_.stationFault = LandXmlFault{turnsTooOften(), stored_.byte};
        }
        for (std::size_t i = 0; i < stored_.elements.size() && !budget.isSpent(); ++i) {
            addElement(i, budget);
        }
        if (route_.stationFault) {
            return std::move(route_);
        }
        if (!stored_.isStartStated) {
            notes_.add(stored_.byte, Xlate("the alignment has no staStart: its stations count from 0"));
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
            route_.stationFault = LandXmlFault{turnsTooOften(), element.byte};
            return;
        }
        piece.length = countedLength(element.length, length);
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

    /// The length that an element counts for. Files state lengths that differ from their points by rounding, or by the scale
    /// of their map, and count their stations by them. One that is off by more is a mistake.
    double countedLength(double stated, double computed) const
    {
        constexpr double mostScale = 0.01;
        const double allowed = std::max(comparison_.tolerance().length, mostScale * computed);
        const bool isFarOff = computed > 0 && std::fabs(stated - computed) > allowed;
        return stated > 0 && !isFarOff ? stated : computed;
    }

    static QString turnsTooOften() { return Xlate("the elements turn too many times"); }

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
            const std::size_t byte = stored_.elements[piece.element].byte;
            const PlaneCurve &before = route_.alignment.elements().back().curve;
            const PlaneCurve &curve = piece.curves.front();
            comparison_.gap(byte, before.end().point, curve.start().point);
            comparison_.corner(byte, before, curve);
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
            const double end = stored_.staStart + route_.length;
            if (route_.isLengthKnown && !route_.pieces.empty() && internal > end + comparison_.tolerance().length) {
                notes_.add(equation.byte,
                           Xlate("the station equation is after the end of the alignment, where no station "
                                 "counts by it"));
            }
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

} // namespace

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
