#include "JobSurroundings.h"

#include "ApplicationTitle.h"
#include "Clock.h"
#include "Folders.h"
#include "Preferences.h"
#include "ReportMargins.h"

namespace kareport
{

namespace
{

/// The time that a reproducible build gives its programs, if one does.
std::optional<QDateTime> buildTime()
{
    bool isNumber = false;
    const qint64 seconds = qEnvironmentVariable("SOURCE_DATE_EPOCH").toLongLong(&isNumber);
    return isNumber ? std::optional(QDateTime::fromSecsSinceEpoch(seconds, Qt::UTC)) : std::nullopt;
}

} // namespace

JobSurroundings::JobSurroundings(const Job &job)
    : profile_(exchangeProfileStore(makeMemoryProfile())),
      printer_(defaultPrinter()),
      application_(GetApplicationTitle())
{
    WriteProfileString(QString(), QStringLiteral("ReportPrintHash"),
                       job.options.printHash ? QStringLiteral("1") : QStringLiteral("0"));
    if (job.page.margins) {
        WriteProfileString(QString(), QStringLiteral("Report Margins"), marginsToText(*job.page.margins));
    }
    if (job.page.fontSize) {
        SetReportFontSize(static_cast<unsigned>(*job.page.fontSize));
    }
    SetReportPrinterSetToPortrait(job.page.portrait);
    setStartPathName(job.folder);
    SetApplicationTitle(job.application);
    fixTime(job.now ? job.now : buildTime());
}

JobSurroundings::~JobSurroundings()
{
    setProfileStore(std::move(profile_));
    setDefaultPrinter(printer_);
    SetApplicationTitle(application_);
    setStartPathName(QString());
    fixTime(std::nullopt);
}

} // namespace kareport
