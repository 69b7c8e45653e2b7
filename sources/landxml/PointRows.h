#pragma once

#include "LandXmlRows.h"
#include "Projection.h"

#include <unordered_set>

namespace kareport
{

/// Points, of groups or of surfaces, while the file is read.
class PointRows : public LandXmlRows
{
public:
    explicit PointRows(LandXmlSource source);

    std::vector<LandXmlVariable> variables() const override;
    bool next() override;
    void rewind() override;
    void keep() override
    {
        isKept_ = true;
        kept_.clear();
    }
    void goTo(std::size_t index) override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return point_->at.byte; }

protected:
    /// Takes the point at hand. @return false when something is wrong with it
    virtual bool take();
    /// Reads the file from its start.
    void startReading();

    static const std::size_t ownVariables; ///< how many `PointRows` itself has

    bool isReaderHeard_ = true; ///< what the reader notes has not been said already
    const LandXmlPoint *point_ = nullptr;
    PlanePoint at_;
    double height_ = notGiven;

private:
    struct Variables;

    bool readMore();
    bool isOfSurfaces() const { return source_.query.kind == LandXmlListKind::SurfacePoints; }
    void noteRepeated();

    LandXmlNotes unheard_;
    std::unique_ptr<LandXmlReader> reader_;
    bool isMore_ = true; ///< the reader has not come to the end
    std::size_t index_ = 0;
    std::vector<std::string> owners_; ///< all that any pass has met
    std::vector<bool> isOwnerWanted_;
    bool isKept_ = false;
    std::vector<LandXmlPoint> kept_;
    std::unordered_set<std::size_t> seen_; ///< hashes of names
};

/// Points, projected onto an alignment.
class ProjectedRows : public PointRows
{
public:
    explicit ProjectedRows(LandXmlSource source);

    std::vector<LandXmlVariable> variables() const override;
    bool next() override;
    LandXmlValue value(std::size_t variable) const override;

protected:
    bool take() override;

private:
    struct Variables;

    bool load();

    bool isLoaded_ = false;
    AlignmentModel model_;
    const LandXmlRoute *route_ = nullptr;
    const VerticalProfile *profile_ = nullptr;
    AlignmentFoot foot_{};
    double station_ = notGiven;
    double design_ = notGiven;
    std::string kind_;
};

} // namespace kareport
