#pragma once

#include "DataKind.h"
#include "Job.h"
#include "JsonSource.h"
#include "Progress.h"
#include "RowList.h"

#include <QString>

#include <deque>
#include <functional>
#include <list>
#include <memory>
#include <vector>

namespace kareport
{

/// The data of a job, kept from one run of it to the next: each data set is opened and ordered once for a dictionary, and the
/// rows that a run has asked for are there for the next one. Other runs of the same job differ in their template alone.
class KeptData
{
public:
    /// Rows of a list that are kept; those after them are read again.
    static constexpr std::size_t mostRows = 20'000;

    /// @param source  of the job
    KeptData(JsonSource source, Job job);
    ~KeptData();
    KeptData(const KeptData &) = delete;
    KeptData &operator=(const KeptData &) = delete;

    const JsonSource &source() const { return source_; }
    /// The job with data sets that are opened through this object, which must outlive it.
    Job job();

    /// Begins a run. @param isFull  no row is wanted any more once it says so
    /// @param isStopped  is asked now and then; its true ends all lists, and what they then do not have is read again
    void begin(std::function<bool()> isFull, std::function<bool()> isStopped);
    /// Ends a run: what was only partly done is forgotten.
    void end();
    /// How often data was opened or ordered so far.
    int openings() const { return openings_; }

private:
    class Source;
    class Rows;
    struct Kept;

    Expected<std::shared_ptr<Kept>> keptRows(const QString &name, const DataSource &set, const DataRequest &request,
                                             const std::vector<unsigned> &ids);

    JsonSource source_;
    Job job_;
    DataFiles files_;
    Progress progress_;
    std::function<bool()> isFull_;
    std::function<bool()> isStoppedNow_;
    std::function<bool()> isStopped_;       ///< what open lists refer to
    std::list<std::shared_ptr<Kept>> kept_; ///< what was used last comes first
    int openings_ = 0;
};

} // namespace kareport
