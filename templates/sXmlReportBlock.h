#pragma once

#include "sXmlReportField.h"

/// A block of a template: one line for each field of one object.
struct sXmlReportBlock
{
    QString Name;
    QString Use; ///< the name of its dictionary
    sXmlReportFields Fields;
};
