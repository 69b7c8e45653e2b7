#pragma once

#include <QString>
#include <QStringView>

namespace kareport
{

/// The widest of the texts that a field has shown.
struct WidestText
{
    /// Characters of a text that are kept: a longer one is known by its beginning.
    static constexpr qsizetype mostKept = 80;

    qsizetype width = -1; ///< characters; -1 before the first text
    QString text;         ///< its first `mostKept` characters

    /// Takes a text that is wider than all before it. @return whether it is
    bool take(QStringView other)
    {
        if (other.size() <= width) {
            return false;
        }
        text = other.left(mostKept).toString();
        width = other.size();
        return true;
    }
};

} // namespace kareport
