#pragma once

#include "DataRemarks.h"
#include "JobNotes.h"
#include "NameQuestions.h"
#include "RowList.h"
#include "sXmlReportDictionary.h"
#include "sXmlReportField.h"

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <cstddef>
#include <functional>
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
                      ///< instead; of several, that of the last column; empty for none
};

/// The names of the variables of a dictionary, in its order.
QStringList variableNames(const sXmlReportDictionary &dictionary);

/// What the columns of a data set and a dictionary have in common. Both must live longer.
class ColumnComparison
{
public:
    /// @param data       the name of the data set
    /// @param questions  of all steps of a job; must live longer
    ColumnComparison(const SourceColumns &columns, const sXmlReportDictionary &dictionary, const QString &data,
                     NameQuestions &questions);

    /// Whether a variable is read from a column.
    bool isRead(const QString &variable) const;

    /// Says something about a name that the job gives to a column, with its place there. @param column  its index
    using AtName = std::function<InputError(ColumnNamer namer, std::size_t column, const QString &text)>;
    /// Notes on the columns that are not variables of the dictionary. Of very many, the last note says how many more there are.
    std::vector<JobNote> unknownColumns(const AtName &atName) const;

    /// The keys of the units that numbers of the data are taken to be in, as the job does not say them.
    QStringList assumedUnits(const DataUnits &units) const;

    /// The fields of a table or block whose variable is read from no column, or is not in the dictionary, each variable once.
    std::vector<UnfilledField> unfilledFields(const sXmlReportFields &fields) const;

private:
    bool isUnknown(const SourceColumn &column) const;
    QString shownInstead(const sXmlReportVariable &variable) const;
    QString variableQuestion(const QString &name) const;
    QString columnQuestion(const QString &name) const;

    const SourceColumns &columns_;
    const sXmlReportDictionary &dictionary_;
    QString data_;
    NameQuestions &questions_;
    QSet<QString> read_;                                      ///< the folded names of the variables that are read
    QHash<QString, const sXmlReportVariable *> variables_;    ///< by their folded names; of several the last one
    QMultiHash<qint32, const sXmlReportVariable *> readById_; ///< those that are read
};

} // namespace kareport
