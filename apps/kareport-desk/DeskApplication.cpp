#include "DeskApplication.h"

#include "CReportViewPane.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "UReportView.h"

#include <QFileInfo>

namespace
{

QString recentEntry(qsizetype number)
{
    return QStringLiteral("Recent File %1").arg(number);
}

} // namespace

DeskApplication::DeskApplication()
{
    AddDocTemplate(
        ReportInitialTemplate([] { return new CReportViewPane; }, [] { return std::make_unique<UReportView>(); }));
    QStringList files;
    for (qsizetype number = 1; !GetProfileString(QString(), recentEntry(number)).isEmpty(); ++number) {
        files.prepend(GetProfileString(QString(), recentEntry(number)));
    }
    for (const QString &file : files) {
        UApplication::AddToRecentFileList(file);
    }
}

void DeskApplication::AddToRecentFileList(const QString &path)
{
    UApplication::AddToRecentFileList(QFileInfo(path).absoluteFilePath());
    for (qsizetype i = 0; i < GetRecentFileList().size(); ++i) {
        WriteProfileString(QString(), recentEntry(i + 1), GetRecentFileList().at(i));
    }
}
