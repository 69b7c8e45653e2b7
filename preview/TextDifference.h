#pragma once

#include <QString>

namespace kareport
{

/// The shortest piece of a text that another one differs in.
struct TextDifference
{
    qsizetype at = 0;
    qsizetype removed = 0;
    QString inserted;
};
TextDifference differenceOf(const QString &before, const QString &after);

} // namespace kareport
