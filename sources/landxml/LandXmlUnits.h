#pragma once

#include "XmlStream.h"

#include <QString>

#include <memory>
#include <string_view>

namespace kareport
{

/// How a file writes angles.
enum class LandXmlAngle
{
    Radians,
    Grads,
    Degrees,
    DegreesMinutesSeconds ///< 45.3015 is 45°30'15"
};

/// The units of a file.
struct LandXmlUnits
{
    double metres = 1;       ///< in a unit of length
    double squareMetres = 1; ///< in a unit of area
    LandXmlAngle angle = LandXmlAngle::Radians;
    LandXmlAngle direction = LandXmlAngle::Radians;
};

/// What is before the data of a file.
struct LandXmlHeader
{
    QString version; ///< empty where the file states none
    LandXmlUnits units;
    std::size_t unitsByte = 0;  ///< their place
    QString otherElevationUnit; ///< that the file states; empty where it is that of its lengths
};

/// Reads a file up to its units. A file without them, or with a unit that is not known, is wrong: its numbers would have no
/// meaning.
Expected<LandXmlHeader> readLandXmlHeader(const std::shared_ptr<const FileBytes> &file);

/// An angle of a file, in radians. @return whether the text is one
bool parseLandXmlAngle(std::string_view text, LandXmlAngle form, double &radians);
/// An angle as a file writes it, for messages: to a tenth of the tolerance that directions have.
QString landXmlAngleText(double radians, LandXmlAngle form);

} // namespace kareport
