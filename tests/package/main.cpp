#include <KaReport/DefaultPrinter.h>
#include <KaReport/Profile.h>
#include <KaReport/ReportEntry.h>
#include <KaReport/ReportInitialTemplate.h>
#include <KaReport/UApplication.h>
#include <KaReport/UReportDoc.h>

#include <QApplication>

#include <cstdio>

/// A host of one function: it makes a report and asks whether its text is there.
int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication qt(argc, argv); // reports have windows
    kareport::setProfileStore(kareport::makeMemoryProfile());
    kareport::setDefaultPrinter({kareport::PrinterSource::None});
    UApplication application;
    application.AddDocTemplate(ReportInitialTemplate());
    UReportDoc *report = CreateReport(QStringLiteral("Traverse"), true, false, nullptr, 0, nullptr);
    if (report == nullptr) {
        return 1;
    }
    report->WriteLine(QStringLiteral("Closed on point 1"), 0, 1, 0);
    const QString text = report->GetText().toString();
    std::puts(qUtf8Printable(text));
    return text.startsWith(u"TALVEN - Traverse") && text.contains(u"Closed on point 1\r\n") ? 0 : 1;
}
