#pragma once

#include "ModelRows.h"

namespace kareport
{

/// The points of cross sections.
class SectionRows : public ModelRows
{
public:
    using ModelRows::ModelRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return surface_->byte; }

protected:
    bool load() override;
    void take(std::size_t index) override;

private:
    struct Variables;
    struct Row
    {
        const LandXmlRoute *route;
        const LandXmlSection *section;
        const LandXmlSectionSurface *surface;
        std::size_t point;
    };

    double distanceOf(const LandXmlRoute &route, const LandXmlSection &section) const;
    void noteStation(const LandXmlRoute &route, const LandXmlSection &section);

    AlignmentModel model_;
    std::vector<Row> rows_;
    const LandXmlRoute *route_ = nullptr;
    const LandXmlSection *section_ = nullptr;
    const LandXmlSectionSurface *surface_ = nullptr;
    std::size_t index_ = 0;
    std::optional<CurvePlace> place_; ///< of the section, on the alignment
};

} // namespace kareport
