#pragma once

#include "InputError.h"
#include "UDictionary.h"
#include "ValueParser.h"

#include <QString>
#include <QStringList>

#include <algorithm>
#include <cstddef>
#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

/// What a dictionary knows: what finds a variable by its name, and the names of all, which messages choose from.
struct Variables
{
    FindVariable find;
    QStringList names;
    std::optional<QStringList> shown = std::nullopt; ///< those that a report shows; nothing where that is not known
};

/// Says which column a variable is read from: one by its name, without regard to case, or by its number from 1.
struct ColumnChoice
{
    QString variable;
    std::variant<QString, int> column;
};

/// Who names a column.
enum class ColumnNamer
{
    Data,  ///< the data itself, or nobody
    List,  ///< the list of columns that the user gave, which has a name for each column
    Order, ///< the order of columns that the user gave
};

/// A column of a data set.
struct SourceColumn
{
    QString name;                   ///< empty where columns have none
    std::optional<TextPlace> place; ///< of the name in the file
    bool isKnown = false;           ///< some variable is read from it
    bool isOffered = false;         ///< it is not a column of values of the data itself, so that it need not be read
    ColumnNamer namer = ColumnNamer::Data; ///< where it is not the data, the name has no place there
};

/// A variable that is read from a column.
struct BoundField
{
    std::size_t column; ///< index of the column
    QString name;       ///< what messages call it
    ValueParser parser;
    QString variable; ///< its name, as the choice or the column has it
};

/// What is wrong with the choice of columns.
struct ColumnFault
{
    std::optional<std::size_t> column; ///< the column that is meant
    QString choice;                    ///< the variable of the `ColumnChoice` that is meant, empty for none
    QString text;
};

/// The variables that are read from the columns of a data set.
class ColumnBinding
{
public:
    /// Finds the variable of each column. A column that a choice names is read for the variable that chose it; any other
    /// for the variable of its name, unless that has chosen another column. What is left is skipped.
    /// @param columns  known ones are marked
    /// @return what is wrong: a choice of a variable or a column that does not exist, two columns of one variable
    std::optional<ColumnFault> bind(std::vector<SourceColumn> &columns, const std::vector<ColumnChoice> &choices,
                                    const Variables &variables);

    std::vector<BoundField> &fields() { return fields_; }
    const std::vector<BoundField> &fields() const { return fields_; }
    /// The identifiers that values are stored under, each once.
    const std::vector<unsigned> &ids() const { return ids_; }
    /// The names of the variables that are read, folded, each once.
    QStringList variables() const;

    /// Makes an object ready for the values of a row: it may hold those of an earlier one, which none of the cells has to
    /// replace.
    void begin(UDictionary &object) const
    {
        for (const unsigned id : sharedIds_) {
            object.Remove(id);
        }
    }
    /// Whether another field has the identifier as well.
    bool isShared(const BoundField &field) const
    {
        return !sharedIds_.empty() &&
               std::find(sharedIds_.begin(), sharedIds_.end(), field.parser.id()) != sharedIds_.end();
    }
    /// Says that a row has no value for a field. What another field has stored under the identifier stays.
    void storeNone(const BoundField &field, UDictionary &object) const;

private:
    std::optional<ColumnFault> bindChoices(std::vector<SourceColumn> &columns, const std::vector<ColumnChoice> &choices,
                                           const Variables &variables);
    std::optional<ColumnFault> bindNames(std::vector<SourceColumn> &columns, const std::vector<ColumnChoice> &choices,
                                         const Variables &variables);
    void noteIds();

    std::vector<BoundField> fields_;
    std::vector<unsigned> ids_;
    std::vector<unsigned> sharedIds_; ///< identifiers that several fields have
};

/// The names of columns for a message.
QStringList namesOf(const std::vector<SourceColumn> &columns);

} // namespace kareport
