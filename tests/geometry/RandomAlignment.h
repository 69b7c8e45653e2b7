#pragma once

#include "Alignment.h"
#include "RandomSequence.h"

#include <numbers>

/// An alignment of random elements that go on smoothly where the one before ended: lines, arcs and all transition forms,
/// to the left and to the right.
inline kareport::Alignment randomAlignment(RandomNumbers &random, int count, double scale)
{
    using namespace kareport;
    constexpr TransitionForm forms[] = {
        TransitionForm::Clothoid, TransitionForm::Bloss,         TransitionForm::Biquadratic, TransitionForm::Cosine,
        TransitionForm::Sinusoid, TransitionForm::CubicParabola, TransitionForm::SineHalfWave};
    Alignment alignment;
    CurvePlace at{
        {5500000 + random.below(1000) * 0.123, 3400000 + random.below(1000) * 0.123}, random.below(6283) * 0.001, 0};
    while (alignment.elements().size() < static_cast<std::size_t>(count)) {
        const TransitionForm form = forms[random.below(7)];
        const double length = scale * (5 + random.below(1000) * 0.1);
        const auto curvature = [&] { return (random.below(2) != 0 ? 1 : -1) / (scale * (40 + random.below(1000))); };
        double first = random.below(3) == 0 ? 0 : curvature();
        double last = random.below(3) == 0 ? first : curvature();
        if (isOverTangent(form) && first != last) {
            (random.below(2) != 0 ? first : last) = 0;
        }
        const auto made = PlaneCurve::make(form, at.point, at.bearing, length, first, last);
        if (const auto *curve = std::get_if<PlaneCurve>(&made)) {
            alignment.add(*curve);
            at = curve->end();
        }
    }
    return alignment;
}
