#pragma once

#include "ModelRows.h"

namespace kareport
{

/// The alignments of a file.
class AlignmentRows : public ModelRows
{
public:
    using ModelRows::ModelRows;

    std::vector<LandXmlVariable> variables() const override;
    LandXmlValue value(std::size_t variable) const override;
    std::size_t byte() const override { return route_->stored->byte; }

protected:
    bool load() override;
    void take(std::size_t index) override { route_ = rows_[index]; }

private:
    struct Variables;

    AlignmentModel model_;
    std::vector<const LandXmlRoute *> rows_;
    const LandXmlRoute *route_ = nullptr;
};

/// The horizontal elements of alignments, as they are stored, with what their geometry gives.
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

    AlignmentModel model_;
    std::vector<std::pair<const LandXmlRoute *, std::size_t>> rows_; ///< and the piece
    const LandXmlRoute *route_ = nullptr;
    std::size_t index_ = 0;
    const LandXmlRoute::Piece *piece_ = nullptr;
    const LandXmlElement *element_ = nullptr;
    std::optional<CurvePlace> start_;
    std::optional<CurvePlace> end_;
    std::optional<PlanePoint> intersection_;
    std::optional<PlanePoint> centre_;
};

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
