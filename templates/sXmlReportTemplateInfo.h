#pragma once

#include <QString>

/// A template of a template file.
struct sXmlReportTemplateInfo
{
    QString Name;  ///< by which it is loaded
    QString Title; ///< of the reports that are written through it
};
