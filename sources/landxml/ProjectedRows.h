#pragma once

#include "PointRows.h"
#include "Projection.h"

namespace kareport
{

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
    LandXmlAlignment *chooseAlignment();
    bool checkElements();

    bool isLoaded_ = false;
    AlignmentModel model_;
    const LandXmlRoute *route_ = nullptr; ///< null until the alignment is read, and when something is wrong with it
    std::optional<NearestFoot> nearest_;
    const VerticalProfile *profile_ = nullptr;
    std::optional<AlignmentFoot> foot_; ///< of the current point; nothing where it has no place on the alignment
    std::optional<double> station_;
    std::optional<double> design_;
    std::string kind_;
};

} // namespace kareport
