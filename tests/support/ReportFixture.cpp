#include "ReportFixture.h"

FixedSurroundings::FixedSurroundings()
{
    if (++count_ == 1) {
        fix();
    }
}

FixedSurroundings::~FixedSurroundings()
{
    if (--count_ > 0) {
        return;
    }
    // The flag is one for all reports and outlives the preferences that it was read from.
    WriteProfileString(QString(), QStringLiteral("ReportPrintHash"), QStringLiteral("0"));
    {
        const UReportDoc resetsPrintHash;
    }
    kareport::setProfileStore(kareport::makeMemoryProfile());
    kareport::fixTime(std::nullopt);
    kareport::setDefaultPrinter({});
    kareport::setLibraryDir(QString());
    kareport::setStartPathName(QString());
    kareport::setMessageHandler({});
    SetApplicationTitle(QStringLiteral("TALVEN"));
    UPreviewDlg::SetModulePrinterOrientationPortrait(true);
}

void FixedSurroundings::fix()
{
    kareport::setProfileStore(kareport::makeMemoryProfile());
    kareport::fixTime(QDateTime(QDate(2024, 3, 5), QTime(14, 7)));
    kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::A4, 600});
}

QString reportLines(QString text)
{
    return text.replace(u'\n', QStringLiteral("\r\n"));
}

QString textOf(const UReportDoc &report)
{
    return report.GetText().toString();
}

QString headerOf(const QString &title, int page)
{
    const QString front = QStringLiteral("TALVEN - ") + title;
    return front + u' ' + QStringLiteral("Mar 05, 2024  02:07PM").rightJustified(80 - front.size() - 20) +
           QStringLiteral("    Page:") + QString::number(page).rightJustified(3);
}

ReportApplication::ReportApplication()
    : reportTemplate_(AddDocTemplate(kareport::makeReportTemplate([] { return new CountingPane; },
                                                                  [] { return std::make_unique<TestReportView>(); })))
{}

ReportApplication::~ReportApplication()
{
    while (!reportTemplate_->GetDocuments().empty()) {
        auto *report = static_cast<UReportDoc *>(reportTemplate_->GetDocuments().back());
        report->SetAutoDelete(true);
        report->SetCloseDocument(2);
        report->OnCloseDocument();
    }
}

TestReportWindow::TestReportWindow(CViewPane *pane, bool *destroyed) : pane_(pane), destroyed_(destroyed) {}

TestReportWindow::~TestReportWindow()
{
    if (destroyed_ != nullptr) {
        *destroyed_ = true;
    }
}

bool TestReportWindow::createDocked(const QString &caption, UView *previousView)
{
    calls += QStringLiteral("create ") + caption;
    previous = previousView;
    created = canBeCreated;
    return created;
}
