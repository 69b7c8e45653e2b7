#pragma once

#include "JobReader.h"
#include "JobRunner.h"
#include "ViewFixture.h"

#include <gtest/gtest.h>

#include <memory>

/// The report of a job among the examples, with a view of it.
class ExampleReport
{
public:
    explicit ExampleReport(const char *job);
    ~ExampleReport();
    ExampleReport(const ExampleReport &) = delete;
    ExampleReport &operator=(const ExampleReport &) = delete;

    UReportDoc &report() { return runner_->report(); }
    UReportView &view() { return *view_; }

private:
    FixedSurroundings surroundings_;
    kareport::Progress progress_{false};
    kareport::Job job_;
    std::unique_ptr<kareport::JsonSource> source_;
    std::unique_ptr<kareport::JobRunner> runner_;
    CViewPane *pane_ = nullptr;
    UReportView *view_ = nullptr;
};
