#include "Preferences.h"

#include "Profile.h"

namespace
{

const QString fontSizeEntry = QStringLiteral("ReportFontSize");
const QString portraitEntry = QStringLiteral("ReportPortrait");
const QString useEditorEntry = QStringLiteral("UsePreferredReportEditor");
constexpr unsigned usualFontSize = 8;

} // namespace

unsigned GetReportFontSize()
{
    const unsigned size = GetProfileString(QString(), fontSizeEntry).toUInt();
    return size == 0 ? usualFontSize : size;
}

void SetReportFontSize(unsigned points)
{
    WriteProfileString(QString(), fontSizeEntry, QString::number(points));
}

bool IsReportPrinterSetToPortrait()
{
    return GetProfileString(QString(), portraitEntry, QStringLiteral("1")) != u"0";
}

void SetReportPrinterSetToPortrait(bool portrait)
{
    WriteProfileString(QString(), portraitEntry, portrait ? QStringLiteral("1") : QStringLiteral("0"));
}

int GetUsePreferredReportEditorFlag()
{
    return GetProfileString(QString(), useEditorEntry) == u"1" ? 1 : 0;
}

void SetUsePreferredReportEditorFlag(bool use)
{
    WriteProfileString(QString(), useEditorEntry, use ? QStringLiteral("1") : QStringLiteral("0"));
}

QString GetPreferredReportEditorRegKey()
{
    return QStringLiteral("PreferredReportEditor");
}
