#pragma once

#include "ResultFeed.h"
#include "UDataObject.h"

#include <QString>

#include <cstddef>
#include <functional>
#include <vector>

namespace kareport
{

/// Hands what a table with groups writes to a sink of results, in the order of the report. What follows a heading whose text is
/// not known yet is held until it is.
class GroupResults
{
public:
    using FeedRow = std::function<void(const UDataObject &object, int level)>;
    /// @param feedRow  formats a row for the feed once more, and hands it on
    GroupResults(ResultFeed &feed, FeedRow feedRow) : feed_(feed), feedRow_(std::move(feedRow)) {}

    bool isWanted() const { return feed_.isOpen(); }
    // Levels are those of groups, from 0, as the sink is told them.
    void addText(ResultText kind, QString text, int level);
    /// Adds a heading of a group whose text is not known yet. @return what `setText` is told
    std::size_t addOpen(int level);
    void setText(std::size_t open, QString text);
    /// Adds the row that the feed was given last.
    void addRow(const UDataObject &object, int level);
    void addTotals(ResultRowKind kind, std::vector<ResultTotal> totals, int level);

private:
    struct Held
    {
        enum class Kind
        {
            Text,
            Row,
            Totals
        };
        Kind kind = Kind::Text;
        int level = 0;
        ResultText textKind = ResultText::GroupHeading;
        QString text;
        UDataObject object;
        ResultRowKind rowKind = ResultRowKind::Row;
        std::vector<ResultTotal> totals;
    };

    void add(Held held);
    void give(const Held &held);

    ResultFeed &feed_;
    FeedRow feedRow_;
    std::vector<Held> held_;
    std::size_t open_ = 0; ///< texts that are not known
};

} // namespace kareport
