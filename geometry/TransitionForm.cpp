#include "TransitionForm.h"

#include "SmallAngles.h"

#include <numbers>

namespace kareport
{

namespace
{

constexpr double pi = std::numbers::pi;

} // namespace

bool isOverTangent(TransitionForm form)
{
    return form == TransitionForm::CubicParabola || form == TransitionForm::SineHalfWave;
}

double transitionGrowth(TransitionForm form, double t)
{
    switch (form) {
    case TransitionForm::Clothoid:
    case TransitionForm::CubicParabola: return t;
    case TransitionForm::Bloss: return t * t * (3 - 2 * t);
    case TransitionForm::Biquadratic: return t <= 0.5 ? 2 * t * t : 1 - 2 * (1 - t) * (1 - t);
    case TransitionForm::Cosine:
    case TransitionForm::SineHalfWave: return oneMinusCosine(pi * t) / 2;
    case TransitionForm::Sinusoid: return withoutSine(2 * pi * t) / (2 * pi);
    }
    return t;
}

double transitionTurn(TransitionForm form, double t)
{
    switch (form) {
    case TransitionForm::Clothoid:
    case TransitionForm::CubicParabola: return t * t / 2;
    case TransitionForm::Bloss: return t * t * t * (1 - t / 2);
    case TransitionForm::Biquadratic:
        return t <= 0.5 ? 2 * t * t * t / 3 : t - 0.5 + 2 * (1 - t) * (1 - t) * (1 - t) / 3;
    case TransitionForm::Cosine:
    case TransitionForm::SineHalfWave: return withoutSine(pi * t) / (2 * pi);
    case TransitionForm::Sinusoid: return squareWithoutCosine(2 * pi * t) / (4 * pi * pi);
    }
    return 0;
}

double transitionOrdinate(TransitionForm form, double t)
{
    return form == TransitionForm::SineHalfWave ? squareWithoutCosine(pi * t) / (2 * pi * pi) : t * t * t / 6;
}

} // namespace kareport
