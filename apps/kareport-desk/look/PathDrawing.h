#pragma once

#include <QPainterPath>
#include <QStringView>

namespace kareport
{

/// The path of what an SVG file says in `d`: the commands M, L, H, V, C, Q and Z, absolute or relative. It ends before the
/// first thing that is none of these.
QPainterPath pathOf(QStringView description);

} // namespace kareport
