#pragma once

#include <QString>
#include <QStringList>

namespace kareport
{

/// What can be written at a place of a template.
struct Completions
{
    qsizetype begin = 0;  ///< where the word begins that has been written so far
    QStringList words;    ///< none where nothing is known; those of the author come before those that are always there
    bool areTags = false; ///< they are names of elements, written after "<" or "</"
};

/// @param position  of the cursor in the text
Completions completionsAt(const QString &text, qsizetype position);

/// The elements that are open at a place of a text, the innermost last, in their usual spelling. Tags in comments do not count.
QStringList openElementsAt(const QString &text, qsizetype position);

} // namespace kareport
