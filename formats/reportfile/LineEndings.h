#pragma once

#include <QString>
#include <QStringView>

namespace kareport
{

/// A text whose lines end with CR LF: every LF that has no CR before it gets one. In one pass, however many lines there are.
QString withCrLf(QStringView text);

} // namespace kareport
