#pragma once

#include "TextSearch.h"

#include <QTextBlock>
#include <QTimer>

#include <functional>
#include <optional>
#include <vector>

class QTextDocument;

namespace kareport
{

/// Counts the matches of a search in a document, a slice at a time between the user's actions.
class MatchCounter
{
public:
    /// @param counted  called after every slice
    explicit MatchCounter(std::function<void()> counted);

    /// Begins to count. The document must stay unchanged until the next `start` or `stop`.
    void start(const QTextDocument &document, const TextSearch &search);
    void stop();

    bool isDone() const { return !timer_.isActive(); }
    qint64 total() const { return total_; } ///< so far
    /// The number, from 1, of the match that begins at a position; nothing where none does or it has not been counted yet.
    std::optional<qint64> numberAt(const QTextDocument &document, int position) const;

private:
    static constexpr int stride = 512; ///< lines between places of which the number of matches before them is known

    void countSlice();

    std::function<void()> counted_;
    QTimer timer_;
    TextSearch search_;
    QTextBlock next_;
    qint64 total_ = 0;
    std::vector<qint64> before_;
};

} // namespace kareport
