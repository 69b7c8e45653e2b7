#pragma once

#include "ReportTextWriter.h"

#include <QLatin1StringView>
#include <QStringView>

#include <cstddef>
#include <optional>

class QIODevice;

namespace kareport
{

/// Turns report text into UTF-8, piece by piece and in the order of the text.
class ReportTextEncoder
{
public:
    explicit ReportTextEncoder(LineEnds lineEnds) : lineEnds_(lineEnds) {}

    /// The most bytes that a piece of text, and what was held back of the piece before, can become.
    static std::size_t bound(std::size_t characters) { return 3 * (characters + 1); }
    /// Writes the UTF-8 of a piece of text.
    /// @param out  room for `bound(text.size())` bytes
    /// @param last  the text ends here; otherwise a last CR or high surrogate is held back for the next piece
    /// @return the bytes written. A surrogate without its other half becomes U+FFFD.
    std::size_t encode(QStringView text, char *out, bool last);
    std::size_t encode(QLatin1StringView text, char *out, bool last);

private:
    struct Settled
    {
        char *out;      ///< where the next byte goes
        bool takesNext; ///< the character after what was held back belongs to it
    };

    Settled settle(std::optional<char16_t> next, char *out);
    template <typename Character>
    std::size_t encodeCharacters(const Character *at, const Character *end, char *out, bool last);

    LineEnds lineEnds_;
    char16_t heldBack_ = 0;
};

/// The bytes that a report file begins with: the UTF-8 byte-order mark.
inline constexpr char reportFileMark[] = {'\xEF', '\xBB', '\xBF'};

/// Writes report text to an open device, a piece at a time.
/// @return false as soon as a write fails or memory ends
bool writeReportText(QIODevice &device, QStringView text, LineEnds lineEnds);
bool writeReportText(QIODevice &device, QLatin1StringView text, LineEnds lineEnds);

} // namespace kareport
