#pragma once

#include <QString>
#include <QStringView>

namespace kareport
{

/// The widest of the texts that a field has shown.
struct WidestText
{
    static constexpr qsizetype mostKept = 80;

    qsizetype width = -1; ///< characters; -1 before the first text
    QString text;         ///< its first 80 characters

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
