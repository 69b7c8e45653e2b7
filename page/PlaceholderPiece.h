#pragma once

#include <QString>
#include <QStringList>
#include <QStringView>

namespace kareport
{

/// A piece of a text with placeholders such as {count}: characters, or one placeholder. "{{" is the character "{".
struct PlaceholderPiece
{
    enum class Kind
    {
        Text,
        Placeholder,
        Unended ///< a brace that begins a placeholder, and all that follows it
    };
    Kind kind;
    QStringView text; ///< of a placeholder, its name
    qsizetype end;    ///< where the next piece begins
};

/// The piece that begins at a place of a text. @param at  from 0, less than the length of the text
PlaceholderPiece placeholderPieceAt(QStringView text, qsizetype at);

/// A name as it stands in a text: in braces.
QString inBraces(QStringView name);

/// What is wrong with a placeholder that does not end, as a sentence that says what was expected.
/// @param rest  the text from its brace on
QString unendedPlaceholder(QStringView rest);
/// What is wrong with a placeholder of a name that is not known. @param known  the names that are, in braces
QString unknownPlaceholder(QStringView name, const QStringList &known);

} // namespace kareport
