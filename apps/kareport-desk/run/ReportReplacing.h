#pragma once

#include "ReportSurroundings.h"
#include "UReportDoc.h"

#include <memory>

namespace kareport
{

class WrittenLines;

/// A hidden report that replaces what another one holds when it is complete.
class WrittenReport
{
public:
    /// @param shown  the other one
    WrittenReport(const ReportSurroundings &surroundings, const UReportDoc &shown);
    ~WrittenReport();
    WrittenReport(const WrittenReport &) = delete;
    WrittenReport &operator=(const WrittenReport &) = delete;

    /// What is to be written.
    UReportDoc &report() { return made_; }
    /// Puts what was written into the other report. Its windows show it; the place on the page, the selection and the zoom
    /// stay: line and column, as far as there are any. The user's editor is not started.
    void putInto(UReportDoc &report);

private:
    UReportDoc made_;
    std::unique_ptr<WrittenLines> lines_; ///< for the report window of the other one; null where that shows none
};

} // namespace kareport
