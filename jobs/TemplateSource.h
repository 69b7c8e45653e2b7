#pragma once

#include "InputError.h"
#include "TemplateFile.h"

#include <optional>

namespace kareport
{

/// A larger file is not read as a template.
inline constexpr qint64 largestTemplateFile = qint64(64) << 20;

/// Whether a path can be a template file: what is wrong when it is none, or one that is far too large.
std::optional<InputError> wrongTemplateSource(const QString &path);

/// Reads a template file for being looked at. A file that cannot be read, is empty or far too large is an error.
Expected<TemplateFile> readTemplateSource(const QString &path);

/// Why a template of a name cannot be loaded from a file that was read: the first thing in it that keeps a template
/// from being read, or that it has no template of that name.
InputError whyNotLoaded(const QString &path, const TemplateFile &file, const QString &name);

} // namespace kareport
