#pragma once

#include "ColumnBinding.h"
#include "InputError.h"
#include "UDataObjectList.h"

#include <QString>
#include <QStringList>

#include <cstddef>
#include <functional>
#include <optional>
#include <vector>

namespace kareport
{

/// Is told now and then how far reading has come, in the unit that the source counts in. @return false to stop
using ReadProgress = std::function<bool(std::size_t done)>;

/// The columns of a data source, for code that says which of them are not read.
struct SourceColumns
{
    QString source; ///< what messages call the source: its file, or a connection
    std::vector<SourceColumn> columns;
    QStringList variables; ///< the names of the variables that are read, folded, each once
};

/// Where a value was read from.
struct ValuePlace
{
    QString file;                                  ///< what messages call the source; empty where it is not known
    std::optional<TextPlace> place = std::nullopt; ///< that of the row where it has no value; nothing for a database
};

/// The rows of a data source as data objects, made while they are asked for in order. When something is wrong with a row, or
/// reading is stopped, the list ends there.
class RowList : public UDataObjectList
{
public:
    /// What is wrong with the source or with the row after the last one; nothing when the rows are all good, or reading was
    /// stopped. Asked when the list has been made, when it has been sorted and when it has come to its end.
    virtual std::optional<InputError> error() const = 0;

    /// The columns; nothing while they are not known, as those of a source that shows them with its rows are known after the
    /// last one only. Asked when the list has been made and when it has come to its end.
    virtual std::optional<SourceColumns> columns() const { return std::nullopt; }

    /// Where the value of a variable of a row was read from. Asked when the list has come to its end; rows that are asked for
    /// after that are read again.
    /// @param index  of the row, in the order that the list has
    virtual ValuePlace placeOf(std::size_t /*index*/, const QString & /*variable*/) { return {}; }

    /// What there is to say of a source whose rows are sound. One with a place tells what does not fit together in the
    /// source, one without what the source holds that no list reads. Nothing before the list has come to its end.
    virtual std::vector<InputError> notes() const { return {}; }
    /// What does not fit together in the rows of a source, whether it has places or not. Nothing before the list has come to its
    /// end.
    virtual std::vector<InputError> differences() const { return {}; }
};

} // namespace kareport
