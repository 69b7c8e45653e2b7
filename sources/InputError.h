#pragma once

#include "TextPlaces.h"

#include <QString>

#include <optional>
#include <variant>

namespace kareport
{

/// What is wrong with an input, and where.
struct InputError
{
    QString file;
    std::optional<TextPlace> place; ///< nothing when the whole file is meant
    QString text;                   ///< one sentence that says what was expected

    /// "file:line:column: error: text", without the parts that are not known.
    QString message() const;
    /// The same with another word in place of "error".
    QString messageAs(const QString &word) const;
};

/// What was read, or what was wrong with it.
template <typename T>
using Expected = std::variant<T, InputError>;

template <typename T>
const InputError *errorOf(const Expected<T> &result)
{
    return std::get_if<InputError>(&result);
}

} // namespace kareport
