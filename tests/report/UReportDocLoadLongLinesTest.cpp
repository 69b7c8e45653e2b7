#include "FrameFixture.h"
#include "ReportFixture.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <limits>
#include <vector>

namespace
{

TEST(UReportDocLoadLongLines, ALineOfMoreThan1022CharactersComesInPieces)
{
    struct Piece
    {
        int length;
        const char *end;
    };
    struct Row
    {
        int length; ///< of the line
        QByteArray end;
        std::vector<Piece> pieces;
        const char *reason;
    };
    const Row rows[] = {
        {1021, "\n", {{1021, "\n"}}, "it fits with its line end"},
        {1021, "\r\n", {{1021, "\n"}}, "CR LF counts as one"},
        {1020, "\r\r\n", {{1020, "\r\n"}}, "a CR in front of it counts"},
        {1021, "\r\r\n", {{1021, "\r"}, {0, "\n"}}, "with that CR it does not fit"},
        {1021, "", {{1021, ""}}, "no line end"},
        {1022, "\n", {{1022, ""}, {0, "\n"}}, "only the line end is left for the second piece"},
        {1022, "\r\n", {{1022, ""}, {0, "\n"}}, "only the line end is left for the second piece"},
        {1022, "\r\r\n", {{1022, ""}, {0, "\r\n"}}, "only the line end is left for the second piece"},
        {1022, "", {{1022, ""}}, "no line end, so no second piece"},
        {1022, "\r", {{1022, ""}, {0, "\r"}}, "a CR at the end of the file is a character"},
        {1023, "\n", {{1022, ""}, {1, "\n"}}, "one character is left"},
        {1023, "\r\n", {{1022, ""}, {1, "\n"}}, "one character is left"},
        {1023, "", {{1022, ""}, {1, ""}}, "one character is left"},
        {1500, "\n", {{1022, ""}, {478, "\n"}}, "two pieces"},
        {2043, "\r\n", {{1022, ""}, {1021, "\n"}}, "two full ones"},
        {2044, "\r\n", {{1022, ""}, {1022, ""}, {0, "\n"}}, "and three"},
    };
    for (const Row &row : rows) {
        for (const bool keeps : {true, false}) {
            const FixedSurroundings surroundings;
            const QTemporaryDir folder;
            const QString path = folder.filePath(QStringLiteral("a.rep"));
            putFile(path, QByteArray(row.length, 'x') + row.end);
            QString expected;
            for (const Piece &piece : row.pieces) {
                QString end = QLatin1String(piece.end);
                expected += QString(piece.length, u'x') + (keeps ? end : end.remove(u'\n')) + QStringLiteral("\r\n");
            }
            UReportDoc report;
            EXPECT_EQ(report.LoadFile(path, keeps), 1);
            EXPECT_TRUE(textOf(report) == expected) << row.length << ' ' << row.reason;
        }
    }
}

TEST(UReportDocLoadLongLines, AFileOfOneVeryLongLineIsLoadedPieceByPiece)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    constexpr int size = 100 * 1000 * 1000;
    {
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        ASSERT_TRUE(file.resize(size)); // takes no room on the disk
    }
    UReportDoc report;
    report.FixPage(std::numeric_limits<int>::max(), 80);
    EXPECT_EQ(report.LoadFile(path, true), 1);
    constexpr int pieces = (size + 1021) / 1022;
    EXPECT_EQ(report.GetLineCount(), 2 * pieces) << "each counted as it is written and once more";
}

/// Opens a rich-text file through its document.
QString loadedRichText(const QByteArray &content, const QString &name)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(name);
    putFile(path, content);
    UReportDoc report;
    EXPECT_TRUE(report.OnOpenDocument(path));
    return textOf(report);
}

TEST(UReportDocLoadLongLines, ALineOfRichTextStaysInOnePiece)
{
    const QByteArray words = QByteArray("\\b1 ").repeated(1000);
    const QString long_ = QString::fromLatin1(words);
    struct Row
    {
        QByteArray content;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {"{\\rtf1 " + words + "}", QStringLiteral("{\\rtf1 ") + long_ + QStringLiteral("}\r\n"),
         "all in one line, ended as every last line"},
        {"{\\rtf1 " + words + "}\n", QStringLiteral("{\\rtf1 ") + long_ + QStringLiteral("}\n\r\n"), "with a line end"},
        {"{\\rtf1\r\n" + words + "\r\n" + words + "\r\n}",
         QStringLiteral("{\\rtf1\n\r\n") + long_ + QStringLiteral("\n\r\n") + long_ + QStringLiteral("\n\r\n}\r\n"),
         "long lines after the first"},
        {" \t{\\rtf1 " + words + "}", QStringLiteral(" \t{\\rtf1 ") + long_ + QStringLiteral("}\r\n"),
         "white space in front"},
        {"{\\rtf1 " + QByteArray(1015, 'x') + "\n}",
         QStringLiteral("{\\rtf1 ") + QString(1015, u'x') + QStringLiteral("\n\r\n}\r\n"),
         "the line end alone in the second piece"},
        {"{\\rtf1 short\n}", QStringLiteral("{\\rtf1 short\n\r\n}\r\n"), "short lines as ever"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        EXPECT_TRUE(loadedRichText(row.content, QStringLiteral("a.rtf")) == row.expected) << row.reason;
        EXPECT_TRUE(loadedRichText(row.content, QStringLiteral("a.RTF")) == row.expected) << row.reason;
    }
    const FixedSurroundings surroundings;
    EXPECT_EQ(loadedRichText(words + "\n", QStringLiteral("a.rtf")).count(QStringLiteral("\r\n")), 4)
        << "a long line of another text comes in pieces under that name, too";
}

TEST(UReportDocLoadLongLines, ALongFirstLineOfRichTextKeepsAllOfItsPieces)
{
    const FixedSurroundings surroundings;
    const QByteArray first = "{\\rtf1 " + QByteArray(1500, 'x') + "\\b TALVEN - N";
    EXPECT_TRUE(loadedRichText(first + "\r\n}", QStringLiteral("a.rtf")) ==
                QString::fromLatin1(first) + QStringLiteral("\n\r\n}\r\n"));
}

} // namespace
