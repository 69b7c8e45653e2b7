#pragma once

#include "ParcelRows.h"

namespace kareport
{

/// The sides of parcels in order, as a deed walks round them.
class CourseRows : public BorderRows
{
public:
    using BorderRows::BorderRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override;

protected:
    bool load() override;
    void take(std::size_t index) override;

private:
    struct Variables;

    std::vector<std::pair<std::size_t, std::size_t>> rows_; ///< border and course
    const ParcelBorder *border_ = nullptr;
    std::size_t index_ = 0;
    const PlaneCurve *curve_ = nullptr;
};

} // namespace kareport
