#pragma once

#include "TextPlaces.h"

#include <QByteArrayView>
#include <QString>

#include <optional>

namespace kareport
{

/// Turns the bytes of a report file back into the report text that was written: the inverse of writing it. A file without
/// a byte-order mark, or without a line end of CR CR LF, is a text that another program wrote; its lines, ended by LF
/// or CR LF, get CR LF. (A report whose text has bare line feeds only comes back with CR LF.) `loadReportText` reads
/// the same into a report, piece by piece; `ByteLineReader` reads any file without looking at its encoding.
/// @return where the file is not UTF-8; nothing when all of it was read
std::optional<TextPlace> decodeReportText(QByteArrayView bytes, QString &text);

} // namespace kareport
