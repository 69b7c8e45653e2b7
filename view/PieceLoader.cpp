#include "PieceLoader.h"

#include <QElapsedTimer>
#include <QTextCursor>

#include <algorithm>

namespace kareport
{

namespace
{

/// How long a piece takes, about: the window answers well before a user notices, and the overhead of a piece is small.
constexpr qint64 pieceTime = 15;       // milliseconds
constexpr qint64 firstPiece = 100'000; // characters: more than any window shows
constexpr qint64 shortestPiece = 20'000;
constexpr qint64 longestPiece = 4'000'000;

/// A piece up to its last line end or, where it has none, one that cuts neither a line end nor a character in two.
qsizetype wholeLines(QStringView piece)
{
    if (const qsizetype end = piece.lastIndexOf(u'\n'); end >= 0) {
        return end + 1;
    }
    const QChar last = piece.back();
    return piece.size() > 1 && (last == u'\r' || last.isHighSurrogate()) ? piece.size() - 1 : piece.size();
}

} // namespace

PieceLoader::PieceLoader(QTextDocument &document, PiecedText text, std::function<void()> due)
    : document_(document), text_(std::move(text)), due_(std::move(due)), pieceLength_(firstPiece)
{
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] {
        const auto handler = due_; // which may take the loader away
        handler();
    });
    timer_.start(0);
}

int PieceLoader::percent() const
{
    return text_.length == 0 ? 100 : static_cast<int>(at_ * 100 / text_.length);
}

QString PieceLoader::nextPiece()
{
    QString piece = text_.read(at_, std::min(pieceLength_, text_.length - at_));
    if (piece.isEmpty()) {
        isCutShort_ = at_ < text_.length;
        at_ = text_.length;
        return piece;
    }
    if (at_ + piece.size() < text_.length) {
        piece.truncate(wholeLines(piece));
    }
    at_ += piece.size();
    return piece;
}

void PieceLoader::addPiece()
{
    QElapsedTimer time;
    time.start();
    QTextCursor cursor(&document_);
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(nextPiece());
    const qint64 taken = std::max<qint64>(time.elapsed(), 1);
    pieceLength_ = std::clamp(pieceLength_ * pieceTime / taken, std::max(pieceLength_ / 2, shortestPiece),
                              std::min(pieceLength_ * 2, longestPiece));
    if (isDone()) {
        timer_.stop();
    }
}

void PieceLoader::finish()
{
    timer_.stop();
    while (!isDone()) {
        pieceLength_ = longestPiece;
        addPiece();
    }
}

} // namespace kareport
