#pragma once

#include "KaReportExport.h"
#include "TextOutlet.h"

#include <cstddef>
#include <memory>
#include <vector>

class QIODevice;

namespace kareport
{

class ReportTextEncoder;

/// How line feeds are written.
enum class LineEnds
{
    ReportFile, ///< LF as CR LF; a line of a report, which ends with CR LF already, then ends with CR CR LF
    PlainText   ///< CR LF as LF, every other character as it is
};

/// Writes report text to an open device in UTF-8, as it comes.
class KAREPORT_EXPORT ReportTextWriter : public TextOutlet
{
public:
    /// The device must live as long as the writer.
    ReportTextWriter(QIODevice &device, LineEnds lineEnds);
    ~ReportTextWriter() override;

    /// Writes what comes next in the text. @return false once a write has failed; what comes then is ignored
    bool write(QStringView text) override;
    /// The same for characters up to U+00FF.
    bool write(QLatin1StringView text) override;
    /// Ends the text. @return whether all of it was written
    bool finish();

    /// Whether a write has failed.
    bool hasFailed() const { return hasFailed_; }
    /// Whether it has failed as there was no memory for its bytes: the device is not the cause.
    bool lacksMemory() const { return lacksMemory_; }
    /// Whether there was no text yet.
    bool isEmpty() const { return isEmpty_; }

private:
    template <typename Text>
    bool writePieces(Text text, bool last);
    bool writeBytes(const char *bytes, std::size_t size);

    QIODevice &device_;
    std::unique_ptr<ReportTextEncoder> encoder_;
    LineEnds lineEnds_;
    std::vector<char> bytes_;
    bool hasBegun_ = false;
    bool isEmpty_ = true;
    bool hasFailed_ = false;
    bool lacksMemory_ = false;
};

} // namespace kareport
