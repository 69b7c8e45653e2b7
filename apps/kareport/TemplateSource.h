#pragma once

#include "InputError.h"
#include "TemplateFile.h"

namespace kareport
{

/// A template file larger than this is taken for something else.
inline constexpr qint64 largestTemplateFile = qint64(64) << 20;

/// Reads a template file for being looked at. A file that cannot be read, is empty or far too large is an error.
Expected<TemplateFile> readTemplateSource(const QString &path);

/// Why a template of a name cannot be loaded from a file that was read: the first thing in it that keeps a template
/// from being read, or that it has no template of that name.
InputError whyNotLoaded(const QString &path, const TemplateFile &file, const QString &name);

} // namespace kareport
