#pragma once

#include "ModelRows.h"

namespace kareport
{

/// The horizontal elements of alignments as they are stored, and what their geometry gives where nothing is stored.
class ElementRows : public ModelRows
{
public:
    using ModelRows::ModelRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return element_->byte; }

protected:
    bool load() override;
    void take(std::size_t index) override;

private:
    struct Variables;

    std::optional<PlanePoint> intersectionOf(const LandXmlRoute::Piece &piece) const;
    void noteIntersection(const LandXmlRoute &route, const LandXmlRoute::Piece &piece);

    AlignmentModel model_;
    std::vector<std::pair<const LandXmlRoute *, std::size_t>> rows_; ///< and the piece
    const LandXmlRoute *route_ = nullptr;
    const LandXmlRoute::Piece *piece_ = nullptr;
    const LandXmlElement *element_ = nullptr;
    std::optional<CurvePlace> start_; ///< nothing where the element has no geometry
    std::optional<CurvePlace> end_;
    std::optional<PlanePoint> startPoint_; ///< as stored
    std::optional<PlanePoint> endPoint_;
    std::optional<PlanePoint> intersection_; ///< as stored; by the geometry where the file states none
    std::optional<PlanePoint> centre_;
};

} // namespace kareport
