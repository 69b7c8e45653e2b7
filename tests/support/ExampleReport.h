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
    explicit ExampleReport(const char *job)
    {
        auto read = kareport::JsonSource::read(QStringLiteral(KAREPORT_EXAMPLES_DIR "/") + QString::fromLatin1(job));
        source_ = std::make_unique<kareport::JsonSource>(std::get<kareport::JsonSource>(std::move(read)));
        job_ = kareport::readJob(*source_);
        EXPECT_FALSE(source_->failed());
        runner_ = std::make_unique<kareport::JobRunner>(job_, *source_, progress_);
        EXPECT_FALSE(runner_->run());
        report().SetAutoDelete(false);
        pane_ = new CViewPane;
        view_ = showIn<UReportView>(*pane_, report());
        view_->OnInitialUpdate();
        view_->UpdateData(true);
    }
    ~ExampleReport()
    {
        pane_->ClosePane();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
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
