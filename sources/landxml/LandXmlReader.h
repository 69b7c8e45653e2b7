#pragma once

#include "LandXmlModel.h"
#include "LandXmlNotes.h"
#include "LandXmlUnits.h"
#include "XmlStream.h"

#include <functional>
#include <string>
#include <vector>

namespace kareport
{

/// What is wanted of a file. Anything else takes no memory, and hardly any time.
struct LandXmlWants
{
    bool points = false;
    bool surfacePoints = false;
    bool alignments = false; ///< with their elements, equations and grade lines
    bool surfaceLines = false;
    bool sections = false;
    bool parcels = false;
    bool gradeSurfaces = false; ///< the widths beside alignments

    /// The alignment, the parcel, and the group or surface of points that are asked for by their names; all where a name is
    /// empty. A number that cannot be read in another one is noted, and is not an error.
    std::string alignment;
    std::string parcel;
    std::string owner;
    /// Whether such a number is noted wherever it is, since names and numbers of elements alone are wanted.
    bool isTolerant = false;
    /// Whether points are looked up by their names: one whose coordinates cannot be read is there, without a position.
    bool isForReferences = false;
};

/// Reads a LandXML file in one pass. Alignments and parcels are kept; points are kept until they are taken, so that a file
/// of many takes no memory.
class LandXmlReader : private XmlHandler
{
public:
    /// @param notes  receives what is odd; must live as long as the reader
    LandXmlReader(std::shared_ptr<const FileBytes> file, const LandXmlUnits &units, const LandXmlWants &wants,
                  LandXmlNotes &notes);

    /// Reads the next piece of the file. @return false at the end and when something is wrong
    bool readSome() { return stream_.readSome(); }
    const std::optional<InputError> &error() const { return stream_.error(); }
    std::size_t position() const { return stream_.position(); }

    /// The number of points that were read since they were dropped, and each of them in the order of the file.
    std::size_t pointCount() const { return pointCount_; }
    const LandXmlPoint &point(std::size_t index) const { return points_[index]; }
    void dropPoints();
    /// The names of groups and surfaces, by the points' owners.
    const std::vector<std::string> &owners() const { return owners_; }
    bool isSurface(std::size_t owner) const { return isSurface_[owner]; }

    std::vector<LandXmlAlignment> alignments;
    std::vector<LandXmlParcel> parcels;
    std::vector<LandXmlGradeSurface> gradeSurfaces;

private:
    enum class Tag : unsigned char;
    struct Open
    {
        Tag tag;
        bool isRead; ///< its text is taken at its end
    };

    Interest startElement(std::string_view name, const XmlAttributes &attributes) override;
    void endElement() override;
    void text(std::string_view piece) override;
    void foreignElement(std::string_view name) override;
    void leftOutElements(std::string_view name, std::size_t count) override { notes_.leaveOut(name, count); }

    static Tag tagOf(Tag parent, std::string_view name);
    static bool isHeader(std::string_view name);
    Interest leaveOut(std::string_view name);
    Interest begin(Tag tag, const XmlAttributes &attributes);
    Interest beginInAlignment(Tag tag, const XmlAttributes &attributes);
    Interest beginInProfile(Tag tag, const XmlAttributes &attributes);
    Interest beginInSections(Tag tag, const XmlAttributes &attributes);
    bool isListRead() const;
    void beginElement(Tag tag, const XmlAttributes &attributes);
    void beginOther(std::string_view name);
    bool isGeometryWanted() const { return parcelDepth_ > 0 ? wants_.parcels : wants_.alignments; }
    void beginPoint(Tag tag, const XmlAttributes &attributes);
    void beginEquation(const XmlAttributes &attributes);
    void beginGradePoint(Tag tag, const XmlAttributes &attributes);
    void beginSection(const XmlAttributes &attributes);
    void beginSectionSurface(Tag tag, const XmlAttributes &attributes);
    void beginAlignment(const XmlAttributes &attributes);
    void beginParcel(const XmlAttributes &attributes);
    void beginInGradeModel(Tag tag, const XmlAttributes &attributes);
    void beginZone(const XmlAttributes &attributes);
    LandXmlWidth widthOf(const XmlAttributes &attributes);
    void end(Tag tag);
    void addPoint();
    void endPointList(Tag tag);
    LandXmlCoordinates &coordinatesOf(Tag tag);
    LandXmlElement &element();

    bool isNeeded() const;
    void failNumber(std::size_t byte, const QString &text);
    double length(const XmlAttributes &attributes, const char *name);
    double radius(const XmlAttributes &attributes, const char *name);
    double area(const XmlAttributes &attributes, const char *name);
    double angle(const XmlAttributes &attributes, const char *name, LandXmlAngle form);
    void startCoordinates(LandXmlCoordinates &at, const XmlAttributes &attributes);
    void weigh(std::size_t bytes);
    bool takeCoordinates(LandXmlCoordinates &at);
    bool takeNumbers();
    void takePair(double &first, double &second);
    static std::string textOf(const XmlAttributes &attributes, const char *name);
    /// A text of the file for a message, cut short.
    static QString quoteOf(std::string_view text);

    std::size_t mostWeight_; ///< of what is kept
    std::size_t weight_ = 0;
    XmlStream stream_;
    LandXmlUnits units_;
    LandXmlWants wants_;
    LandXmlNotes &notes_;
    std::vector<Open> open_;
    std::string text_;
    std::size_t textByte_ = 0;
    std::vector<double> numbers_;
    /// One more than there are, which is read: the file's next piece may be needed for its end. More than that are there for
    /// the memory of their texts.
    std::vector<LandXmlPoint> points_{1};
    std::size_t pointCount_ = 0;
    std::vector<std::string> owners_;
    std::vector<bool> isSurface_;         ///< of the owners
    std::vector<std::size_t> openOwners_; ///< their indexes, the innermost last
    bool isInGradeModel_ = false;         ///< its widths are listed as they are: a wrong one is not an error
    bool isZoneRight_ = false;            ///< the zones that are open
    bool isInAlignment_ = false;          ///< one that is wanted is open
    bool isInPoint_ = false;              ///< one that is wanted is open
    int parcelDepth_ = 0;                 ///< parcels that are open
    std::vector<std::size_t> parcelPath_; ///< their indexes, the innermost last, where they are wanted
};

} // namespace kareport
