#include "PdfFaces.h"
#include "PdfFixture.h"

#include <QFont>
#include <QFontDatabase>
#include <QFontMetricsF>
#include <QPainter>

#include <gtest/gtest.h>

#include <hpdf.h>

#include <utility>

// Pages as they are seen, compared with the same text drawn by other code.

namespace
{

using kareport::PdfFace;
using kareport::PdfOptions;

constexpr int dotsPerInch = 200;
constexpr unsigned fontSize = 18; ///< points: 50 dots
constexpr double dotsPerPoint = dotsPerInch / 72.0;
constexpr double margin = 36 * dotsPerPoint;

/// How far a face reaches above and below its baseline, in dots, as the library says.
struct Reach
{
    double above;
    double below;
};

Reach reachOf(const PdfFace &face)
{
    HPDF_Doc pdf = HPDF_New(nullptr, nullptr);
    HPDF_UseUTFEncodings(pdf);
    const QByteArray file = QFile::encodeName(face.file());
    const char *name = face.isCollection() ? HPDF_LoadTTFontFromFile2(pdf, file.constData(), face.index(), HPDF_FALSE)
                                           : HPDF_LoadTTFontFromFile(pdf, file.constData(), HPDF_FALSE);
    const HPDF_Box box = HPDF_Font_GetBBox(HPDF_GetFont(pdf, name, "UTF-8"));
    HPDF_Free(pdf);
    return {double(box.top) / 1000 * fontSize * dotsPerPoint, -double(box.bottom) / 1000 * fontSize * dotsPerPoint};
}

/// The cell of DejaVu Sans Mono.
constexpr double cell = 0.602 * fontSize * dotsPerPoint;

PdfFace baseFace()
{
    return kareport::fixedPitchPdfFaces().front();
}

QFont fontOf(const char *family)
{
    QFont font(QString::fromUtf8(family));
    font.setPixelSize(fontSize * dotsPerInch / 72);
    font.setHintingPreference(QFont::PreferNoHinting);
    EXPECT_TRUE(QFontInfo(font).family().startsWith(QString::fromUtf8(family)));
    return font;
}

/// The same page drawn character by character: in cells of DejaVu Sans Mono, and CJK of another face across two of them.
QImage drawn(const QStringList &lines, const QSize &size, const Reach &reach)
{
    const QFont base = fontOf("DejaVu Sans Mono");
    const QFont wide = fontOf("WenQuanYi Zen Hei Mono");
    QImage image(size, QImage::Format_Grayscale8);
    image.fill(Qt::white);
    QPainter painter(&image);
    double baseline = margin + reach.above;
    for (const QString &line : lines) {
        double x = margin;
        for (const QChar character : line) {
            const bool isWide = character.unicode() >= 0x2E80;
            painter.setFont(isWide ? wide : base);
            painter.save();
            painter.translate(x, baseline);
            painter.scale(isWide ? 2 * 0.602 : 1, 1);
            painter.drawText(QPointF(), QString(character));
            painter.restore();
            x += isWide ? 2 * cell : cell;
        }
        baseline += reach.above + reach.below;
    }
    return image;
}

TEST(PdfExportPicture, LinesLookAsTheirFaceDrawsThem)
{
    struct Drawing
    {
        QStringList lines;
        const char *reason;
    };
    const Drawing drawings[] = {
        {{QStringLiteral("Traverse of 12 points (closed)"), QStringLiteral("| 0123456789.500 | -0.004 |"),
          QStringLiteral("é à ü ñ Å Ç õ"), QStringLiteral("° ½ ß µ ± ²"), QStringLiteral("∞ ≤ Ω α Δ √"),
          QStringLiteral("é"), QStringLiteral("\u012A \u0159 \u1E03"), QStringLiteral("gjpqy ,;_")},
         "letters, letters made of others, signs"},
        {{QStringLiteral("測量報告 座標"), QStringLiteral("é ∞ 測 A 量 1"), QStringLiteral("かな カナ"),
          QStringLiteral("。、「」"), QStringLiteral("한글 측량"), QStringLiteral("│測│1│")},
         "CJK among others"},
    };
    const Reach reach = reachOf(baseFace());
    for (const Drawing &drawing : drawings) {
        PdfOptions options = pdfOptions();
        options.page.fontSize = fontSize;
        options.page.linesPerPage = 20;
        const QImage shown = PdfReadBack(pdfBytes(drawing.lines.join(u'\n'), options)).picture(1, dotsPerInch);
        const QImage expected = drawn(drawing.lines, shown.size(), reach);
        for (qsizetype i = 0; i < drawing.lines.size(); ++i) {
            const double top = margin + static_cast<double>(i) * (reach.above + reach.below);
            const QRect area(0, qRound(top), shown.width(), qRound(reach.above + reach.below) - 2);
            const Ink ink = inkIn(shown, area);
            const Ink expectedInk = inkIn(expected, area);
            const std::string which = drawing.lines[i].toStdString() + " (" + drawing.reason + ")";
            ASSERT_GT(expectedInk.amount, 100) << which;
            EXPECT_NEAR(ink.box.left(), expectedInk.box.left(), 2) << which;
            EXPECT_NEAR(ink.box.right(), expectedInk.box.right(), 2) << which;
            EXPECT_NEAR(ink.box.top(), expectedInk.box.top(), 2) << which;
            EXPECT_NEAR(ink.box.bottom(), expectedInk.box.bottom(), 2) << which;
            EXPECT_NEAR(ink.amount / expectedInk.amount, 1, 0.06) << which;
        }
    }
}

TEST(PdfExportPicture, EveryLetterHasAllItsParts)
{
    // Letters that are made of others are where an embedded face may lose something.
    const PdfFace face = baseFace();
    constexpr std::pair<char16_t, char16_t> ranges[] = {
        {0x00A1, 0x024F}, {0x0386, 0x03FF}, {0x0400, 0x052F}, {0x1E00, 0x1EFF}, {0x1F00, 0x1FFE}, {0x2010, 0x22FF},
    };
    constexpr qsizetype lettersPerLine = 40;
    QString letters;
    for (const auto &[first, last] : ranges) {
        for (char32_t letter = first; letter <= last; ++letter) {
            // A mark without room of its own is drawn on its neighbour.
            const bool hasRoom = QChar::isPrint(letter) && !QChar::isSpace(letter) && !QChar::isMark(letter);
            if (hasRoom && face.covers(letter)) {
                letters += QChar(static_cast<char16_t>(letter));
            }
        }
    }
    ASSERT_GT(letters.size(), 1200);
    QStringList lines;
    for (qsizetype i = 0; i < letters.size(); i += lettersPerLine) {
        lines.append(letters.mid(i, lettersPerLine));
    }
    PdfOptions options = pdfOptions();
    options.page.pageSize = QSize(4961, 20000);
    options.page.fontSize = fontSize;
    const Reach reach = reachOf(face);
    const QImage shown = PdfReadBack(pdfBytes(lines.join(u'\n'), options)).picture(1, dotsPerInch);
    const QImage expected = drawn(lines, shown.size(), reach);
    for (qsizetype i = 0; i < letters.size(); ++i) {
        const double left = margin + static_cast<double>(i % lettersPerLine) * cell;
        const double top = margin + static_cast<double>(i / lettersPerLine) * (reach.above + reach.below);
        const QRect area(qRound(left), qRound(top), qRound(cell), qRound(reach.above + reach.below));
        const double amount = inkIn(shown, area).amount;
        const double expectedAmount = inkIn(expected, area).amount;
        EXPECT_NEAR(amount, expectedAmount, 6 + expectedAmount / 10)
            << "U+" << QString::number(letters[i].unicode(), 16).toStdString();
    }
}

TEST(PdfExportPicture, NoInkIsOutsideTheBox)
{
    QString text;
    for (int line = 1; line <= 144; ++line) {
        text += QString(line % 7 == 0 ? 104 : 90, QChar(u'É')) + QStringLiteral(" gjy\r\n");
    }
    PdfOptions options = pdfOptions();
    options.page.fontSize = 8;
    options.page.linesPerPage = 72;
    const PdfReadBack pdf(pdfBytes(text, options));
    ASSERT_EQ(pdf.pageCount(), 2);
    for (const int page : {1, 2}) {
        const QImage picture = pdf.picture(page, 100);
        const Ink ink = inkIn(picture, picture.rect());
        EXPECT_NEAR(ink.box.left(), 50, 2) << page;
        EXPECT_GE(ink.box.top(), 49) << page;
        EXPECT_LE(ink.box.right(), picture.width() - 49) << page;
        EXPECT_LE(ink.box.bottom(), picture.height() - 49) << page;
        EXPECT_GE(ink.box.bottom(), picture.height() - 49 - 12) << page << ": the last line is at the bottom";
    }
}

} // namespace
