#pragma once

#include "KaReportExport.h"

#include <QStringView>

namespace kareport
{

/// Whether a file name ends with an extension (".rtf", in small letters), in any case. The first occurrence of the
/// extension decides: a name that holds it earlier as well does not count as ending with it.
KAREPORT_EXPORT bool endsWithExtension(QStringView name, QStringView extension);

} // namespace kareport
