#pragma once

#include <QByteArray>
#include <QLatin1StringView>

class QIODevice;

namespace kareport
{

/// Reads a text file in lines as `UReportDoc::LoadFile` takes them: one character a byte, whatever the bytes mean, CR LF as
/// LF, and lines of more than 1022 characters in pieces. What reads a saved report back as the text that it was is
/// `decodeReportText`.
class ByteLineReader
{
public:
    static constexpr qsizetype longestPiece = 1022;

    /// The device must be open and live as long as the reader.
    explicit ByteLineReader(QIODevice &device) : device_(device) {}

    /// Reads a line with its LF, or the next piece of a long one. @return false at the end of the file
    bool next();
    /// What was read, until the next call.
    QLatin1StringView piece() const { return {bytes_.constData() + at_ - taken_, size_}; }

private:
    void fill();

    QIODevice &device_;
    QByteArray bytes_;
    qsizetype at_ = 0;
    bool atEnd_ = false;
    qsizetype taken_ = 0; ///< bytes of the file that the piece was made of, which are before `at_`
    qsizetype size_ = 0;
};

} // namespace kareport
