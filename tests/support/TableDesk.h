#pragma once

#include "DeskFixture.h"

#include "ReportEdit.h"
#include "UReportView.h"

/// The desk with a job of one table in a folder: numbers and northings.
class TableDesk : public Desk
{
public:
    TableDesk();

    /// The rows of a data file, with northings from a first one on.
    static QByteArray rows(int count, int first = 0);
    /// Puts a file of rows in place of the data.
    void putRows(int count, int first = 0) const { folder.put("p.csv", rows(count, first)); }
    /// Opens the job, and its report in a view.
    UReportDoc *open(const char *job = "job.json");
    /// The first view of a report in which it is seen; null without one.
    static UReportView *viewOf(const UReportDoc &report);
    /// The northings that a report shows.
    static QStringList northings(const UReportDoc &report);
    /// Whether a command can be chosen now.
    bool isEnabled(unsigned command);

    JobFolder folder;
};
