#pragma once

#include "KaReportExport.h"

#include <QString>

/// Replaces the marks of an angle in degrees, minutes and seconds by those that the user has set.
class KAREPORT_EXPORT UFormatAngle
{
public:
    /// Changes `text` in place: every "°" becomes `degreeMark`, every "'" `minuteMark`, every "\"" `secondMark`. The
    /// marks are Latin-1; the character 0 removes the mark. Each character is replaced once, so a degree mark set to
    /// "'" is not taken for a minute mark. A text that is shared stays as it is when memory ends.
    static void ConvertToDMSformatString(char degreeMark, char minuteMark, char secondMark, QString &text);
};
