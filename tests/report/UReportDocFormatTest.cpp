#include "ReportFixture.h"

#include "UJobSettings.h"
#include "sXmlReportField.h"

#include <gtest/gtest.h>

namespace
{

sXmlReportField fieldOf(int type, int width, int decimals, const char *align)
{
    sXmlReportField field;
    field.VariableName = QStringLiteral("V");
    field.Type = type;
    field.Width = width;
    field.Decimals = decimals;
    field.Align = QString::fromLatin1(align);
    return field;
}

QString shown(const UReportDoc &report, const sXmlReportField &field, double value, const char *offsetStyle = "")
{
    return report.FormatXmlStringToDisplay(&field, 8, &value, QString::fromLatin1(offsetStyle));
}

TEST(UReportDocFormat, CoordinateOfZeroIsBlankWithTheZeroBlankFlag)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    const sXmlReportField coordinate = fieldOf(5, 8, 0, "R");
    EXPECT_EQ(shown(report, coordinate, 0.0), QStringLiteral("   0.000")) << "the flag is off";
    report.SetZeroBlank(true);
    EXPECT_EQ(shown(report, coordinate, 0.0), QStringLiteral("        ")) << "as many blanks as the column is wide";
    EXPECT_EQ(shown(report, coordinate, 0.0001), QStringLiteral("   0.000")) << "not exactly zero";
    EXPECT_EQ(shown(report, fieldOf(9, 10, 0, "R"), 0.0), QStringLiteral(" 0+000.000")) << "a station is never blank";
    report.SetZeroBlank(false);
    EXPECT_EQ(shown(report, coordinate, 0.0), QStringLiteral("   0.000")) << "off again";
}

TEST(UReportDocFormat, OffsetIsShownInTheStyleThatIsHandedIn)
{
    const FixedSurroundings surroundings;
    const UReportDoc report;
    constexpr struct
    {
        double value;
        const char *style;
        const char *expected;
        const char *reason;
    } rows[] = {
        {-2.5, "+", "    -2.5", "signed: the value right-aligned in 8 columns"},
        {2.5, "+", "    +2.5", "signed, positive"},
        {0, "+", "    +0.0", "signed, zero"},
        {-2.5, "", "    2.5L", "the length in 7 columns, then the side"},
        {2.5, "", "    2.5R", "the other side"},
        {0, "", "     0.0", "on the line: neither sign nor side"},
        {-2.5, "R", "    2.5L", "the marker's R is not a sign"},
        {-2.5, "-", "    2.5L", "only a plus asks for the sign"},
        {-2.5, "+ ", "    2.5L", "only a plus alone"},
    };
    for (const auto &row : rows) {
        EXPECT_EQ(shown(report, fieldOf(10, 8, 1, "R"), row.value, row.style), QString::fromLatin1(row.expected))
            << row.reason;
    }
}

TEST(UReportDocFormat, TabSeparatorTrimsAndFillsNothing)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    const QString text = QStringLiteral(" A ");
    constexpr struct
    {
        char16_t separator;
        const char *align;
        const char *expected;
    } rows[] = {
        {u'\t', "L", "A"},    {u'\t', "C", "A"},    {u'\t', "R", "A"},     {u'|', "L", " A   "},
        {u'|', "C", "  A  "}, {u'|', "R", "   A "}, {u'\0', "L", " A   "}, {u'\xFF', "R", "   A "},
    };
    for (const auto &row : rows) {
        report.SetDataColumnSeparator(row.separator, false);
        const sXmlReportField field = fieldOf(2, 5, 0, row.align);
        EXPECT_EQ(report.FormatXmlStringToDisplay(&field, 16, &text, QString()), QString::fromLatin1(row.expected))
            << row.align << ", separator " << static_cast<unsigned>(row.separator);
    }
    report.SetExcelFormat();
    EXPECT_EQ(shown(report, fieldOf(5, 12, 0, "R"), 1.5), QStringLiteral("1.500")) << "with the tab of that format";
}

TEST(UReportDocFormat, FillerIsBlanksAlsoWithATab)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    sXmlReportField filler = fieldOf(2, 3, 0, "L");
    filler.VariableName = QStringLiteral("Filler");
    const QString text = QStringLiteral("text");
    for (const char16_t separator : {u'|', u'\t'}) {
        report.SetDataColumnSeparator(separator, false);
        EXPECT_EQ(report.FormatXmlStringToDisplay(&filler, 16, &text, QString()), QStringLiteral("   "));
    }
    for (const int width : {0, -3}) {
        filler.Width = width;
        EXPECT_EQ(report.FormatXmlStringToDisplay(&filler, 16, &text, QString()), QString()) << width;
    }
}

TEST(UReportDocFormat, UnitsAreThoseOfTheReportsJob)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    EXPECT_EQ(shown(report, fieldOf(6, 9, 0, "R"), 1.5), QStringLiteral("    1.500"));
    UJobSettings settings;
    settings.lengthUnit = kareport::LengthUnit::Millimetre;
    settings.lengthDecimals = 1;
    report.SetJobSettings(settings);
    EXPECT_EQ(shown(report, fieldOf(6, 9, 0, "R"), 1.5), QStringLiteral("   1500.0"));
}

} // namespace
