#pragma once

#include <QtCore/qglobal.h>

/// Marks what the shared libraries KaReport and KaReportHost offer to programs outside. Whoever links the layers into itself
/// on a system where that differs defines KAREPORT_STATIC.
#if defined(KAREPORT_BUILDING)
#define KAREPORT_EXPORT Q_DECL_EXPORT
#elif defined(KAREPORT_STATIC)
#define KAREPORT_EXPORT
#else
#define KAREPORT_EXPORT Q_DECL_IMPORT
#endif

/// All that is not known by a name with U or C in front, or by a function's name with a capital.
namespace kareport
{
}
