#pragma once

#include <QtCore/qglobal.h>

/// Marks what the shared libraries KaReport and KaReportHost offer to programs outside.
#ifdef KAREPORT_BUILDING
#define KAREPORT_EXPORT Q_DECL_EXPORT
#else
#define KAREPORT_EXPORT Q_DECL_IMPORT
#endif
