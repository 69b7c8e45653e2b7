#pragma once

#include <QString>
#include <QStringList>

namespace kareport
{

/// What `--set` is often given, for completion: KEY=VALUE for keys that take one of a few values, and KEY= for those that take
/// any. @param start  only keys that begin with it
QStringList setKeys(const QString &start);

} // namespace kareport
