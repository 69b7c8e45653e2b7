#pragma once

#include <string>

namespace kareport
{

/// How the numbers of a text are written.
struct NumberStyle
{
    char decimal = '.';    ///< a point or a comma
    std::string thousands; ///< between groups of three digits before the decimal mark: one character in UTF-8, or none

    /// Whether a number is written as in most files, with a decimal point and no thousands.
    bool isPlain() const { return decimal == '.' && thousands.empty(); }
};

} // namespace kareport
