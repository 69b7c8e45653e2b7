#pragma once

#include <functional>
#include <vector>

namespace kareport
{

/// Which page a line of a report is on, and where a page begins, counted in lines from 0 and pages from 1. It gives what
/// `reportPages` gives, and follows every edit without looking at the whole text again.
class PageLines
{
public:
    /// Whether a line of the text has nothing but blanks.
    using IsBlank = std::function<bool(int line)>;

    /// Takes up a text. @param starts  the lines that pages were begun with, in ascending order
    void load(std::vector<int> starts, int lineCount, const IsBlank &isBlank);
    /// An edit that has replaced `removed` line ends by `added` ones, from a line on.
    /// @param starts  the lines that pages begin with now, from that line to the last one that the edit has left
    void replace(int line, int removed, int added, const std::vector<int> &starts, const IsBlank &isBlank);

    int lineCount() const { return lineCount_; }
    int pageCount(int linesPerPage) const; ///< 1 at least
    int pageOf(int line, int linesPerPage) const;
    /// @param page  brought into 1 to `pageCount`
    int firstLineOf(int page, int linesPerPage) const;

private:
    int countedPages(int linesPerPage) const;
    int stop() const { return starts_.empty() ? lineCount_ : starts_.front(); }

    std::vector<int> starts_;
    int lineCount_ = 0;
    int lastLine_ = -1;    ///< the last one that is not blank; -1 for none
    int lastCounted_ = -1; ///< the same of those before the first start
};

} // namespace kareport
