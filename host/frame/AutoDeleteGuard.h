#pragma once

#include "UDocument.h"
#include "ValueGuard.h"

namespace kareport
{

/// Keeps a document when its last view is destroyed. It must live as long as the guard.
inline auto withoutAutoDelete(UDocument &document)
{
    return ValueGuard(document.IsAutoDelete(), false, [&document](bool on) { document.SetAutoDelete(on); });
}

} // namespace kareport
