#pragma once

#include "JobReader.h"
#include "UJobSettings.h"

#include <QMargins>
#include <QString>

namespace kareport
{

/// What the user has chosen for all reports.
struct DeskPreferences
{
    UJobSettings settings;
    unsigned fontSize = 8; ///< points
    QMargins margins;      ///< hundredths of a millimetre
    bool portrait = true;
    bool usesEditor = false;
    QString editor;             ///< full path
    bool keepsForEditor = true; ///< a report cannot be closed while the editor is open
    QString language;           ///< such as "de"; empty for the system's

    /// What jobs are made with where they do not say otherwise.
    JobDefaults jobDefaults() const;
};

/// Reads the preferences from the user's profile. An entry that cannot be understood counts as not chosen.
DeskPreferences loadPreferences();
void savePreferences(const DeskPreferences &preferences);

} // namespace kareport
