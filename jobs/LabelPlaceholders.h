#pragma once

#include "InputError.h"

#include <QString>

#include <optional>

namespace kareport
{

/// The first thing that is wrong with the placeholders in the labels of a template, with its place in the file; nothing when
/// all are known, or the file has no such template.
std::optional<InputError> wrongLabelPlaceholder(const QString &path, const QString &name);

} // namespace kareport
