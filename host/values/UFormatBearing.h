#pragma once

#include "KaReportExport.h"

#include <QString>

/// Shows a bearing (a direction in radians, clockwise from north) as a whole-circle or a quadrant bearing.
class KAREPORT_EXPORT UFormatBearing
{
public:
    /// @param unit       0 degrees, minutes and seconds; 1 decimal degrees; 2 gon
    /// @param style      0 whole circle, 1 quadrant
    /// @param decimals   decimals of the smallest unit shown, 0 to 9
    /// @param padding    1 pads the whole degrees or gon with zeros
    /// @param reference  0 counts from north, 1 from south
    UFormatBearing(unsigned unit, qint16 style, qint32 decimals, qint16 padding, unsigned reference)
        : unit_(unit), style_(style), decimals_(decimals), padding_(padding), reference_(reference)
    {}

    /// Replaces `text` by the bearing; a value that is not finite gives "", and so does the end of memory. A text that has
    /// reserved enough needs none.
    void ConvertToDisplayString(double value, QString &text) const;

private:
    void appendCount(QString &text, qint64 count, qint64 quarter) const;
    void appendAngle(QString &text, qint64 count) const;
    void appendWhole(QString &text, qint64 whole) const;
    void appendDecimals(QString &text, qint64 fraction) const;

    unsigned unit_;
    qint16 style_;
    qint32 decimals_;
    qint16 padding_;
    unsigned reference_;
};
