#include "PieceLoader.h"

#include "PrintQt.h"

#include <QPlainTextDocumentLayout>
#include <QTest>
#include <QTextDocument>

#include <gtest/gtest.h>

namespace
{

using kareport::PiecedText;
using kareport::PieceLoader;

/// Reads at most so many characters at a time, so that short texts have many pieces.
PiecedText inPiecesOf(const QString &text, qint64 most)
{
    return {text.size(), [text, most](qint64 at, qint64 count) { return text.mid(at, std::min(count, most)); }};
}

TEST(PieceLoader, GivesTheTextThatIsLoadedAtOnce)
{
    struct Row
    {
        const char16_t *text;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", "empty"},
        {u"a", "one character"},
        {u"a\r\n", "a line end is one paragraph's end"},
        {u"ab\r\ncd\r\nef", "no line end at the end"},
        {u"\r\n\r\n\r\n", "empty lines"},
        {u"abcdefghijklmnop\r\nq", "a line longer than a piece"},
        {u"a\r\r\r\nb\rc\n\nd", "line ends of every kind"},
        {u"\U0001F600\U0001F600\U0001F600\U0001F600", "surrogate pairs"},
        {u"abc\r\nabcd\r\nabcde\r\n", "a line end on every side of a piece's end"},
    };
    for (const Row &row : rows) {
        QTextDocument expected;
        expected.setPlainText(QString::fromUtf16(row.text));
        for (qint64 most = 2; most <= 9; ++most) {
            QTextDocument document;
            document.setUndoRedoEnabled(false);
            PieceLoader loader(document, inPiecesOf(QString::fromUtf16(row.text), most), [] {});
            loader.finish();
            EXPECT_EQ(document.toRawText(), expected.toRawText()) << row.reason << ", pieces of " << most;
            EXPECT_TRUE(loader.isDone());
            EXPECT_EQ(loader.percent(), 100);
        }
    }
}

TEST(PieceLoader, LoadsFromTheEventLoopAsLongAsAPieceIsMissing)
{
    const QString text = QStringLiteral("a line of the report\r\n").repeated(500);
    QTextDocument document;
    int pieces = 0;
    std::unique_ptr<PieceLoader> loader;
    loader = std::make_unique<PieceLoader>(document, inPiecesOf(text, 1000), [&] {
        ++pieces;
        loader->addPiece();
    });
    EXPECT_EQ(document.characterCount(), 1) << "nothing is loaded before the loop runs";
    ASSERT_TRUE(QTest::qWaitFor([&] { return loader->isDone(); }, 5000));
    const int all = pieces;
    QCoreApplication::processEvents();
    EXPECT_EQ(pieces, all) << "nothing is due any more";
    EXPECT_FALSE(loader->isCutShort());
    EXPECT_GE(pieces, 11) << "a piece holds at most 1000 characters of 11000";
    EXPECT_EQ(document.blockCount(), 501);
}

TEST(PieceLoader, EndsWhereTheTextEndsThatHasBecomeShorter)
{
    QTextDocument document;
    PieceLoader loader(document, {100, [](qint64 at, qint64) { return at == 0 ? QStringLiteral("abc\n") : QString(); }},
                       [] {});
    loader.finish();
    EXPECT_EQ(document.toPlainText(), QStringLiteral("abc\n"));
    EXPECT_TRUE(loader.isCutShort());
}

} // namespace
