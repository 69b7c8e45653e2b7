#pragma once

#include "ModelRows.h"

namespace kareport
{

/// Places along alignments, and points beside them.
class StationRows : public ModelRows
{
public:
    using ModelRows::ModelRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return route_->stored->byte; }

protected:
    bool load() override;
    void take(std::size_t index) override;

private:
    static constexpr std::size_t most = 5000000; ///< rows: an interval that gives more is a mistake

    struct Variables;
    struct Row
    {
        std::size_t route;
        double distance;
    };
    /// What all rows of an alignment have in common.
    struct Lines
    {
        const VerticalProfile *profile;
        const LandXmlHeightLine *surface;
        const LandXmlWidths *widths;
    };

    void lookAtNames(const LandXmlAlignment &alignment);
    bool isDesignAsked() const;
    bool addRoute(std::size_t index);
    void noteOffsetsPastCentres(const LandXmlRoute &route);
    const LandXmlRoute::Piece *borderAt(double distance, bool &isEnd) const;
    double widthAt(double internal, bool isRight) const;
    LandXmlValue offsetValue(std::size_t offset, std::size_t variable) const;

    AlignmentModel model_;
    std::vector<Lines> lines_; ///< one for each route
    std::vector<Row> rows_;
    std::size_t rowRoute_ = 0; ///< of the current row
    const LandXmlRoute *route_ = nullptr;
    double distance_ = 0;
    std::optional<CurvePlace> place_;
    double sine_ = 0; ///< of the bearing
    double cosine_ = 1;
    std::optional<double> design_;
    std::optional<double> ground_;
    std::optional<double> grade_;
    const StationEquation *equation_ = nullptr;
};

} // namespace kareport
