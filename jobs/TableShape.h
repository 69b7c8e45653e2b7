#pragma once

#include "JsonPlaces.h"

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
        QString kind; ///< the key: "is", "isNot", "above", "below", "outside" or "exists"
        std::vector<Value> values;
        std::optional<Name> beside;
    };
    struct Formula
    {
        Name variable;
        QString kind; ///< the key: "sum", "difference", "product", "distance" or "bearing"
        std::vector<Name> operands;
        JsonPath path;
    };
    struct Running
    {
        Name variable;
        QString kind; ///< the key: "sum", "difference" or "rowNumber"
        Name of;      ///< empty for "rowNumber"
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
        QString kind; ///< the key: "sum", "mean", "min", "max" or "count"
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
    bool addsPrinted = false;

    /// Whether the step asks for nothing of it.
    bool isEmpty() const
    {
        return sort.empty() && where.empty() && compute.empty() && running.empty() && flags.empty() && groups.empty() &&
               totals.empty() && pageTotals.empty();
    }
};

} // namespace kareport
