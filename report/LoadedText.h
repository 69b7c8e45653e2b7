#pragma once

#include "ReportText.h"

#include <QByteArrayView>

#include <functional>
#include <optional>
#include <vector>

namespace kareport
{

/// The text of a report as it was read from a file, and what is known of it: a report takes it over as it is. All of it may
/// be made on any thread.
struct LoadedText
{
    ReportText text;
    qint64 lineEnds = 0;
    std::vector<qint64> pageStarts;  ///< where the lines begin that are page headers
    std::optional<int> linesPerPage; ///< that these tell; nothing with fewer than two of them

    /// Looks for the page headers in the text. @throws std::bad_alloc
    void findPages();
};

enum class TextLoading
{
    Whole,
    OtherText, ///< rich text, or no UTF-8: what has been read is worth nothing
    Stopped,
    NoMemory ///< or more characters than a report can have
};

/// Reads the bytes of a report file, as `decodeReportText` does.
/// @param loaded   as it was made: empty
/// @param proceed  receives the bytes done; its false stops the work. May be empty
TextLoading loadReportText(QByteArrayView bytes, LoadedText &loaded,
                           const std::function<bool(qint64 done)> &proceed = {});
/// Reads bytes that are the text in UTF-8, with its own line ends. What is not UTF-8 is read as replacement characters.
TextLoading loadPlainText(QByteArrayView bytes, LoadedText &loaded,
                          const std::function<bool(qint64 done)> &proceed = {});

} // namespace kareport
