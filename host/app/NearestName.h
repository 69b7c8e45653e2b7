#pragma once

#include <QString>
#include <QStringList>

namespace kareport
{

/// The known name that was probably meant by a misspelt one, without regard to case: a few letters are wrong, or one of
/// the two is the beginning of the other. Empty when none is near. Of names that are equally near, the first.
QString nearestName(QStringView misspelt, const QStringList &known);

/// A question such as `did you mean "Elevation"?`, or empty when no name is near.
QString didYouMean(QStringView misspelt, const QStringList &known);

} // namespace kareport
