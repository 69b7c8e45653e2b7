#pragma once

#include "UPointNumber.h"

#include <QString>

#include <variant>

/// A value of a data object with the number that says what kind it is.
class UDictEntry
{
public:
    using Value = std::variant<bool, qint16, qint32, double, QString, UPointNumber>;

    UDictEntry(unsigned id, Value value) : id_(id), value_(std::move(value)) {}

    /// The identifier under which a dictionary holds the entry.
    unsigned GetId() const { return id_; }
    /// What `GetData` points to: 1 a boolean byte, 2 a 16-bit integer, 4 a 32-bit integer, 8 a double, 16 a `QString`,
    /// 32 a `UPointNumber`.
    int GetKind() const { return 1 << value_.index(); }
    /// The value itself; valid as long as the entry is not changed.
    const void *GetData() const
    {
        return std::visit([](const auto &held) -> const void * { return &held; }, value_);
    }

    const Value &value() const { return value_; }
    Value &value() { return value_; }

private:
    unsigned id_;
    Value value_;
};
