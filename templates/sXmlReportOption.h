#pragma once

/// The page options of a template.
struct sXmlReportOption
{
    char Separator = ' ';   ///< column separator, Latin-1; 0 for a template that names none
    bool PageBreaks = true; ///< "NO" switches them off
};
