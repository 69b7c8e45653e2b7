#pragma once

#include "ModelRows.h"

namespace kareport
{

/// The points of grade lines, with the grades and the vertical curve at each.
class ProfileRows : public ModelRows
{
public:
    using ModelRows::ModelRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return point_->byte; }

protected:
    bool load() override;
    void take(std::size_t index) override;

private:
    struct Variables;
    struct Row
    {
        const LandXmlRoute *route;
        std::size_t line;
        std::size_t point;
    };

    void addGradeLines(const LandXmlRoute &route);
    double stationOf(double internal) const;
    std::optional<double> heightAt(double internal) const;

    AlignmentModel model_;
    std::vector<Row> rows_;
    Row row_{};
    const LandXmlGradePoint *point_ = nullptr;
    const VerticalProfile *profile_ = nullptr; ///< null where the grade line has no heights
    const VerticalProfile::Vertex *vertex_ = nullptr;
    std::optional<ProfileExtreme> extreme_; ///< in the curve, or at the break
    std::string extremeText_;
};

} // namespace kareport
