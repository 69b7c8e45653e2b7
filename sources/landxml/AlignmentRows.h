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
    void take(std::size_t index) override { route_ = &model_.routes[index]; }

private:
    struct Variables;

    AlignmentModel model_;
    const LandXmlRoute *route_ = nullptr;
};

} // namespace kareport
