#pragma once

#include "KaReportExport.h"
#include "TextOutlet.h"

#include <QLatin1StringView>
#include <QStringView>

#include <cstddef>
#include <vector>

class QIODevice;

namespace kareport
{

/// How line feeds are written.
enum class LineEnds
{
    ReportFile, ///< LF as CR LF; a line of a report, which ends with CR LF already, then ends with CR CR LF
    PlainText   ///< CR LF as LF, every other character as it is
};

/// Turns report text into UTF-8, piece by piece and in the order of the text.
class KAREPORT_EXPORT ReportTextEncoder
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
    template <typename Character>
    std::size_t encodeCharacters(const Character *at, const Character *end, char *out, bool last);

    LineEnds lineEnds_;
    char16_t heldBack_ = 0;
};

/// The bytes that a report file begins with: the UTF-8 byte-order mark.
inline constexpr char reportFileMark[] = {'\xEF', '\xBB', '\xBF'};

/// Writes report text to an open device as it comes.
class KAREPORT_EXPORT ReportTextWriter : public TextOutlet
{
public:
    /// The device must live as long as the writer.
    ReportTextWriter(QIODevice &device, LineEnds lineEnds) : device_(device), encoder_(lineEnds), lineEnds_(lineEnds) {}

    /// Writes what comes next in the text. @return false once a write has failed; what comes then is passed over
    bool write(QStringView text) override;
    bool write(QLatin1StringView text) override;
    /// Ends the text. @return whether all of it was written
    bool finish();

    bool hasFailed() const { return hasFailed_; }
    /// Whether there was no text yet.
    bool isEmpty() const { return isEmpty_; }

private:
    template <typename Text>
    bool writePieces(Text text, bool last);
    bool writeBytes(const char *bytes, std::size_t size);

    QIODevice &device_;
    ReportTextEncoder encoder_;
    LineEnds lineEnds_;
    std::vector<char> bytes_;
    bool hasBegun_ = false;
    bool isEmpty_ = true;
    bool hasFailed_ = false;
};

/// Writes report text to an open device, a piece at a time. @return false as soon as a write fails
KAREPORT_EXPORT bool writeReportText(QIODevice &device, QStringView text, LineEnds lineEnds);
KAREPORT_EXPORT bool writeReportText(QIODevice &device, QLatin1StringView text, LineEnds lineEnds);

} // namespace kareport
