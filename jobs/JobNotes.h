#pragma once

#include "InputError.h"

#include <QByteArray>
#include <QHash> // std::hash<QString>
#include <QString>

#include <optional>
#include <unordered_set>
#include <vector>

namespace kareport
{

/// What the user should know of a report that is made all the same: something of the data or the template that does not
/// come together.
struct JobNote
{
    enum class Kind
    {
        UnknownColumn, ///< a column that is not a variable, so that it is not read
        UnfilledField, ///< a field whose variable is in no column or no dictionary, so that it shows nothing or zero
        WideValue,     ///< values wider than their column
        MissingValue,  ///< values that are not there and show as 0
        BlankValue, ///< numbers that are not there and show as blanks, as the job asks for: for the file of notes alone
        NotFinite,  ///< values that are infinite or not-a-number
        UnknownSortKey, ///< a sort key of a table that is in no dictionary, so that the rows are sorted by another one
        NotInTotal,     ///< values that are missing, infinite or not-a-number, so that they are in no total
        UnshownCharacter, ///< a character of the report that an output cannot show
        Difference,       ///< what does not fit together in the data itself
        PassedOver,       ///< what a data file holds and no list reads: said, but no mistake of anybody
        AssumedUnit ///< a unit of the data that the job does not say: for the file of notes alone, no reason to say anything
    };
    Kind kind;
    InputError about;      ///< the place and the text
    qint64 line = 0;       ///< of the report, from 1; 0 for none
    quint64 values = 0;    ///< how many values are meant; 0 for none
    quint64 firstRow = 0;  ///< of the data as it is printed, from 1; 0 for none
    QString dataFile = {}; ///< what the value of that row was read from; empty where it is not known
    std::optional<TextPlace> dataPlace = std::nullopt; ///< where it is there; nothing for a database

    /// Whether the user has to look at it.
    bool isToBeSaid() const { return kind != Kind::AssumedUnit && kind != Kind::BlankValue; }
    /// Whether it is an error in a strict job.
    bool isMistake() const { return isToBeSaid() && kind != Kind::PassedOver; }
    /// "file:line:column: note: text", without the parts that are not known.
    QString message() const;
};

/// The notes on a report, each once.
class JobNotes
{
public:
    /// Adds a note, unless it is there already.
    void add(const JobNote &note);
    const std::vector<JobNote> &all() const { return notes_; }
    /// Those that are to be said.
    std::vector<JobNote> said() const;
    /// A JSON list of the notes as objects with "kind", "file", "line", "column", "text", and for values "count", "row",
    /// "reportLine", "dataFile", "dataLine" and "dataColumn", in UTF-8.
    QByteArray toJson() const;

private:
    std::vector<JobNote> notes_;
    std::unordered_set<QString> messages_;
};

} // namespace kareport
