#include "TotalFormatter.h"

#include "VariableType.h"

#include <gtest/gtest.h>

#include <limits>
#include <vector>

namespace
{

using namespace kareport;

sXmlReportField field(int type, int width = 12, int decimals = 2)
{
    sXmlReportField made;
    made.VariableName = QStringLiteral("V");
    made.Width = width;
    made.Decimals = decimals;
    made.Align = QStringLiteral("R");
    made.ID = 1;
    made.Type = type;
    return made;
}

/// The total of some values as a field shows it.
struct Shower
{
    UJobSettings settings;
    bool addsPrinted = false;
    bool zeroBlank = false;
    bool printHash = false;
    char16_t separator = u' ';
    TotalledVariable variable;

    QString show(const std::vector<double> &values, TotalKind kind, QStringView suffix = {})
    {
        const FormatOptions options{&settings, separator, zeroBlank, printHash};
        TotalledCell cell(variable, options, addsPrinted);
        ColumnTotal total;
        for (const double value : values) {
            const UDictEntry entry(1, value * variable.reader.factor());
            cell.add(total, cell.read(&entry));
        }
        TextBuffer out;
        TotalFormatter(variable.field, options, addsPrinted ? UnitRatio() : variable.ratio)
            .append(out, total, kind, suffix);
        return out.view().toString();
    }
};

TEST(TotalFormatter, ShowsTotalsAsTheColumnShowsValues)
{
    const struct
    {
        int type;
        std::vector<double> values;
        TotalKind kind;
        const char16_t *text;
        const char *reason;
    } rows[] = {
        {VARIABLE_DOUBLE, {0.1, 0.2}, TotalKind::Sum, u"       0.300", "plain numbers have the job's decimals"},
        {VARIABLE_DOUBLE, {1.0005}, TotalKind::Sum, u"       1.000", "a tie of the decimal number goes to the even"},
        {VARIABLE_DOUBLE, {1.0015}, TotalKind::Sum, u"       1.002", "also where the double is below it"},
        {VARIABLE_DOUBLE, {-0.0004}, TotalKind::Sum, u"      -0.000", "as printf writes it"},
        {VARIABLE_LENGTH, {-0.0004}, TotalKind::Sum, u"       0.000", "a length has no such sign"},
        {VARIABLE_LENGTH, {1, 2, 4}, TotalKind::Mean, u"       2.333", "the mean"},
        {VARIABLE_LENGTH, {3, 1, 2}, TotalKind::Least, u"       1.000", "the least"},
        {VARIABLE_LENGTH, {3, 1, 2}, TotalKind::Greatest, u"       3.000", "the greatest"},
        {VARIABLE_LENGTH, {3, 1, 2}, TotalKind::Count, u"           3", "a count is a whole number"},
        {VARIABLE_LENGTH, {}, TotalKind::Sum, u"       0.000", "no values"},
        {VARIABLE_LENGTH, {}, TotalKind::Mean, u"            ", "of none there is no mean"},
        {VARIABLE_LENGTH, {}, TotalKind::Least, u"            ", "nor a least one"},
        {VARIABLE_STATION, {1234.5, 1000}, TotalKind::Mean, u" 1+117.250", "a station"},
        {VARIABLE_OFFSET, {-2.5, 1}, TotalKind::Sum, u"       1.50L", "an offset has its own decimals"},
        {VARIABLE_ANGLE, {0.125, 0.25}, TotalKind::Sum, u"        0.38", "an angle as well: a tie to the even digit"},
        {VARIABLE_DOUBLE, {1e14, 0.001}, TotalKind::Sum, u"100000000000000.001", "more digits than a double has"},
        {VARIABLE_OFFSET, {-1e15}, TotalKind::Sum, u"1000000000000000.00L", "of an offset"},
        {VARIABLE_STATION, {1e15, 0.5}, TotalKind::Sum, u"1000000000000+000.500", "of a station"},
    };
    for (const auto &row : rows) {
        Shower shower;
        shower.variable.field = field(row.type, row.type == VARIABLE_STATION ? 10 : 12);
        if (row.type == VARIABLE_ANGLE) {
            shower.settings.angleUnit = AngleUnit::Radian;
        }
        EXPECT_EQ(shower.show(row.values, row.kind), QString::fromUtf16(row.text)) << row.reason;
    }
}

TEST(TotalFormatter, ConvertsTheSumAndRoundsOnce)
{
    Shower shower;
    shower.variable.field = field(VARIABLE_LENGTH);
    shower.variable.ratio = {{3937}, {1200}, 0};
    shower.settings.lengthUnit = LengthUnit::UsSurveyFoot;
    // Each is 0.328 ft, that is 0.984 as printed; together they are 0.98425.
    EXPECT_EQ(shower.show({0.1, 0.1, 0.1}, TotalKind::Sum), QStringLiteral("       0.984"));
    EXPECT_EQ(shower.show(std::vector<double>(10, 0.1), TotalKind::Sum), QStringLiteral("       3.281"));
    EXPECT_EQ(shower.show({0.1}, TotalKind::Greatest), QStringLiteral("       0.328")) << "as in its own row";
    shower.addsPrinted = true;
    EXPECT_EQ(shower.show(std::vector<double>(10, 0.1), TotalKind::Sum), QStringLiteral("       3.280"))
        << "what a reader adds up";
    EXPECT_EQ(shower.show({0.1, 0.2}, TotalKind::Mean), QStringLiteral("       0.492")) << "of 0.328 and 0.656";
    EXPECT_EQ(shower.show({1e17}, TotalKind::Sum), QStringLiteral("328083333333333376.000"))
        << "the digits that are printed, however many";
}

TEST(TotalFormatter, KeepsTheOptions)
{
    Shower shower;
    shower.variable.field = field(VARIABLE_DOUBLE, 6);
    shower.zeroBlank = true;
    EXPECT_EQ(shower.show({1, -1}, TotalKind::Sum), QStringLiteral("      ")) << "exactly 0";
    EXPECT_EQ(shower.show({0.0001}, TotalKind::Sum), QStringLiteral(" 0.000")) << "only rounded to it";
    EXPECT_EQ(shower.show({}, TotalKind::Count), QStringLiteral("     0")) << "a count says something";
    Shower stations;
    stations.variable.field = field(VARIABLE_STATION, 10);
    stations.settings.stationDecimals = 15;
    EXPECT_EQ(stations.show({1.25, 0.1}, TotalKind::Sum), QStringLiteral("0+001.350000000000000"));
    EXPECT_EQ(stations.show({-1234.25}, TotalKind::Sum), QStringLiteral("-1+234.250000000000000"));
    stations.settings.stationFormat = UJobSettings::StationFormat::HundredsPlus;
    EXPECT_EQ(stations.show({12.5}, TotalKind::Sum), QStringLiteral("0+12.500000000000000"));
    shower.printHash = true;
    EXPECT_EQ(shower.show({12345.5}, TotalKind::Sum), QStringLiteral("######"));
    EXPECT_EQ(shower.show({1e14, 0.001}, TotalKind::Sum), QStringLiteral("######")) << "also with many digits";
    shower.separator = u'\t';
    shower.printHash = false;
    EXPECT_EQ(shower.show({1.5}, TotalKind::Sum), QStringLiteral("1.500")) << "trimmed";
    Shower offsets;
    offsets.variable.field = field(VARIABLE_OFFSET, 10);
    EXPECT_EQ(offsets.show({-1, -1}, TotalKind::Sum, u"+"), QStringLiteral("     -2.00"));
}

TEST(TotalFormatter, AddsWholeNumbers)
{
    const UJobSettings settings;
    const FormatOptions options{&settings};
    TotalledVariable variable;
    variable.field = field(VARIABLE_INTEGER, 5);
    TotalledCell cell(variable, options, false);
    const TotalFormatter formatter(variable.field, options, {});
    ColumnTotal total;
    const auto add = [&](qint32 value) {
        const UDictEntry entry(1, value);
        cell.add(total, cell.read(&entry));
    };
    const auto shown = [&](TotalKind kind) {
        TextBuffer out;
        formatter.append(out, total, kind, QStringView());
        return out.view().toString();
    };
    add(3);
    add(4);
    EXPECT_EQ(shown(TotalKind::Sum), QStringLiteral("    7"));
    EXPECT_EQ(shown(TotalKind::Mean), QStringLiteral("    4")) << "3.5 as the column shows numbers: whole";
    EXPECT_EQ(shown(TotalKind::Greatest), QStringLiteral("    4"));
    for (int i = 0; i < 3; ++i) {
        add(std::numeric_limits<qint32>::max());
    }
    EXPECT_EQ(shown(TotalKind::Sum), QStringLiteral("6442450948")) << "beyond 32 bits";
}

TEST(TotalledCell, TellsWhatIsNoNumber)
{
    const UJobSettings settings;
    const FormatOptions options{&settings};
    TotalledVariable variable;
    variable.field = field(VARIABLE_DOUBLE);
    TotalledCell cell(variable, options, false);
    ColumnTotal total;
    using State = TotalledCell::State;
    EXPECT_EQ(cell.read(nullptr).state, State::Missing);
    for (const double value : {std::numeric_limits<double>::infinity(), std::numeric_limits<double>::quiet_NaN()}) {
        const UDictEntry entry(1, value);
        EXPECT_EQ(cell.read(&entry).state, State::NotFinite);
        cell.add(total, cell.read(&entry));
    }
    EXPECT_EQ(total.count, 0U);
    const UDictEntry text(1, QStringLiteral("a"));
    EXPECT_EQ(cell.read(&text).state, State::Missing) << "a text of another variable with the same identifier";
    variable.field = field(VARIABLE_TEXT);
    TotalledCell texts(variable, options, false);
    texts.add(total, texts.read(&text));
    EXPECT_EQ(total.count, 1U) << "a text counts, and no more";
}

} // namespace
