#pragma once

#include <QString>
#include <QTextDocument>
#include <QTimer>

#include <functional>

namespace kareport
{

/// A long text that is read in pieces.
struct PiecedText
{
    qint64 length = 0; ///< characters
    /// Gives characters of the text, from 0. @return fewer than `count` only when the text has changed meanwhile
    std::function<QString(qint64 at, qint64 count)> read;
};

/// Fills a text document piece by piece, so that the window answers while a long report is loaded. What has been loaded
/// ends with a line end until all of it is there.
class PieceLoader
{
public:
    /// @param document  empty, without undo steps; must live as long as the loader
    /// @param due       called from the event loop until all is loaded: the next piece may be added now
    PieceLoader(QTextDocument &document, PiecedText text, std::function<void()> due);

    bool isDone() const { return at_ >= text_.length; }
    /// Whether the next piece may be the last one.
    bool isLastPiece() const { return text_.length - at_ <= pieceLength_; }
    /// Whether the text has ended before its length.
    bool isCutShort() const { return isCutShort_; }
    int percent() const;
    /// Adds the next piece.
    void addPiece();
    /// Adds all that is missing.
    void finish();

private:
    QString nextPiece();

    QTextDocument &document_;
    PiecedText text_;
    std::function<void()> due_;
    qint64 at_ = 0;
    bool isCutShort_ = false;
    qint64 pieceLength_;
    QTimer timer_;
};

} // namespace kareport
