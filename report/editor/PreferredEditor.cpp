#include "PreferredEditor.h"

#include "Folders.h"
#include "Preferences.h"
#include "Profile.h"

namespace kareport
{

QString preferredEditor()
{
    return GetUsePreferredReportEditorFlag() != 0 ? GetProfileString(QString(), GetPreferredReportEditorRegKey())
                                                  : QString();
}

QString availableEditor()
{
    const QString editor = preferredEditor();
    return IsFileExisting(editor) != 0 ? editor : QString();
}

} // namespace kareport
