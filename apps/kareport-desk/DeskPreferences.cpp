#include "DeskPreferences.h"

#include "CountryPaper.h"
#include "DefaultPrinter.h"
#include "JobSettings.h"
#include "PageDefaults.h"
#include "Preferences.h"
#include "Profile.h"
#include "ReportMargins.h"

#include <QJsonDocument>
#include <QLocale>
#include <QPageSize>

namespace kareport
{

namespace
{

const QString settingsEntry = QStringLiteral("Job Settings");
const QString keepEntry = QStringLiteral("KeepReportForEditor");
const QString paperEntry = QStringLiteral("Paper");
const QString unitEntry = QStringLiteral("Unit of Margins");
const QString languageEntry = QStringLiteral("Language");
const QString reportWindowsEntry = QStringLiteral("KeepReportWindows");
const QString sessionEntry = QStringLiteral("RestoreSession");

void writeFlag(const QString &entry, bool on)
{
    WriteProfileString(QString(), entry, on ? QStringLiteral("1") : QStringLiteral("0"));
}

UJobSettings settingsFromText(const QString &text)
{
    const auto read = JsonSource::fromBytes(settingsEntry, text.toUtf8());
    const auto *source = std::get_if<JsonSource>(&read);
    if (source == nullptr) {
        return {};
    }
    std::optional<InputError> error;
    const UJobSettings settings = readSettings(JsonNode(*source, error));
    return error ? UJobSettings() : settings;
}

/// The sheets that are kept, by their names in the profile.
QSize paperOf(const QString &key)
{
    for (const auto id : {QPageSize::A4, QPageSize::A3, QPageSize::Letter, QPageSize::Legal}) {
        if (QPageSize::key(id) == key) {
            return QPageSize(id).sizePoints();
        }
    }
    return {};
}

} // namespace

JobDefaults DeskPreferences::jobDefaults() const
{
    JobDefaults defaults;
    defaults.settings = settings;
    defaults.page.portrait = portrait;
    defaults.page.printer.paper = paperOfCountry(QLocale::system());
    defaults.page.printer.sheet = paper;
    defaults.page.printer.replacesPrinter = true;
    defaults.page.margins = margins;
    defaults.page.fontSize = static_cast<int>(fontSize);
    return defaults;
}

DeskPreferences loadPreferences()
{
    DeskPreferences preferences;
    preferences.settings = settingsFromText(GetProfileString(QString(), settingsEntry));
    preferences.fontSize = GetReportFontSize();
    preferences.margins = profileMargins(defaultMargins).value_or(defaultMargins);
    preferences.portrait = IsReportPrinterSetToPortrait();
    preferences.paper = paperOf(GetProfileString(QString(), paperEntry));
    const QString unit = GetProfileString(QString(), unitEntry);
    preferences.inInches = unit.isEmpty() ? measuresInInches(QLocale::system()) : unit == u"in";
    preferences.usesEditor = GetUsePreferredReportEditorFlag() != 0;
    preferences.editor = GetProfileString(QString(), GetPreferredReportEditorRegKey());
    preferences.keepsForEditor = GetProfileString(QString(), keepEntry) != u"0";
    preferences.language = GetProfileString(QString(), languageEntry);
    preferences.keepsReportWindows = GetProfileString(QString(), reportWindowsEntry) == u"1";
    preferences.restoresSession = GetProfileString(QString(), sessionEntry) == u"1";
    return preferences;
}

void saveKeepsReportWindows(bool keeps)
{
    writeFlag(reportWindowsEntry, keeps);
}

void savePreferences(const DeskPreferences &preferences)
{
    WriteProfileString(
        QString(), settingsEntry,
        QString::fromUtf8(QJsonDocument(settingsToJson(preferences.settings)).toJson(QJsonDocument::Compact)));
    SetReportFontSize(preferences.fontSize);
    setProfileMargins(preferences.margins);
    SetReportPrinterSetToPortrait(preferences.portrait);
    WriteProfileString(QString(), paperEntry,
                       preferences.paper.isEmpty() ? QString() : QPageSize(preferences.paper).key());
    WriteProfileString(QString(), unitEntry, preferences.inInches ? QStringLiteral("in") : QStringLiteral("mm"));
    SetUsePreferredReportEditorFlag(preferences.usesEditor);
    WriteProfileString(QString(), GetPreferredReportEditorRegKey(), preferences.editor);
    saveKeepsReportWindows(preferences.keepsReportWindows);
    writeFlag(sessionEntry, preferences.restoresSession);
    writeFlag(keepEntry, preferences.keepsForEditor);
    WriteProfileString(QString(), languageEntry, preferences.language);
}

void usePaper(const DeskPreferences &preferences)
{
    DefaultPrinter printer = defaultPrinter();
    printer.paper = paperOfCountry(QLocale::system());
    printer.sheet = preferences.paper;
    printer.replacesPrinter = true;
    setDefaultPrinter(printer);
}

} // namespace kareport
