#include "UReportWindowDlg.h"

#include "PageDefaults.h"
#include "ReportContent.h"
#include "ReportWindowBody.h"
#include "UReportDoc.h"
#include "UReportList.h"

#include <QString>

void UReportWindowDlg::SetReportDoc(UReportDoc *report)
{
    report_ = report;
    if (body_) {
        report = GetReportDoc();
        body_->list().setFont(report != nullptr
                                  ? kareport::reportFont(*report)
                                  : kareport::reportFont(kareport::defaultFace.toString(), kareport::defaultFontSize));
        updateCommands();
    }
}

UReportDoc *UReportWindowDlg::GetReportDoc() const
{
    return UReportDoc::IsReportAvailable(report_) ? report_ : nullptr;
}

void UReportWindowDlg::WriteLine(const QString &line)
{
    if (body_) {
        body_->list().WriteLine(line);
    }
}

void UReportWindowDlg::UpdateDocumentData()
{
    const UReportDoc *report = GetReportDoc();
    if (report == nullptr || !body_) {
        return;
    }
    const QString text = report->CopyText();
    for (QStringView rest(text); !rest.isEmpty();) {
        const qsizetype end = rest.indexOf(u'\r');
        QStringView line = end < 0 ? rest : rest.first(end);
        rest = end < 0 ? QStringView() : rest.sliced(end + 1);
        // The line feed that ended the line before is removed with the blanks.
        while (!line.isEmpty() && line.front().isSpace()) {
            line = line.sliced(1);
        }
        if (!line.isEmpty()) {
            body_->list().AddString(line);
        }
    }
}

UReportList *UReportWindowDlg::GetList() const
{
    return body_ ? &body_->list() : nullptr;
}
