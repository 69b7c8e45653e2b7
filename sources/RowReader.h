#pragma once

#include "ColumnBinding.h"
#include "InputError.h"
#include "UDataObject.h"

#include <cstddef>
#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// Where a row is in what it is read from.
struct RowPlace
{
    std::size_t start = 0;
    qsizetype line = 1;
};

/// What a source of data does: it reads one row after the other into objects. The columns are known, and bound to
/// variables, when it has been made. Rows are asked for by one thread at a time, which may change.
class RowReader
{
public:
    RowReader() = default;
    virtual ~RowReader() = default;
    RowReader(const RowReader &) = delete;
    RowReader &operator=(const RowReader &) = delete;

    /// Reads the next row into an object, which may hold the values of an earlier row.
    /// @param onlyIds  when not null, the identifiers of the values that are wanted; the object then is a new one
    /// @return false after the last row, and when something is wrong with the row, which `error` says
    virtual bool next(UDataObject &object, const std::vector<unsigned> *onlyIds) = 0;
    /// Goes back to the first row.
    virtual void rewind() = 0;
    const std::optional<InputError> &error() const { return error_; }

    /// Where reading has come to, for showing progress: bytes of a file, rows of a database.
    virtual std::size_t position() const = 0;
    /// How many bytes the last row took.
    virtual std::size_t rowBytes() const = 0;
    /// What went wrong with the source as a whole while it was read: it comes before what is wrong with a row.
    virtual std::optional<InputError> lostBytes() const { return std::nullopt; }

    /// Whether a row can be read again by its place; otherwise rows that are sorted are kept in a temporary file.
    virtual bool canSeek() const { return false; }
    /// The place of the row that was read last.
    virtual RowPlace place() const { return {}; }
    virtual void seek(const RowPlace & /*place*/) {}
    /// Reads the next row again for the place of the value of a variable; that of the row where it has none. Only of a source
    /// that can seek. @param variable  folded
    virtual std::optional<TextPlace> placeOfNext(const QString & /*variable*/) { return std::nullopt; }

    /// Whether the next row may be long in coming, so that waiting for it must end when work is to stop.
    virtual bool mayWait() const { return false; }
    /// Ends a wait for the next row, from any thread: no row follows then.
    virtual void stop() {}

    const std::vector<SourceColumn> &columns() const { return columns_; }
    /// Whether all columns are known. Those of a source that shows them with its rows are known after the last one.
    virtual bool knowsColumns() const { return true; }
    /// The identifiers that values are stored under.
    virtual std::vector<unsigned> ids() const { return binding_.ids(); }
    /// The names of the variables that are read, folded, each once.
    virtual QStringList variables() const { return binding_.variables(); }
    /// The variables that are read, with the columns that they are read from.
    const std::vector<BoundField> &fields() const { return binding_.fields(); }
    /// What messages call the source: its file, or a connection.
    virtual QString name() const = 0;
    /// What is wrong with the columns that were chosen, where the data itself is not.
    const std::optional<ColumnFault> &wrongChoice() const { return wrongChoice_; }
    /// What does not fit together in rows that are sound, as far as they were read.
    const std::vector<InputError> &notes() const { return notes_; }

protected:
    /// The place of a value in a source that has none.
    static std::optional<TextPlace> noPlace() { return std::nullopt; }
    /// Stores the value of a field, and notes once where it takes the place of another one of the row under the same identifier.
    /// @param isShared  another field has the identifier as well
    /// @param store     stores it. @return whether it fits
    /// @param place     says where the value is; nothing where that has no place
    template <typename Store, typename Place>
    bool storeOver(bool isShared, unsigned id, const QString &column, UDataObject &object, const Store &store,
                   const Place &place)
    {
        if (!isShared) {
            return store();
        }
        const UDictEntry *held = object.Find(id);
        const auto before = held != nullptr ? std::make_unique<UDictEntry>(*held) : nullptr;
        if (!store()) {
            return false;
        }
        if (before && isOther(*before, object.Find(id)) && isFirstOver(id)) {
            notes_.push_back({name(), place(), overText(column)});
        }
        return true;
    }

    std::vector<SourceColumn> columns_;
    ColumnBinding binding_;
    std::optional<ColumnFault> wrongChoice_;
    std::optional<InputError> error_;
    std::vector<InputError> notes_;

private:
    static bool isOther(const UDictEntry &before, const UDictEntry *now);
    static QString overText(const QString &column);
    bool isFirstOver(unsigned id);

    std::vector<unsigned> notedIds_;
};

} // namespace kareport
