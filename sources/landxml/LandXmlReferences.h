#pragma once

#include "LandXmlModel.h"
#include "LandXmlNotes.h"
#include "LandXmlPointTable.h"

#include <QString>

#include <string>
#include <vector>

namespace kareport
{

/// Whether coordinates have to be looked up among the points of the file.
bool isReference(const LandXmlCoordinates &at);
/// Whether any coordinates of elements have.
bool hasReferences(const std::vector<LandXmlElement> &elements);

/// Gives coordinates the position, the height and the name of the point that they refer to. They stay without a position where
/// there is no such point. @param notes  receives names that several points have
void resolve(LandXmlCoordinates &at, const LandXmlPointTable &points, LandXmlNotes &notes);
/// The same for all coordinates of elements.
void resolve(std::vector<LandXmlElement> &elements, const LandXmlPointTable &points, LandXmlNotes &notes);

/// Says why a point that is referred to has no position. @param isUnreadable  it is in the file, but its coordinates cannot be read
QString noPosition(const std::string &name, bool isUnreadable);

/// Says that several points have a name that is referred to. @param byte  of the reference
void noteAmbiguous(const std::string &name, std::size_t byte, LandXmlNotes &notes);

} // namespace kareport
