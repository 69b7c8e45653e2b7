#pragma once

#include "LineEndings.h"

#include <QString>

namespace kareport
{

/// What one edit has replaced in the text of a view. A line end counts as one character here; in the document it is two,
/// CR LF.
struct ReportChange
{
    int position = 0;
    int removed = 0;
    QString inserted;        ///< its lines end with LF
    int lineEndsBefore = 0;  ///< before the position
    int lineEndsRemoved = 0; ///< among what was removed
    int lengthBefore = 0;    ///< characters of the whole text before the edit
    int lineEndsInAll = 0;   ///< line ends of the whole text before the edit

    qint64 documentPosition() const { return qint64(position) + lineEndsBefore; }
    qint64 documentRemoved() const { return qint64(removed) + lineEndsRemoved; }
    qint64 documentLengthBefore() const { return qint64(lengthBefore) + lineEndsInAll; }
    QString documentInserted() const { return withCrLf(inserted); }
};

} // namespace kareport
