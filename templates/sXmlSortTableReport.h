#pragma once

#include <QString>

#include <vector>

/// One sort key of a table.
struct sXmlSortVariable
{
    QString VariableName; ///< of the table's dictionary
    quint32 ID = 0;       ///< identifier from the dictionary; 0 until merged
};

/// The sort keys of a table; there is a record only for tables that have keys.
struct sXmlSortTableReport
{
    QString Name;                          ///< the table's name
    QString Use;                           ///< the name of the table's dictionary
    std::vector<sXmlSortVariable> Entries; ///< the first decides first
};
