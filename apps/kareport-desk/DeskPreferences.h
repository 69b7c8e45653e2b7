#pragma once

#include "JobReader.h"
#include "UJobSettings.h"

#include <QMargins>
#include <QSize>
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
    QSize paper;           ///< upright, in points; empty for the country's, or the printer's own
    bool inInches = false; ///< whether margins are shown in inches
    bool usesEditor = false;
    QString editor;                  ///< full path
    bool keepsForEditor = true;      ///< a report cannot be closed while the editor is open
    QString language;                ///< such as "de"; empty for the system's
    bool keepsReportWindows = false; ///< a job's report stays in its report window when it is made
    bool restoresSession = false;    ///< what was open at the end is opened at the next start

    /// What jobs are made with where they do not say otherwise.
    JobDefaults jobDefaults() const;
};

/// Reads the preferences from the user's profile. An entry that cannot be understood counts as not chosen.
DeskPreferences loadPreferences();
void savePreferences(const DeskPreferences &preferences);
/// Makes the chosen paper that of the reports that are made, measured and printed from now on. Where no printer is installed they
/// are printed into a PDF.
void usePaper(const DeskPreferences &preferences);
/// Keeps this choice alone: `DeskPreferences::keepsReportWindows`.
void saveKeepsReportWindows(bool keeps);

} // namespace kareport
