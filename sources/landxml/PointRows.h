#pragma once

#include "LandXmlRows.h"
#include "SeenHashes.h"

#include <deque>

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
    std::optional<std::size_t> byteOf(std::size_t index) override;

protected:
    /// Takes the current point. @return false when something is wrong with it
    virtual bool take();
    /// Reads the file from its start.
    void startReading();

    static const std::size_t ownVariables; ///< how many `PointRows` itself has

    bool isReaderHeard_ = true; ///< the notes of the reader are new: nothing has read the file before
    const LandXmlPoint *point_ = nullptr;
    std::optional<LandXmlPointTable::Found> referred_; ///< the point that the current one refers to
    PlanePoint at_;
    double height_ = notGiven;

private:
    struct Variables;

    bool readMore();
    bool isOfSurfaces() const { return source_.query.kind == LandXmlListKind::SurfacePoints; }
    std::uint64_t hashOf(const LandXmlPoint &point) const;
    void noteNames();

    LandXmlNotes unheard_;
    std::unique_ptr<LandXmlReader> reader_;
    bool isMore_ = true; ///< the reader has not come to the end
    std::size_t index_ = 0;
    std::vector<std::string> owners_; ///< all that any pass has met
    std::vector<bool> isOwnerWanted_;
    bool isKept_ = false;
    std::vector<LandXmlPoint> kept_;
    std::deque<std::size_t> bytes_;     ///< of the rows, where they are not kept
    SeenHashes seen_;                   ///< of names
    std::vector<std::uint64_t> hashes_; ///< of the names of the points that were read
};

} // namespace kareport
