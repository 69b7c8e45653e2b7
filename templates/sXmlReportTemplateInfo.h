#pragma once

#include <QString>

/// A template of a template file.
struct sXmlReportTemplateInfo
{
    QString Name;
    QString Title;
};
