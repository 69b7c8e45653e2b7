#pragma once

#include "InputError.h"
#include "LandXmlRows.h"

#include <QString>

#include <memory>
#include <vector>

namespace kareport
{

/// Something of a file that a list can be asked for by its name.
struct LandXmlNamed
{
    QString name;          ///< may be empty, or the same as another one's
    std::size_t count = 0; ///< of what is in it: points, elements, points of a grade line, sides
};

/// The names in a file, for a user who chooses among them.
struct LandXmlContents
{
    QString version;
    std::vector<LandXmlNamed> groups;
    std::vector<LandXmlNamed> surfaces;
    std::vector<LandXmlNamed> alignments;
    std::vector<LandXmlNamed> gradeLines;
    std::vector<LandXmlNamed> surfaceLines; ///< surfaces along and across alignments, each name once
    std::vector<LandXmlNamed> parcels;
    std::size_t sections = 0; ///< cross sections of all alignments
};

/// Whether a file is a LandXML file by its outermost element.
bool isLandXml(const std::shared_ptr<const FileBytes> &file);

/// Reads what a file holds.
/// @param progress  is called with the number of bytes that have been read; false ends the reading, with what was read until then
Expected<LandXmlContents> readLandXmlContents(const std::shared_ptr<const FileBytes> &file,
                                              const ReadProgress &progress);

} // namespace kareport
