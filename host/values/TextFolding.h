#pragma once

#include <QString>
#include <QStringView>

namespace kareport
{

/// Whether two texts are the same without regard to case, character by character (simple Unicode folding: "ß" is not
/// "ss"). All names are compared so.
bool equalFolded(QStringView left, QStringView right);

/// The text under which names that `equalFolded` takes for the same are found in a hash.
QString foldedKey(QStringView text);

} // namespace kareport
