#pragma once

#include <QString>

#include <vector>

/// A variable of a dictionary.
struct sXmlReportVariable
{
    QString VariableName;
    qint32 ID = 0;
    qint32 Type = 0; ///< a `VARIABLE_TYPE`
};

/// Gives variable names their identifiers and value types.
struct sXmlReportDictionary
{
    QString DictionaryName;
    std::vector<sXmlReportVariable> Variables;
};
