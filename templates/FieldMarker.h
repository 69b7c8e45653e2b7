#pragma once

#include <QStringView>

namespace kareport
{

/// Variable names that mean something other than a variable.
enum class FieldMarker
{
    None,
    Filler,    ///< "FILLER": blanks of the field's width
    SuffixR,   ///< "SUFFIX_R": the next field gets the suffix "R"
    SuffixPlus ///< "SUFFIX_+": the next field gets the suffix "+"
};
FieldMarker fieldMarker(QStringView variableName);

} // namespace kareport
