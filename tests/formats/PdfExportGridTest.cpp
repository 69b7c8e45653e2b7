#include "PdfFixture.h"

#include <gtest/gtest.h>

// Characters of any script in the cells of one grid.

namespace
{

using kareport::PdfOptions;

constexpr int dotsPerInch = 200;
constexpr unsigned fontSize = 18; ///< points: 50 dots
constexpr double cell = 0.602 * fontSize * dotsPerInch / 72;
constexpr double margin = 36.0 * dotsPerInch / 72;
constexpr int figures = 20; ///< the column that figures begin in

struct Row
{
    QString text;
    int cells;
    QString said; ///< what a reader copies; empty for the text
    const char *reason;
};

std::vector<Row> rows()
{
    const QString hangul = QStringLiteral("한글");
    return {
        {QStringLiteral("Punkt 12"), 8, {}, "ASCII"},
        {QStringLiteral("測量報告"), 8, {}, "CJK"},
        {QStringLiteral("測 1 量"), 7, {}, "CJK among others"},
        {QStringLiteral("かなカナ"), 8, {}, "kana"},
        {QStringLiteral("Ａ１ ℃"), 6, {}, "full width, and a sign that is too wide for its cell"},
        {QStringLiteral("\u00E9\u00E2\u1EC7\u00F1"), 4, {}, "accents in one character"},
        {QStringLiteral("e\u0301a\u0302e\u0323\u0302n\u0303"), 4, {}, "accents of their own"},
        {QStringLiteral("x\u0304X\u0301q\u0323\u0304"), 3, {}, "accents on letters that have none"},
        {hangul, 4, {}, "Hangul"},
        {hangul.normalized(QString::NormalizationForm_D), 4, {}, "Hangul in its parts"},
        {QStringLiteral("\U0001F600\U0001F600 ok"), 7, QStringLiteral("\uFFFD\uFFFD ok"), "emoji that no face has"},
        {QStringLiteral("αβγ Ωά"), 6, {}, "Greek"},
        {QStringLiteral("┌─┬─┐│"), 6, {}, "box drawing"},
        {QStringLiteral("a\u200Bb\u2060c\uFEFF"), 3, QStringLiteral("abc"), "what is not seen"},
    };
}

PdfOptions gridOptions()
{
    PdfOptions options = pdfOptions();
    options.page.fontSize = fontSize;
    options.page.linesPerPage = 20;
    return options;
}

QString gridText()
{
    QString text;
    for (const Row &row : rows()) {
        text += row.text + QString(figures - row.cells, u' ') + QStringLiteral("| 123.456 |\r\n");
    }
    return text;
}

/// Where a line is, in dots.
QRect cellsAt(double lineHeight, std::size_t line, int first, int count)
{
    const double top = margin + static_cast<double>(line) * lineHeight;
    return {qRound(margin + first * cell), qRound(top), qRound(count * cell), qRound(lineHeight)};
}

TEST(PdfExportGrid, FiguresAreInTheirColumnsAfterAnyScript)
{
    const std::vector<Row> all = rows();
    const PdfReadBack pdf(pdfBytes(gridText(), gridOptions()));
    const QImage picture = pdf.picture(1, dotsPerInch);
    const double lineHeight = 1.402 * fontSize * dotsPerInch / 72; // of DejaVu Sans Mono
    const Ink first = inkIn(picture, cellsAt(lineHeight, 0, figures, 12));
    ASSERT_GT(first.amount, 100);
    for (std::size_t i = 0; i < all.size(); ++i) {
        const Ink ink = inkIn(picture, cellsAt(lineHeight, i, figures, 12));
        EXPECT_NEAR(ink.box.left(), first.box.left(), 1) << all[i].reason;
        EXPECT_NEAR(ink.box.right(), first.box.right(), 1) << all[i].reason;
        EXPECT_NEAR(ink.amount / first.amount, 1, 0.03) << all[i].reason;
        const Ink between = inkIn(picture, cellsAt(lineHeight, i, all[i].cells, figures - all[i].cells));
        EXPECT_TRUE(between.box.isEmpty()) << all[i].reason << ": nothing is drawn after its last cell";
        for (int column = 0; column < all[i].cells; ++column) {
            const bool isBlank = all[i].text.contains(u' ') || all[i].text.contains(u'│');
            EXPECT_TRUE(isBlank || !inkIn(picture, cellsAt(lineHeight, i, column, 1)).box.isEmpty())
                << all[i].reason << ": cell " << column;
        }
    }
}

TEST(PdfExportGrid, TheTextIsStillTheSame)
{
    const std::vector<Row> all = rows();
    const PdfReadBack pdf(pdfBytes(gridText(), gridOptions()));
    const QStringList lines = pdf.pages().value(0).split(u'\n');
    ASSERT_EQ(static_cast<std::size_t>(lines.size()), all.size());
    for (std::size_t i = 0; i < all.size(); ++i) {
        const QString said = all[i].said.isEmpty() ? all[i].text : all[i].said;
        const QString line = lines[static_cast<qsizetype>(i)];
        EXPECT_EQ(line.section(u'|', 0, 0).trimmed(), said) << all[i].reason;
        EXPECT_EQ(line.section(u'|', 1, 1).trimmed(), QStringLiteral("123.456")) << all[i].reason;
    }
    EXPECT_EQ(pdf.check(), QString());
}

TEST(PdfExportGrid, AMarkIsOnItsLetter)
{
    struct Mark
    {
        QString text;
        bool above;
        const char *reason;
    };
    const Mark marks[] = {
        {QStringLiteral("x\u0304"), true, "above a small letter"},
        {QStringLiteral("X\u0301"), true, "above a capital"},
        {QStringLiteral("q\u0307"), true, "above a letter that reaches down"},
        {QStringLiteral("x\u0323"), false, "below"},
        {QStringLiteral("x\u0332"), false, "a line below"},
    };
    const double lineHeight = 1.402 * fontSize * dotsPerInch / 72;
    for (const Mark &mark : marks) {
        const QString text = mark.text.left(1) + QStringLiteral("\r\n") + mark.text + QStringLiteral("\r\n");
        const QImage picture = PdfReadBack(pdfBytes(text, gridOptions())).picture(1, dotsPerInch);
        const Ink letter = inkIn(picture, cellsAt(lineHeight, 0, 0, 3));
        const Ink marked = inkIn(picture, cellsAt(lineHeight, 1, 0, 3));
        EXPECT_GT(marked.amount, letter.amount + 20) << mark.reason;
        EXPECT_LE(marked.box.right(), margin + cell + 1) << mark.reason << ": not beside it";
        const double top = marked.box.top() - lineHeight - letter.box.top();
        const double bottom = marked.box.bottom() - lineHeight - letter.box.bottom();
        EXPECT_EQ(top < -3, mark.above) << mark.reason << ": " << top;
        EXPECT_EQ(bottom > 3, !mark.above) << mark.reason << ": " << bottom;
    }
}

TEST(PdfExportGrid, AFaceOfAnyPitchMakesAGrid)
{
    FontFolder gothic;
    gothic.with(QStringLiteral("MSGOTHIC.TTC"), zenHeiFile()); // its first face is proportional
    FontFolder lucida;
    lucida.with(QStringLiteral("lucon.TTF"), dejaVuFile());
    for (const QString &folder : {gothic.path(), lucida.path()}) {
        PdfOptions options = gridOptions();
        options.fontFolders = QStringList{folder};
        const PdfReadBack pdf(pdfBytes(QStringLiteral("iiii 1 x\nWWWW 2 x\n測量 3 x\n1234 4 x\n"), options));
        std::vector<double> ones;
        std::vector<double> letters;
        for (const PdfWord &word : pdf.words()) {
            if (word.text.size() == 1) {
                (word.text == u"x" ? letters : ones).push_back(word.left);
            }
        }
        ASSERT_EQ(ones.size(), 4U) << folder.toStdString();
        ASSERT_EQ(letters.size(), 4U) << folder.toStdString();
        for (std::size_t line = 1; line < 4; ++line) {
            EXPECT_NEAR(ones[line], ones[0], 0.01) << folder.toStdString();
            EXPECT_NEAR(letters[line], letters[0], 0.01) << folder.toStdString();
        }
    }
}

TEST(PdfExportGrid, AMissingMarkIsReported)
{
    kareport::PdfNotes notes;
    pdfBytes(u"a\r\nx\u20EA y\u20EA\r\n", pdfOptions(), &notes);
    ASSERT_EQ(notes.missing.size(), 1U);
    EXPECT_EQ(notes.missing[0].character, U'\u20EA');
    EXPECT_EQ(notes.missing[0].count, 2);
    EXPECT_EQ(notes.missing[0].firstLine, 2);
    kareport::PdfNotes composed;
    pdfBytes(QStringLiteral("한글").normalized(QString::NormalizationForm_D), pdfOptions(), &composed);
    EXPECT_TRUE(composed.missing.empty()) << "parts that no face has, but the syllable";
}

} // namespace
