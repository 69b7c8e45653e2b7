#pragma once

#include "JsonPlaces.h"
#include "RowConditions.h"
#include "RowFormulas.h"
#include "RunningValues.h"
#include "TableGroups.h"

#include <QJsonValue>
#include <QString>

#include <optional>
#include <vector>

namespace kareport
{

/// What a table step of a job asks for besides its template: sorting, conditions, computed variables, groups and totals. Names
/// are those of the job; they are looked up when the template is loaded.
struct TableShape
{
    /// A text of the job, with its place.
    struct Name
    {
        QString text;
        JsonPath path;
    };
    /// A value of the job, with its place.
    struct Value
    {
        QJsonValue value;
        JsonPath path;
    };
    struct Condition
    {
        Name of;
        RowCondition::Kind kind = RowCondition::Kind::Exists;
        std::vector<Value> values;
        std::optional<Name> beside;
    };
    struct Formula
    {
        Name variable;
        RowFormula::Kind kind = RowFormula::Kind::Sum;
        std::vector<Name> operands;
        JsonPath path;
    };
    struct Running
    {
        Name variable;
        RunningValue::Kind kind = RunningValue::Kind::RowNumber;
        Name of; ///< empty for a row number
        bool perGroup = false;
        JsonPath path;
    };
    struct Flag
    {
        Name variable;
        std::optional<Name> text;
        Condition condition;
        JsonPath path;
    };
    struct Total
    {
        TotalKind kind = TotalKind::Sum;
        Name variable;
    };
    struct TotalLine
    {
        Name label; ///< without a text for none
        std::vector<Total> totals;
    };
    struct Group
    {
        std::vector<Name> by;
        std::optional<Name> heading;
        std::vector<TotalLine> totals;
        int before = 0;
        int keep = 1;
        bool newPage = false;
    };

    std::vector<Name> sort;
    std::vector<Condition> where;
    std::vector<Formula> compute;
    std::vector<Running> running;
    std::vector<Flag> flags;
    std::vector<Group> groups;
    std::vector<TotalLine> totals;
    std::vector<TotalLine> pageTotals;
    bool addsPrinted = false;         ///< whether the digits that are printed are added
    std::optional<JsonPath> rounding; ///< where the step says what is added

    /// Whether the step asks for nothing of it.
    bool isEmpty() const
    {
        return sort.empty() && where.empty() && compute.empty() && running.empty() && flags.empty() && groups.empty() &&
               totals.empty() && pageTotals.empty() && !rounding;
    }
};

} // namespace kareport
