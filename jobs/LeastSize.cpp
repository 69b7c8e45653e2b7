#include "LeastSize.h"

#include "UReportDoc.h"

#include <algorithm>
#include <optional>

namespace kareport
{

namespace
{

constexpr int linesUnderHeader = 4;
constexpr int digitsOfPage = 3;

/// Counts what a report's writer writes, with its page rule, and writes nothing. Where the writer is on its page is not
/// known after data, or when the page is still to be measured.
class Count
{
public:
    explicit Count(const Job &job)
        : linesPerPage_(job.page.linesPerPage),
          hasHeader_(job.header && !job.options.excel),
          hasPlaceholders_(job.options.placeholders),
          headerBytes_(job.application.toUtf8().size() + digitsOfPage)
    {}

    qint64 bytes() const { return bytes_; }

    void operator()(const Job::Heading &step) { heading_ = step; }
    void operator()(const Job::Line &step)
    {
        skipLines(step.before);
        write(step.text);
        if (step.after != 0) {
            lineFeed(1);
            skipLines(qint64(step.after) - 1);
        }
    }
    void operator()(const Job::LineFeed &step) { lineFeed(step.count); }
    void operator()(const Job::NewPage &step) { newPage(step.linesNeeded); }
    void operator()(const Job::Block & /*step*/) { writeData(); }
    void operator()(const Job::Table & /*step*/) { writeData(); }
    void operator()(const Job::Clear & /*step*/)
    {
        bytes_ = 0;
        isEmpty_ = true;
        heading_.text.clear();
    }

private:
    void lineFeed(qint64 count)
    {
        if (count > 0) {
            bytes_ += count;
            addLines(count);
        }
    }

    void addLines(qint64 count)
    {
        isEmpty_ = isEmpty_ && count == 0;
        line_ = line_ ? std::optional(*line_ + count) : std::nullopt;
    }

    void write(const QString &text)
    {
        if (!hasPlaceholders_ || !text.contains(u'{')) { // what is put in may be shorter than its name
            bytes_ += text.toUtf8().size() - text.count(QStringLiteral("\r\n"));
        }
        addLines(text.count(u'\n'));
    }

    void writeHeader()
    {
        line_ = 1;
        if (hasHeader_) {
            addLines(heading_.text.count(u'\n')); // the writer reserves a line for each as well
            bytes_ += headerBytes_;
            lineFeed(qint64(heading_.before) + linesUnderHeader);
            write(heading_.text);
            lineFeed(heading_.after);
        }
    }

    /// A heading ends with the block or table below it.
    void writeData()
    {
        heading_.text.clear();
        isEmpty_ = false;
        line_.reset();
    }

    /// Whether a new page is begun; nothing when that is not known.
    std::optional<bool> isNewPage(qint64 linesNeeded) const
    {
        if (isEmpty_ || linesNeeded < 0) {
            return true;
        }
        if (!line_ || !linesPerPage_) {
            return std::nullopt;
        }
        const qint64 remaining = *linesPerPage_ - *line_;
        return remaining == 0 || linesNeeded >= remaining;
    }

    std::optional<bool> newPage(qint64 linesNeeded)
    {
        const auto isNew = isNewPage(linesNeeded);
        if (isNew == true) {
            if (!isEmpty_ && line_ && linesPerPage_) {
                lineFeed(*linesPerPage_ - *line_ + 1);
            }
            writeHeader();
        } else if (!isNew) {
            line_.reset();
        }
        return isNew;
    }

    void skipLines(qint64 count)
    {
        if (newPage(count) == false) {
            lineFeed(count);
        }
    }

    std::optional<int> linesPerPage_;
    bool hasHeader_;
    bool hasPlaceholders_;
    qint64 headerBytes_;
    Job::Heading heading_{};
    qint64 bytes_ = 0;
    std::optional<qint64> line_ = 0;
    bool isEmpty_ = true; ///< no line was ended yet
};

} // namespace

qint64 leastSize(const Job &job)
{
    Count count(job);
    for (const Job::Step &step : job.steps) {
        std::visit(count, step.action);
    }
    return count.bytes();
}

qint64 leastSize(const UReportDoc &report)
{
    return report.GetTextLength() / 2;
}

std::optional<qint64> sizeLimit(const Job &job)
{
    std::optional<qint64> limit;
    for (const Output &output : job.outputs) {
        if (output.mostBytes) {
            limit = std::min(limit.value_or(*output.mostBytes), *output.mostBytes);
        }
    }
    return limit;
}

bool isTooLarge(const Job &job, qint64 leastBytes)
{
    const auto limit = sizeLimit(job);
    return limit && leastBytes > *limit;
}

} // namespace kareport
