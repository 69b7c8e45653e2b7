#pragma once

#include <QString>

#include <vector>

/// One output field of a template's table or block.
struct sXmlReportField
{
    QString VariableName; ///< a variable of the dictionary, or a marker: "FILLER", "SUFFIX_R", "SUFFIX_+"
    QString Label;        ///< column heading (tables), text before the value (blocks)
    qint32 Width = 0;     ///< column width in characters
    qint32 Decimals = 0;  ///< 0 when the format gives none
    QString Align;        ///< "L", "C" or "R"
    qint32 ID = 0;        ///< identifier from the dictionary; -1 until merged
    qint32 Type = 0;      ///< value type code from the dictionary; -1 until merged
};

/// The fields of a table or block, in order.
using sXmlReportFields = std::vector<sXmlReportField>;
