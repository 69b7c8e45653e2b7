#include "ProjectedRows.h"

#include "ModelRows.h"
#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

struct ProjectedRows::Variables
{
    using Rows = ProjectedRows;
    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Station", VARIABLE_STATION, [](const Rows &rows) { return valueOf(rows.station_); }},
        {"Region", VARIABLE_INTEGER,
         [](const Rows &rows) {
             return rows.station_ ? LandXmlValue(static_cast<double>(rows.route_->nameOf(rows.foot_->distance).region))
                                  : LandXmlValue();
         }},
        {"Along", VARIABLE_LENGTH,
         [](const Rows &rows) { return rows.station_ ? valueOf(rows.foot_->distance) : LandXmlValue(); }},
        {"Offset", VARIABLE_OFFSET,
         [](const Rows &rows) { return rows.foot_ ? valueOf(rows.foot_->offset) : LandXmlValue(); }},
        {"Distance", VARIABLE_DISTANCE,
         [](const Rows &rows) { return rows.foot_ ? valueOf(std::fabs(rows.foot_->offset)) : LandXmlValue(); }},
        {"Place", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.kind_); }},
        {"Design", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.design_); }},
        {"HeightDifference", VARIABLE_LENGTH,
         [](const Rows &rows) { return rows.design_ ? valueOf(rows.height_ - *rows.design_) : LandXmlValue(); }},
    };
};

ProjectedRows::ProjectedRows(LandXmlSource source) : PointRows(std::move(source)) {}

std::vector<LandXmlVariable> ProjectedRows::variables() const
{
    std::vector<LandXmlVariable> variables = PointRows::variables();
    for (LandXmlVariable &own : variablesOf(Variables::getters)) {
        variables.push_back(std::move(own));
    }
    return variables;
}

LandXmlValue ProjectedRows::value(std::size_t variable) const
{
    return variable < ownVariables ? PointRows::value(variable)
                                   : Variables::getters[variable - ownVariables].get(*this);
}

bool ProjectedRows::next()
{
    if (!isLoaded_) {
        isLoaded_ = true;
        if (!load()) {
            route_ = nullptr;
            return false;
        }
        // The file has been read through, and the reader has noted all. Rows that are to be kept still are.
        isReaderHeard_ = false;
        startReading();
    }
    return route_ != nullptr && PointRows::next();
}

bool ProjectedRows::load()
{
    if (!readAlignments(model_, {})) {
        return false;
    }
    LandXmlAlignment *alignment = chooseAlignment();
    if (alignment == nullptr || !makeRoutes(model_, {alignment})) {
        return false;
    }
    for (const LandXmlGradeLine &line : alignment->gradeLines) {
        gradeLines_.matches(line.name);
    }
    if (isAsked("Design") || isAsked("HeightDifference")) {
        noteOtherGradeLines(*alignment);
    }
    error_ = gradeLines_.error(source_.file->path());
    route_ = &model_.routes.front();
    if (error_ || !checkElements()) {
        return false;
    }
    nearest_.emplace(route_->alignment);
    profile_ = route_->profile(source_.query.gradeLine.toStdString());
    return true;
}

/// The alignment that is asked for; null with an error where there is none, or several.
LandXmlAlignment *ProjectedRows::chooseAlignment()
{
    LandXmlAlignment *chosen = nullptr;
    LandXmlNames names(LandXmlNames::Of::Alignment, source_.query.alignment);
    for (LandXmlAlignment &alignment : model_.alignments) {
        if (!names.matches(alignment.name)) {
            continue;
        }
        if (chosen != nullptr && source_.query.alignment.isEmpty()) {
            fail(alignment.byte, Xlate("the file has several alignments: the name of one was expected"));
            return nullptr;
        }
        if (chosen != nullptr) {
            modelNotes_.add(
                alignment.byte,
                Xlate("several alignments have the name \"%1\": the first one was taken").arg(source_.query.alignment));
        }
        chosen = chosen == nullptr ? &alignment : chosen;
    }
    error_ = names.error(source_.file->path());
    if (!error_ && chosen == nullptr) {
        error_ = InputError{source_.file->path(), std::nullopt, Xlate("the file has no alignment")};
    }
    return chosen;
}

bool ProjectedRows::checkElements()
{
    if (route_->fault) {
        fail(*route_->fault);
        return false;
    }
    const auto &elements = route_->alignment.elements();
    if (elements.empty()) {
        fail(route_->stored->byte, Xlate("the alignment has no elements"));
        return false;
    }
    // Each point would have to look at each turn.
    constexpr std::size_t usualPieces = 16;
    constexpr std::size_t mostPieces = 100; // more than all elements usually have
    std::size_t pieces = 0;
    for (const Alignment::Element &element : elements) {
        pieces += element.curve.pieces() - std::min(usualPieces, element.curve.pieces());
    }
    if (pieces > mostPieces) {
        fail(route_->stored->byte, Xlate("the elements turn too many times"));
        return false;
    }
    return true;
}

bool ProjectedRows::take()
{
    if (!PointRows::take()) {
        return false;
    }
    foot_ = nearest_->of(at_);
    station_.reset();
    design_.reset();
    if (!foot_ || !std::isfinite(foot_->offset)) {
        foot_.reset();
        kind_ = Xlate("too far away").toStdString();
        return true;
    }
    switch (foot_->kind) {
    case AlignmentFoot::Kind::Perpendicular: kind_.clear(); break;
    case AlignmentFoot::Kind::Corner: kind_ = Xlate("outside of a corner").toStdString(); break;
    case AlignmentFoot::Kind::BeforeStart: kind_ = Xlate("before the start").toStdString(); break;
    case AlignmentFoot::Kind::AfterEnd: kind_ = Xlate("after the end").toStdString(); break;
    case AlignmentFoot::Kind::Undetermined: kind_ = Xlate("at a centre").toStdString(); return true;
    }
    station_ = route_->nameOf(foot_->distance).station;
    if (profile_ != nullptr) {
        design_ = profile_->heightAt(foot_->distance + route_->stationing.start());
    }
    return true;
}

} // namespace kareport
