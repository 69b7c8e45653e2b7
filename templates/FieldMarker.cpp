#include "FieldMarker.h"

#include "TextFolding.h"

namespace kareport
{

FieldMarker fieldMarker(QStringView variableName)
{
    if (equalFolded(variableName, u"FILLER")) {
        return FieldMarker::Filler;
    }
    if (equalFolded(variableName, u"SUFFIX_R")) {
        return FieldMarker::SuffixR;
    }
    if (equalFolded(variableName, u"SUFFIX_+")) {
        return FieldMarker::SuffixPlus;
    }
    return FieldMarker::None;
}

} // namespace kareport
