#pragma once

#include "ModelRows.h"

namespace kareport
{

/// A parcel with the curves of its border.
struct ParcelBorder
{
    const LandXmlParcel *stored = nullptr;
    std::vector<std::pair<std::size_t, PlaneCurve>> courses; ///< and the stored element that each comes from
    std::optional<double> area;      ///< by its geometry; nothing where a side has none, or the border does not close
    std::optional<double> perimeter; ///< nothing where a side has no geometry
};

/// What rows of parcels and of their sides have in common.
class BorderRows : public ModelRows
{
public:
    using ModelRows::ModelRows;

protected:
    /// Reads the parcels that are wanted. @return whether that went well
    bool readParcels();

    std::vector<ParcelBorder> borders_;

private:
    bool resolveReferences(const std::vector<LandXmlParcel *> &parcels);
    ParcelBorder borderOf(const LandXmlParcel &parcel, LandXmlComparison &comparison);
    void measure(ParcelBorder &border, bool isWhole);

    std::vector<LandXmlParcel> parcels_;
    std::size_t budget_ = 100000; ///< pieces of curves that may still be measured
};

class ParcelRows : public BorderRows
{
public:
    using BorderRows::BorderRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return border_->stored->byte; }

protected:
    bool load() override;
    void take(std::size_t index) override { border_ = &borders_[index]; }

private:
    struct Variables;

    const ParcelBorder *border_ = nullptr;
};

} // namespace kareport
