#include "ExampleReport.h"

ExampleReport::ExampleReport(const char *job)
{
    const auto source =
        kareport::JsonSource::read(QStringLiteral(KAREPORT_EXAMPLES_DIR "/") + QString::fromLatin1(job));
    const auto read = kareport::readJob(std::get<kareport::JsonSource>(source));
    kareport::Progress progress(false);
    kareport::JobRunner runner(std::get<kareport::Job>(read), std::get<kareport::JsonSource>(source), progress);
    EXPECT_FALSE(runner.run(report_));
    report_.SetAutoDelete(false);
    pane_ = new CViewPane;
    view_ = showIn<UReportView>(*pane_, report_);
    view_->OnInitialUpdate();
    view_->UpdateData(true);
}

ExampleReport::~ExampleReport()
{
    pane_->ClosePane();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}
