#include "ExampleReport.h"

ExampleReport::ExampleReport(const char *job)
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

ExampleReport::~ExampleReport()
{
    pane_->ClosePane();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}
