#pragma once

#include <QtCore/qglobal.h>

/// Marks what the shared libraries KaReport and KaReportHost offer to programs outside.
#ifdef KAREPORT_BUILDING
#define KAREPORT_EXPORT Q_DECL_EXPORT
#else
#define KAREPORT_EXPORT Q_DECL_IMPORT
#endif

/// All that is not known by a name with U or C in front, or by a function's name with a capital.
namespace kareport
{
}
