#pragma once

#include "ReportModel.h"
#include "ReportSteps.h"
#include "TemplateMarkup.h"
#include "UReportDoc.h"

/// A template with tables and a block, and what a report and its model write through it.
class ModelledTemplate
{
public:
    /// Loads the template into a report.
    explicit ModelledTemplate(UReportDoc &report);

    /// Writes a list of points as a table. @return what the report answered
    bool writeTable(ReportModel &model, const ReportStep &step);
    /// Writes a site as a block. @return what the report answered
    bool writeBlock(ReportModel &model, const ReportStep &step);

private:
    TemplateFolders folders_;
    UReportDoc &report_;
};
