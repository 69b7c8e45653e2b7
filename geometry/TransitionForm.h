#pragma once

namespace kareport
{

/// How the curvature of a transition curve grows from its start to its end.
///
/// Of the first group, the curvature is a function of the length along the curve, and the curve may lead from any radius
/// to any other. The second group is drawn over its tangent: there the second derivative of the ordinate is a function of
/// the abscissa, the radius is part of that derivative, and one end is straight.
enum class TransitionForm
{
    Clothoid,    ///< in proportion to the length
    Bloss,       ///< 3 t² - 2 t³, t the part of the length
    Biquadratic, ///< two parabolas: 2 t², from the middle on 1 - 2 (1 - t)²
    Cosine,      ///< (1 - cos πt) / 2
    Sinusoid,    ///< t - sin(2πt) / 2π

    CubicParabola, ///< t, over the tangent: y = x³ / 6RX, X the abscissa of the end
    SineHalfWave   ///< (1 - cos πt) / 2, over the tangent
};

/// Whether a form is drawn over its tangent.
bool isOverTangent(TransitionForm form);

/// The part of the change of curvature that has come about at the part `t` of a transition, both from 0 to 1.
double transitionGrowth(TransitionForm form, double t);
/// The integral of `transitionGrowth` from 0 to `t`.
double transitionTurn(TransitionForm form, double t);
/// The integral of `transitionTurn` from 0 to `t`, of a form over its tangent.
double transitionOrdinate(TransitionForm form, double t);

} // namespace kareport
