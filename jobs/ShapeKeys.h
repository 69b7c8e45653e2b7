#pragma once

#include "RowConditions.h"
#include "RowFormulas.h"
#include "RunningValues.h"
#include "TableGroups.h"

namespace kareport
{

/// A key of a job, and what it asks for.
template <typename Kind>
struct ShapeKey
{
    const char *key;
    Kind kind;
};

// The keys that say of what kind a condition, a formula, a running value and a total are.

inline constexpr ShapeKey<RowCondition::Kind> conditionKeys[] = {
    {"is", RowCondition::Kind::Is},           {"isNot", RowCondition::Kind::IsNot},
    {"above", RowCondition::Kind::Above},     {"below", RowCondition::Kind::Below},
    {"outside", RowCondition::Kind::Outside}, {"exists", RowCondition::Kind::Exists}};

inline constexpr ShapeKey<RowFormula::Kind> formulaKeys[] = {{"sum", RowFormula::Kind::Sum},
                                                             {"difference", RowFormula::Kind::Difference},
                                                             {"product", RowFormula::Kind::Product},
                                                             {"distance", RowFormula::Kind::Distance},
                                                             {"bearing", RowFormula::Kind::Bearing}};

inline constexpr ShapeKey<RunningValue::Kind> runningKeys[] = {{"sum", RunningValue::Kind::Sum},
                                                               {"difference", RunningValue::Kind::Difference},
                                                               {"rowNumber", RunningValue::Kind::RowNumber}};

inline constexpr ShapeKey<TotalKind> totalKeys[] = {{"sum", TotalKind::Sum},
                                                    {"mean", TotalKind::Mean},
                                                    {"min", TotalKind::Least},
                                                    {"max", TotalKind::Greatest},
                                                    {"count", TotalKind::Count}};

} // namespace kareport
