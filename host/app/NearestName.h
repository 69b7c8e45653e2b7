#pragma once

#include <QString>
#include <QStringList>
#include <QStringView>

namespace kareport
{

/// The known name that was probably meant by a misspelt one, without regard to case: a few letters are wrong, or one of
/// the two is the beginning of the other. Empty when none is near. Of names that are equally near, the first.
QString nearestName(QStringView misspelt, const QStringList &known);

/// A question such as `did you mean "Elevation"?`, or empty when no name is near.
QString didYouMean(QStringView misspelt, const QStringList &known);

/// A sentence with such a question after it, where a name is near: `there is no "Elev": did you mean "Elevation"?`
QString withQuestion(const QString &sentence, QStringView misspelt, const QStringList &known);

/// A sentence with what would have been right after it: the nearest name as a question, or else all of them. Nothing is added
/// where there are no names.
QString withExpected(const QString &sentence, QStringView misspelt, const QStringList &known);

/// A text for a message, with an ellipsis in place of what is beyond a number of characters. No character outside the basic
/// plane is halved.
QString shortened(const QString &text, qsizetype most);

/// What would have been right: `one of m, ft was expected`, or `none` where there are no names, with a question after it
/// where a name is near.
QString oneOfExpected(QStringView given, const QStringList &known);

} // namespace kareport
