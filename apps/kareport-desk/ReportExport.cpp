#include "ReportExport.h"

#include "ApplicationTitle.h"
#include "Clock.h"
#include "FileIdentity.h"
#include "JobOutputs.h"
#include "ReportSaveName.h"
#include "ReportViews.h"
#include "StandardText.h"
#include "UReportDoc.h"
#include "WaitCursor.h"
#include "Xlate.h"

#include <algorithm>
#include <memory>
#include <new>

namespace kareport
{

namespace
{

struct Offered
{
    OutputKind kind;
    QString text; ///< as in `SaveRequest::filter`
};

} // namespace

SaveRequest exportRequest(UReportDoc &report, OutputKind kind, const QString &folder)
{
    Offered offered[] = {{OutputKind::Pdf, Xlate("PDF") + QStringLiteral(" (*.pdf)|*.pdf|")},
                         {OutputKind::RichText, Xlate("Rich Text") + QStringLiteral(" (*.rtf)|*.rtf|")},
                         {OutputKind::Text, Xlate("Plain Text") + QStringLiteral(" (*.txt)|*.txt|")}};
    std::stable_partition(std::begin(offered), std::end(offered),
                          [kind](const Offered &each) { return each.kind == kind; });
    SaveRequest request;
    for (const Offered &each : offered) {
        request.filter += each.text;
    }
    request.filter += u'|';
    request.initialFolder = folder;
    request.flags = SaveRequest::overwritePrompt | SaveRequest::pathMustExist;
    request.document = &report;
    return request;
}

QString exportReport(UReportDoc &report, const SaveChoice &choice, QStringList &warnings)
{
    try {
        if (report.HasLostText()) {
            return lostTextReason();
        }
        if (!report.GetPathName().isEmpty() && fileIdentity(report.GetPathName()) == fileIdentity(choice.path)) {
            return Xlate("it is the report's own file, which is written by Save");
        }
        const WaitCursor cursor;
        finishLoading(report);
        Output output;
        output.file = choice.path;
        output.kind = outputKindOf(choice.path, OutputKind::Text).value_or(OutputKind::Text);
        if (output.kind != OutputKind::Pdf && output.kind != OutputKind::RichText) {
            output.kind = OutputKind::Text;
        }
        if (output.kind == OutputKind::Pdf && makesNoPage(report)) {
            return emptyPdfReason();
        }
        if (choice.hasOutline) {
            auto details = std::make_shared<PdfDetails>();
            details->title = report.GetTitle();
            details->creator = GetApplicationTitle();
            details->created = currentTime();
            output.pdf = details;
        }
        Progress progress(false);
        const OutputResult result = writeOutput(report, output, progress);
        warnings = result.warnings;
        return result.problem.value_or(QString());
    } catch (const std::bad_alloc &) {
        return noMemoryText();
    }
}

} // namespace kareport
