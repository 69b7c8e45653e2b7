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
    /// An alignment, with the names that lists of it can be asked for, each once.
    struct Alignment
    {
        QString name;
        std::size_t elements = 0;
        std::size_t sections = 0;
        std::vector<LandXmlNamed> gradeLines;
        std::vector<LandXmlNamed> surfacesAlong;
        std::vector<LandXmlNamed> surfacesAcross; ///< of the cross sections
    };

    QString version;
    std::vector<LandXmlNamed> groups;
    std::vector<LandXmlNamed> surfaces;
    std::vector<Alignment> alignments;
    std::vector<LandXmlNamed> parcels;
};

/// Whether a file is a LandXML file by its outermost element.
bool isLandXml(const std::shared_ptr<const FileBytes> &file);

/// Reads what a file holds.
/// @param progress  is called with the number of bytes that have been read; false ends the reading, with what was read until then
Expected<LandXmlContents> readLandXmlContents(const std::shared_ptr<const FileBytes> &file,
                                              const ReadProgress &progress);

} // namespace kareport
