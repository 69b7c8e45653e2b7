#pragma once

#include <QStringList>

#include <cstddef>
#include <optional>

class QWidget;

namespace kareport
{

/// Asks which of several tables a file has the rows of. @return its place; nothing when the user wants none
std::optional<std::size_t> askExportedTable(QWidget *parent, const QStringList &tables);

} // namespace kareport
