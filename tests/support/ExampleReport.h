#pragma once

#include "JobReader.h"
#include "JobRunner.h"
#include "ViewFixture.h"

#include <gtest/gtest.h>

/// The report of a job among the examples, with a view of it.
class ExampleReport
{
public:
    explicit ExampleReport(const char *job);
    ~ExampleReport();
    ExampleReport(const ExampleReport &) = delete;
    ExampleReport &operator=(const ExampleReport &) = delete;

    UReportDoc &report() { return report_; }
    UReportView &view() { return *view_; }

private:
    FixedSurroundings surroundings_;
    UReportDoc report_;
    CViewPane *pane_ = nullptr;
    UReportView *view_ = nullptr;
};
