#include "DeskPreferences.h"

#include "JobSettings.h"
#include "PageDefaults.h"
#include "Preferences.h"
#include "Profile.h"
#include "ReportMargins.h"

#include <QJsonDocument>

namespace kareport
{

namespace
{

const QString settingsEntry = QStringLiteral("Job Settings");
const QString marginsEntry = QStringLiteral("Report Margins");
const QString keepEntry = QStringLiteral("KeepReportForEditor");
const QString languageEntry = QStringLiteral("Language");

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

} // namespace

JobDefaults DeskPreferences::jobDefaults() const
{
    JobDefaults defaults;
    defaults.settings = settings;
    defaults.page.portrait = portrait;
    defaults.page.margins = margins;
    defaults.page.fontSize = static_cast<int>(fontSize);
    return defaults;
}

DeskPreferences loadPreferences()
{
    DeskPreferences preferences;
    preferences.settings = settingsFromText(GetProfileString(QString(), settingsEntry));
    preferences.fontSize = GetReportFontSize();
    preferences.margins = marginsFromText(GetProfileString(QString(), marginsEntry), defaultMargins);
    preferences.portrait = IsReportPrinterSetToPortrait();
    preferences.usesEditor = GetUsePreferredReportEditorFlag() != 0;
    preferences.editor = GetProfileString(QString(), GetPreferredReportEditorRegKey());
    preferences.keepsForEditor = GetProfileString(QString(), keepEntry) != u"0";
    preferences.language = GetProfileString(QString(), languageEntry);
    return preferences;
}

void savePreferences(const DeskPreferences &preferences)
{
    WriteProfileString(
        QString(), settingsEntry,
        QString::fromUtf8(QJsonDocument(settingsToJson(preferences.settings)).toJson(QJsonDocument::Compact)));
    SetReportFontSize(preferences.fontSize);
    WriteProfileString(QString(), marginsEntry, marginsToText(preferences.margins));
    SetReportPrinterSetToPortrait(preferences.portrait);
    SetUsePreferredReportEditorFlag(preferences.usesEditor);
    WriteProfileString(QString(), GetPreferredReportEditorRegKey(), preferences.editor);
    WriteProfileString(QString(), keepEntry, preferences.keepsForEditor ? QStringLiteral("1") : QStringLiteral("0"));
    WriteProfileString(QString(), languageEntry, preferences.language);
}

} // namespace kareport
