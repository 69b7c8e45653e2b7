#pragma once

#include "ResultReport.h"
#include "ResultSink.h"
#include "SpooledBytes.h"

#include <QString>
#include <QStringList>

#include <string>
#include <string_view>
#include <vector>

namespace kareport
{

/// A file that is made of typed results. Its bytes are kept until the report is whole: few in memory, many in a temporary
/// file, so that memory does not grow with them.
class ResultFile : public ResultSink
{
public:
    /// Says what the report is called. It comes before all else.
    virtual void beginReport(const ResultReport & /*report*/) {}
    /// Ends the file. Nothing may be added afterwards. @return whether all of it is kept
    bool finish();
    /// All bytes, after `finish` has answered true.
    std::string_view bytes() const { return spool_.view(); }
    /// How many pages there are, each of them a file; 1 for a file without pages.
    std::size_t pageCount() const { return pages_.empty() ? 1 : pages_.size(); }
    /// The bytes of a page, from 1, after `finish` has answered true.
    std::string_view page(std::size_t number) const;
    /// Gives the memory of bytes that were read back to the system. They can be read again. @param read  a part of `bytes`
    void release(std::string_view read) const;
    /// What went wrong, as a sentence; empty when nothing did.
    QString problem() const { return problem_; }
    /// What a reader of the file should know, as sentences, after `finish`.
    virtual QStringList warnings() const { return {}; }
    /// Writes no more bytes than these; what would be longer is a problem.
    void limitTo(qint64 mostBytes) { mostBytes_ = mostBytes; }
    /// Whether there would be more bytes than the limit.
    bool isTooLarge() const { return isTooLarge_; }

protected:
    /// Where bytes are added; `flush` is called after each row.
    std::string &out() { return spool_.buffer(); }
    /// Says that what is added now begins a page.
    void markPage() { pages_.push_back(spool_.size()); }
    /// Hands what was added on when it has become much. What comes after a problem is dropped.
    void flush();
    /// Says what went wrong. Nothing more is kept then.
    void setProblem(const QString &problem) { problem_ = problem; }
    /// Adds what the file ends with.
    virtual void writeEnd() {}

private:
    SpooledBytes spool_;
    std::vector<std::size_t> pages_; ///< where they begin
    QString problem_;
    qint64 mostBytes_ = -1;
    bool isTooLarge_ = false;
};

} // namespace kareport
