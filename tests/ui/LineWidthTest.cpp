#include "LineWidth.h"

#include "PrintQt.h"
#include "ReportContent.h"

#include <QFontMetricsF>
#include <QWidget>

#include <gtest/gtest.h>

#include <cmath>

namespace
{

using kareport::LineWidth;
using kareport::shownLine;

TEST(LineWidth, ALineIsShownWithoutWhatCannotBeSeen)
{
    struct Row
    {
        QStringView line;
        QStringView shown;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", u"", "nothing"},
        {u"  a  b  ", u"  a  b  ", "blanks stay"},
        {u"a\r\n", u"a", "the line's own end"},
        {u"a\n\r\n", u"a", "two ends"},
        {u"a\r\nb", u"a  b", "a line end within: a blank for each character"},
        {u"a\tb", u"a       b", "a tab leads to the eighth column"},
        {u"1234567\tb", u"1234567 b", "at least one blank"},
        {u"12345678\tb", u"12345678        b", "from column 8 to column 16"},
        {u"\t\tb", u"                b", "tab after tab"},
        {u"a\u0001b\u007Fc\u0085d\u2028e\u2029f", u"a b c d e f", "other control characters and separators"},
        {u"°\u00A0測量", u"°\u00A0測量", "no control characters"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(shownLine(row.line), row.shown.toString()) << row.reason;
    }
}

TEST(LineWidth, IsTheWidthThatTheLineIsDrawnWith)
{
    const QString lines[] = {
        QString(),
        QStringLiteral("x"),
        QString(80, u'W'),
        QString(300, u'i'),
        QStringLiteral("  N 45°12'30\" E   1234.567 \u00B1 0.002"),
        QStringLiteral("ÄÖÜäöüßéèàçñ"),
        QStringLiteral("Ωαβγ Привет ∞ ≤ → ─│┌"),
        QStringLiteral("測点 標高 カタカナ ひらがな ｱｲｳ"),
        QStringLiteral("e\u0301 a\u0308"),      // marks that are on the character before
        QStringLiteral("العربية"),              // letters that join
        QStringLiteral("\U0001F4CF\U0001F4D0"), // pairs
        QStringLiteral("a\tb\r\n"),
    };
    QWidget device;
    for (const unsigned points : {6U, 8U, 9U, 11U, 24U}) {
        for (const QFont &font : {kareport::reportFont(QStringLiteral("Lucida Console"), points),
                                  QFont(QStringLiteral("DejaVu Sans"), static_cast<int>(points))})
        {
            const LineWidth width(font, &device);
            const QFontMetricsF metrics(font, &device);
            EXPECT_GE(width.lineHeight(), metrics.height());
            EXPECT_LT(width.lineHeight(), metrics.height() + 1);
            for (const QString &line : lines) {
                const int expected = static_cast<int>(std::ceil(metrics.horizontalAdvance(shownLine(line)) - 1e-3));
                EXPECT_EQ(width.of(line), expected)
                    << font.family().toStdString() << ' ' << points << ": " << line.toStdString();
            }
        }
    }
}

TEST(LineWidth, AddsUpWithoutLosingFractions)
{
    // At this size the advance is not a whole number of pixels: a rounded one would be wrong by the width of the last words.
    QWidget device;
    QFont font = kareport::reportFont(QStringLiteral("DejaVu Sans Mono"), 0);
    font.setPixelSize(11);
    font.setHintingPreference(QFont::PreferNoHinting);
    const QFontMetricsF metrics(font, &device);
    const LineWidth width(font, &device);
    ASSERT_GT(std::abs(metrics.horizontalAdvance(u'0') - std::round(metrics.horizontalAdvance(u'0'))), 0.1);
    const QString line(1000, u'8');
    EXPECT_EQ(width.of(line), static_cast<int>(std::ceil(metrics.horizontalAdvance(line) - 1e-3)));
}

} // namespace
