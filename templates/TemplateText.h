#pragma once

#include "KaReportExport.h"

#include <QString>
#include <QStringView>

namespace kareport
{

/// Whether two texts are the same without regard to case, character by character (simple Unicode folding: "ß" is not
/// "ss"). Every name of a template is compared so.
KAREPORT_EXPORT bool equalFolded(QStringView left, QStringView right);

/// The text under which names that `equalFolded` takes for the same are found in a hash.
KAREPORT_EXPORT QString foldedKey(QStringView text);

/// The decimal integer at the front of a text, after white space and one sign; 0 when there is none. A number outside
/// 32 bits becomes the nearest that fits.
KAREPORT_EXPORT qint32 leadingInteger(QStringView text);

/// Variable names that stand for something other than a variable.
enum class FieldMarker
{
    None,
    Filler,    ///< "FILLER": blanks of the field's width
    SuffixR,   ///< "SUFFIX_R": the next field gets the suffix "R"
    SuffixPlus ///< "SUFFIX_+": the next field gets the suffix "+"
};
KAREPORT_EXPORT FieldMarker fieldMarker(QStringView variableName);

} // namespace kareport
