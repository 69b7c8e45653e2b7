// A host's own folders, preferences and messages, in place of those of KaReportHost: nothing is kept and nothing is asked.
#include <KaReport/AppMessageBox.h>
#include <KaReport/ApplicationTitle.h>
#include <KaReport/Clock.h>
#include <KaReport/DefaultPrinter.h>
#include <KaReport/EditorLauncher.h>
#include <KaReport/Folders.h>
#include <KaReport/Language.h>
#include <KaReport/Preferences.h>
#include <KaReport/Profile.h>
#include <KaReport/SaveDialog.h>
#include <KaReport/UPreviewDlg.h>
#include <KaReport/Xlate.h>

#include <QDir>
#include <QFileInfo>

QString GetLibraryDir(bool /*reserved*/)
{
    return QStringLiteral(HOST_TEMPLATES);
}

QString GetStartPathName()
{
    return QDir::currentPath();
}

QString GetTempDir(bool /*reserved*/)
{
    return QDir::tempPath();
}

int IsFileExisting(const QString &path)
{
    return QFileInfo(path).isFile() ? 1 : 0;
}

QString GetInitialOpenDir(const QString & /*key*/)
{
    return QString();
}

void SetLastOpenDir(const QString & /*path*/, const QString & /*key*/) {}

QString GetProfileString(const QString & /*section*/, const QString & /*entry*/, const QString &fallback)
{
    return fallback;
}

void WriteProfileString(const QString & /*section*/, const QString & /*entry*/, const QString & /*value*/) {}

unsigned GetReportFontSize()
{
    return 8;
}

bool IsReportPrinterSetToPortrait()
{
    return true;
}

void SetReportPrinterSetToPortrait(bool /*portrait*/) {}

int GetUsePreferredReportEditorFlag()
{
    return 0;
}

QString GetPreferredReportEditorRegKey()
{
    return QStringLiteral("Editor");
}

bool UPreviewDlg::IsModulePrinterOrientationPortrait()
{
    return true;
}

void UPreviewDlg::SetModulePrinterOrientationPortrait(bool /*portrait*/) {}

QString GetApplicationTitle()
{
    return QStringLiteral("TALVEN of our own");
}

QString Xlate(const char *text)
{
    const QString whole = QString::fromUtf8(text);
    return whole.section(QStringLiteral("@@"), 0, 0);
}

MessageAnswer AppMessageBox(const QString & /*text*/, MessageButtons /*buttons*/)
{
    return MessageAnswer::Cancel;
}

MessageAnswer AppMessageBox(unsigned /*number*/, unsigned /*type*/, unsigned /*help*/)
{
    return MessageAnswer::Cancel;
}

namespace kareport
{

QDateTime currentTime()
{
    return QDateTime(QDate(2001, 2, 3), QTime(4, 5));
}

const DefaultPrinter &defaultPrinter()
{
    static const DefaultPrinter printer = {PrinterSource::BuiltIn, PaperSize::A4};
    return printer;
}

void setDefaultPrinter(const DefaultPrinter & /*printer*/) {}

QStringList inAllLanguages(const char *text)
{
    return {Xlate(text)};
}

void launchEditor(const QString & /*program*/, const QString & /*file*/, const QString & /*folder*/,
                  UDocument * /*document*/)
{}

MessageAnswer showMessage(const Message & /*message*/)
{
    return MessageAnswer::Cancel;
}

std::optional<QString> askSaveName(const SaveRequest & /*request*/)
{
    return std::nullopt;
}

void saySaveFailed(const QString & /*path*/, const QString & /*reason*/) {}

} // namespace kareport
