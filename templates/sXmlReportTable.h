#pragma once

#include "sXmlReportField.h"

/// A table of a template: one row for each object under a heading.
struct sXmlReportTable
{
    QString Name;            ///< by which it is written
    QString Use;             ///< the name of its dictionary
    sXmlReportFields Fields; ///< a column of the table each, from the left
};
