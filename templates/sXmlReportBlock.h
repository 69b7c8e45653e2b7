#pragma once

#include "sXmlReportField.h"

/// A block of a template: one line for each field of one object.
struct sXmlReportBlock
{
    QString Name;            ///< by which it is written
    QString Use;             ///< the name of its dictionary
    sXmlReportFields Fields; ///< a line of the block each, in order
};
