#pragma once

#include "UPointNumber.h"
#include "ValueKind.h"

#include <QString>

#include <cstddef>
#include <type_traits>
#include <variant>

/// A value of a data object with the number that says what kind it is.
class UDictEntry
{
public:
    /// The kinds of values, in the order of their numbers.
    using Value = std::variant<bool, qint16, qint32, double, QString, UPointNumber>;

    /// An entry that is false until it gets a value.
    explicit UDictEntry(unsigned id) : id_(id) {}
    /// A value under an identifier.
    UDictEntry(unsigned id, Value value) : id_(id), value_(std::move(value)) {}

    /// The identifier under which a dictionary holds the entry.
    unsigned GetId() const { return id_; }
    /// What `GetData` points to: 1 a boolean byte, 2 a 16-bit integer, 4 a 32-bit integer, 8 a double, 16 a `QString`,
    /// 32 a `UPointNumber`.
    int GetKind() const { return static_cast<int>(kind()); }
    /// The same as the kind that it is.
    kareport::ValueKind kind() const { return static_cast<kareport::ValueKind>(1 << value_.index()); }
    /// The value itself; valid as long as the entry is not changed.
    const void *GetData() const
    {
        return std::visit([](const auto &held) -> const void * { return &held; }, value_);
    }

    /// The value with its kind.
    const Value &value() const { return value_; }
    /// The value, to be changed in place; it may become one of another kind.
    Value &value() { return value_; }

private:
    unsigned id_;
    Value value_;
};

namespace kareport
{

/// Whether the kind of an entry, which is made of the place of its type among those of the variant, is that of the type.
template <typename Type, std::size_t place, ValueKind kind>
constexpr bool isKindOf =
    std::is_same_v<std::variant_alternative_t<place, UDictEntry::Value>, Type> && 1 << place == static_cast<int>(kind);

static_assert(isKindOf<bool, 0, ValueKind::Boolean> && isKindOf<qint16, 1, ValueKind::Int16> &&
              isKindOf<qint32, 2, ValueKind::Int32> && isKindOf<double, 3, ValueKind::Double> &&
              isKindOf<QString, 4, ValueKind::Text> && isKindOf<UPointNumber, 5, ValueKind::PointNumber>);

} // namespace kareport
