#pragma once

#include <QString>

#include <vector>

/// A variable of a dictionary.
struct sXmlReportVariable
{
    QString VariableName; ///< by which fields and sort keys name it
    qint32 ID = 0;        ///< under which data objects hold its value
    qint32 Type = 0;      ///< a `VARIABLE_TYPE`
};

/// Gives variable names their identifiers and value types.
struct sXmlReportDictionary
{
    QString DictionaryName;                    ///< by which tables and blocks name it
    std::vector<sXmlReportVariable> Variables; ///< in file order
};
