#pragma once

#include "DataRemarks.h"
#include "JobNotes.h"
#include "RowList.h"
#include "sXmlReportDictionary.h"
#include "sXmlReportField.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

namespace kareport
{

/// Where the steps of a job put their notes.
struct StepNotes
{
    JobNotes &notes;
    bool isStrict;              ///< a note is an error
    const DataRemarks &remarks; ///< on the table that was written last

    /// @return the first of these notes, when it is an error
    std::optional<InputError> add(const std::vector<JobNote> &found) const;
};

/// A field that shows nothing of any row.
struct UnfilledField
{
    QString variable;
    QString question; ///< which column or variable may have been meant, as a question; empty for none
    bool isVariable;  ///< of the dictionary
    QString shown;    ///< the variable that a column fills and that has the same identifier, so that its value is shown
                      ///< instead; empty for none
};

/// The names of the variables of a dictionary, in its order.
QStringList variableNames(const sXmlReportDictionary &dictionary);

/// Whether a variable is read from a column.
bool isRead(const SourceColumns &columns, const QString &variable);

/// Notes on the columns that are no variable of a dictionary. Of very many, the last note says how many more there are.
std::vector<JobNote> unknownColumns(const SourceColumns &columns, const sXmlReportDictionary &dictionary);

/// The keys of the units that numbers of the data are taken to be in, as the job does not say them.
QStringList assumedUnits(const SourceColumns &columns, const sXmlReportDictionary &dictionary, const DataUnits &units);

/// The fields of a table or block whose variable is read from no column, or is not in the dictionary, each variable once.
std::vector<UnfilledField> unfilledFields(const SourceColumns &columns, const sXmlReportFields &fields,
                                          const sXmlReportDictionary &dictionary);

} // namespace kareport
