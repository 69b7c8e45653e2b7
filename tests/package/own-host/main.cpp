// Runs a report through the module with a host library of one's own.
#include "OwnHost.h"

#include <KaReport/ReportEntry.h>
#include <KaReport/UApplication.h>
#include <KaReport/UDataObjectList.h>
#include <KaReport/UReportDoc.h>

#include <QFile>
#include <QGuiApplication>

#include <cstdio>

namespace
{

int wrong(const char *what)
{
    std::printf("%s\n", what);
    return 1;
}

UReportDoc *makeReport()
{
    UReportDoc *report = CreateReport(QString(), true, false, nullptr, 0, nullptr);
    if (report == nullptr ||
        !report->LoadTemplateXml(QStringLiteral("survey.xml"), QStringLiteral("STAKEOUT"), QString(), QString()))
    {
        return nullptr;
    }
    UDataObject site;
    site.Set(1, QStringLiteral("Harbour road"));
    UDataObjectList points;
    UDataObject &point = points.Add();
    point.Set(1, UPointNumber(QStringLiteral("12")));
    point.Set(2, 140.0);
    point.Set(3, 3.75);
    const bool isWritten = report->WriteDataBlock(QStringLiteral("Site"), &site, 0, 1) &&
                           report->WriteDataTable(QStringLiteral("Points"), &points, 1, 1, -1);
    return isWritten ? report : nullptr;
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication qt(argc, argv); // a page is measured with a font
    UApplication application;
    application.AddDocTemplate(kareport::makeReportTemplate());
    UReportDoc *report = makeReport();
    if (report == nullptr) {
        return wrong("the report was not written");
    }
    const QString text = report->CopyText();
    std::printf("%s\n", qUtf8Printable(text));
    if (!text.startsWith(u"TALVEN of our own") || !text.contains(u"2001")) {
        return wrong("title and time are not those of this host");
    }
    if (!text.contains(u"Harbour road") || !text.contains(u"@140") || valuesFound() == 0) {
        return wrong("the values are not those of this host");
    }
    const QString path = QString::fromLocal8Bit(argv[argc - 1]) + QStringLiteral("/own-host");
    if (!report->OnSaveDocument(path + QStringLiteral(".rep")) ||
        !report->OnSaveDocument(path + QStringLiteral(".pdf"))) {
        return wrong("the report was not saved");
    }
    QFile pdf(path + QStringLiteral(".pdf"));
    if (!pdf.open(QIODevice::ReadOnly) || !pdf.readAll().startsWith("%PDF")) {
        return wrong("there is no PDF");
    }
    return 0;
}
