#pragma once

#include "PlaneCurve.h"

#include <QByteArray>

/// Elements of files that are made of geometry, so that their points fit it.
namespace landxml
{

inline QByteArray number(double value)
{
    return QByteArray::number(value, 'f', 8);
}

inline QByteArray point(const char *tag, kareport::PlanePoint at)
{
    return QByteArray("<") + tag + '>' + number(at.northing) + ' ' + number(at.easting) + "</" + tag + '>';
}

inline kareport::PlaneCurve curve(kareport::TransitionForm form, kareport::PlanePoint start, double bearing,
                                  double length, double startCurvature, double endCurvature)
{
    return std::get<kareport::PlaneCurve>(
        kareport::PlaneCurve::make(form, start, bearing, length, startCurvature, endCurvature));
}

inline QByteArray radius(double curvature)
{
    return curvature == 0 ? QByteArray("INF") : number(std::fabs(1 / curvature));
}

/// A spiral as a file has it. @param attributes  more of them
inline QByteArray spiral(const kareport::PlaneCurve &curve, const QByteArray &form, const QByteArray &attributes = {})
{
    const bool isRight = curve.startCurvature() + curve.endCurvature() > 0;
    return "<Spiral spiType='" + form + "' rot='" + (isRight ? "cw" : "ccw") + "' length='" + number(curve.length()) +
           "' radiusStart='" + radius(curve.startCurvature()) + "' radiusEnd='" + radius(curve.endCurvature()) + "' " +
           attributes + ">" + point("Start", curve.start().point) + point("End", curve.end().point) + "</Spiral>";
}

/// 100 m north, a quarter circle of 100 m to the right, 50 m east: from (1000, 500) to (1200, 650).
inline QByteArray bend()
{
    return "<Line length='100'><Start name='A'>1000 500</Start><End>1100 500</End></Line>\n"
           "<Curve rot='cw' radius='100'><Start name='B'>1100 500</Start><Center>1100 600</Center><End>1200 600</End></Curve>\n"
           "<Line><Start name='C'>1200 600</Start><End name='D'>1200 650</End></Line>";
}

/// An alignment of some elements.
inline QByteArray alignment(const QByteArray &elements, const QByteArray &attributes = "name='road' staStart='0'",
                            const QByteArray &before = {}, const QByteArray &after = {})
{
    return "<Alignments><Alignment " + attributes + ">" + before + "<CoordGeom>\n" + elements + "</CoordGeom>" + after +
           "</Alignment></Alignments>";
}

} // namespace landxml
