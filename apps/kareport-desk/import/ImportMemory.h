#pragma once

#include <QJsonObject>
#include <QString>

#include <optional>

namespace kareport
{

/// What the user chose for a file of a shape when it was imported last; nothing where there was none.
std::optional<QJsonObject> rememberedImport(const QString &shape);
/// Keeps it in the user's profile. Of many shapes, those that were not chosen for the longest time are forgotten.
void rememberImport(const QString &shape, const QJsonObject &options);

} // namespace kareport
