#include "MatchCounter.h"

#include <QElapsedTimer>
#include <QTextDocument>

namespace kareport
{

namespace
{

constexpr int sliceTime = 5; // milliseconds

} // namespace

MatchCounter::MatchCounter(std::function<void()> counted) : counted_(std::move(counted))
{
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { countSlice(); });
}

void MatchCounter::start(const QTextDocument &document, const TextSearch &search)
{
    stop();
    search_ = search;
    next_ = document.begin();
    if (!search_.isEmpty()) {
        timer_.start(0);
    }
}

void MatchCounter::stop()
{
    timer_.stop();
    next_ = QTextBlock();
    total_ = 0;
    before_.clear();
}

void MatchCounter::countSlice()
{
    QElapsedTimer time;
    time.start();
    while (next_.isValid() && time.elapsed() < sliceTime) {
        before_.push_back(total_);
        for (int i = 0; i < stride && next_.isValid(); ++i) {
            total_ += search_.count(next_.text());
            next_ = next_.next();
        }
    }
    if (!next_.isValid()) {
        timer_.stop();
    }
    counted_();
}

std::optional<qint64> MatchCounter::numberAt(const QTextDocument &document, int position) const
{
    const QTextBlock target = document.findBlock(position);
    const auto strideIndex = static_cast<std::size_t>(target.blockNumber() / stride);
    if (!target.isValid() || strideIndex >= before_.size()) {
        return std::nullopt;
    }
    qint64 number = before_[strideIndex];
    for (QTextBlock block = document.findBlockByNumber(static_cast<int>(strideIndex) * stride); block != target;
         block = block.next())
    {
        number += search_.count(block.text());
    }
    const QString line = target.text();
    const int column = position - target.position();
    qsizetype at = search_.find(line);
    for (; at >= 0 && at < column; at = search_.find(line, at + search_.length())) {
        ++number;
    }
    return at == column ? std::optional(number + 1) : std::nullopt;
}

} // namespace kareport
