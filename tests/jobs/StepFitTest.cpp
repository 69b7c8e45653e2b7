#include "JobRunnerFixture.h"
#include "RandomRuns.h"
#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <array>

namespace
{

using jobs::TestJob;
using kareport::FieldFit;
using kareport::StepFit;

TEST(StepFit, ATableTellsItsWidestValuesAndWhetherTheyFit)
{
    TestJob test;
    test.measures = true;
    test.run(jobs::templateJob(
        R"("p": {"values": [{"Number": "1", "Northing": 12.5}, {"Number": "12345678"}, {"Number": "A23456", "Northing": -1e6}]})",
        R"({"line": "a"}, {"table": "Points", "data": "p"}, {"block": "Point", "data": "p"})"));
    ASSERT_FALSE(test.error) << test.error->message().toStdString();
    ASSERT_EQ(test.fits.size(), 2U);
    const StepFit &table = test.fits[0];
    EXPECT_TRUE(table.isTable);
    EXPECT_EQ(table.name, u"Points");
    EXPECT_EQ(table.data, u"p");
    EXPECT_EQ(table.rows, 3U);
    ASSERT_TRUE(table.place.place);
    ASSERT_EQ(table.fields.size(), 2U);
    const FieldFit &number = table.fields[0];
    EXPECT_EQ(number.variable, u"Number");
    EXPECT_EQ(number.label, u"Pt");
    EXPECT_EQ(number.width, 5);
    EXPECT_EQ(number.widest.width, 8);
    EXPECT_EQ(number.widest.text, u"12345678");
    EXPECT_EQ(number.row, 2U);
    EXPECT_EQ(number.line, 5) << "after the line, the heading and a blank line";
    EXPECT_EQ(number.tooWide, 2U);
    EXPECT_FALSE(number.fits());
    const FieldFit &northing = table.fields[1];
    EXPECT_EQ(northing.widest.text, u"-1000000.000") << "without the blanks that fill the column";
    EXPECT_EQ(northing.row, 3U);
    const StepFit &block = test.fits[1];
    EXPECT_FALSE(block.isTable);
    EXPECT_EQ(block.rows, 1U);
    ASSERT_EQ(block.fields.size(), 2U);
    EXPECT_EQ(block.fields[1].widest.text, u"12.500");
    EXPECT_TRUE(block.fields[1].fits());
}

TEST(StepFit, NothingIsMeasuredUnlessSomebodyAsks)
{
    TestJob test;
    test.run(jobs::templateJob(R"("p": {"values": [{"Number": "1"}]})", R"({"table": "Points", "data": "p"})"));
    EXPECT_TRUE(test.fits.empty());
}

TEST(StepFit, ALabelIsMeasuredByTheFormat)
{
    using namespace markup;
    const QByteArray tables =
        output("Table", "Points", "Survey",
               {field("Northing", "North and more", "5"), field("Easting", "East", "9"), field("Note", "Remark", "6"),
                element("Field", element("VariableName", "Count") + element("Label", "Count of all")),
                field("Note", "Remark", "5"), field("FILLER", "filler", "1")});
    const char *const data = R"("p": {"values": [{"Northing": 1}]})";
    for (const char *order : {"NE", "EN"}) {
        TestJob test;
        test.measures = true;
        test.folder.put("t.xml", surveyTemplate(tables, "", separatorOption("32")));
        test.run(jobs::templateJob(data, R"({"table": "points", "data": "p"})",
                                   QByteArray(R"("settings": {"northEastOrder": ")") + order + "\"}, "));
        ASSERT_EQ(test.fits.size(), 1U) << test.text().toStdString();
        QStringList wide;
        for (const FieldFit &field : test.fits[0].fields) {
            wide.append(field.variable + QString::number(field.width) +
                        (field.isLabelWide ? QStringLiteral("!") : QString()));
        }
        const QString northing = QStringLiteral("Northing14!");
        const QString easting = QStringLiteral("Easting9");
        const QStringList all = {*order == 'N' ? northing : easting, *order == 'N' ? easting : northing,
                                 QStringLiteral("Note6"), QStringLiteral("Count12"), QStringLiteral("Note6!")};
        EXPECT_EQ(wide, all) << order;
    }
}

/// A type with values of it as they are in data.
struct TypeRow
{
    const char *type;
    std::array<const char *, 8> values;
};
constexpr TypeRow types[] = {
    {"INTEGER", {"0", "-5", "123456", "2147483647", "-2147483648", "7", "", "42"}},
    {"DOUBLE", {"0", "-0.0001", "12.5", "123456789.125", "1e12", "-3", "", "INF"}},
    {"TEXT", {"a", "a longer text", "", "naïve 点", "x y", "tab", "1", "a text that is wider than most columns"}},
    {"NAME", {"n", "name", "", "another", "b", "c", "d", "e"}},
    {"NUMBER", {"1", "12A", "100234", "", "P-17/3", "2", "3", "4"}},
    {"ANGLE", {"0", "359.9999", "-12.5", "1e5", "0.25", "", "45", "NAN"}},
    {"VANGLE", {"90", "-0.5", "89.12345", "", "1", "2", "3", "180"}},
    {"BEARING", {"0", "45.504", "359.99999", "180", "", "271.5", "90", "12"}},
    {"COORDINATE", {"0", "5500000.1234", "-3", "", "1e9", "12.5", "0.0004", "-0.0004"}},
    {"LENGTH", {"1", "-1", "123.456", "1e7", "", "0", "9999.9996", "5"}},
    {"DISTANCE", {"1.5", "100", "", "99999", "0", "3", "4", "-5"}},
    {"ELEVATION", {"35.12", "-12.1", "", "8848.86", "0", "1", "2", "3"}},
    {"STATION", {"0", "5.5", "12345.678", "-75", "123456789", "", "999.9999", "1"}},
    {"OFFSET", {"0", "3.75", "-3.75", "-1234567.5", "", "12", "0.00001", "1e6"}},
    {"AREA", {"0", "1250.5", "1e8", "", "-1", "2", "3", "40468564"}},
    {"BOOLEAN", {"yes", "no", "", "1", "0", "y", "n", "t"}},
    {"FLAG", {"*", "*", "*", "1", "*", "t", "y", "*"}},
    {"THICKNESS", {"0", "25", "-1", "211", "", "ByLayer", "100", "123456"}},
};

QByteArray anyOf(RandomNumbers &random, const std::vector<const char *> &words)
{
    return words[static_cast<std::size_t>(random.below(static_cast<int>(words.size())))];
}

QByteArray randomSettings(RandomNumbers &random)
{
    return R"("settings": {"lengthUnit": ")" + anyOf(random, {"m", "mm", "km", "ft", "usft"}) + R"(", "areaUnit": ")" +
           anyOf(random, {"m2", "ha", "km2", "ft2", "ac"}) + R"(", "angleUnit": ")" +
           anyOf(random, {"deg", "gon", "rad"}) + R"(", "stationFormat": ")" +
           anyOf(random, {"plain", "0+00", "0+000"}) + R"(", "bearingUnit": ")" + anyOf(random, {"dms", "deg", "gon"}) +
           R"(", "bearingStyle": ")" + anyOf(random, {"quadrant", "circle"}) + R"(", "lengthDecimals": )" +
           QByteArray::number(random.below(6)) + R"(, "stationDecimals": )" + QByteArray::number(random.below(6)) +
           R"(, "numberDecimals": )" + QByteArray::number(random.below(6)) + R"(, "bearingDecimals": )" +
           QByteArray::number(random.below(4)) + "}, ";
}

/// A table with a field of each type, of random formats.
QByteArray randomTemplate(RandomNumbers &random)
{
    using namespace markup;
    QByteArray variables;
    std::vector<QByteArray> fields;
    int id = 0;
    for (const TypeRow &row : types) {
        variables += variable(++id, row.type, row.type);
        const QByteArray format = QByteArray::number(random.below(18)) + '.' + QByteArray::number(random.below(6));
        if (QByteArray(row.type) == "OFFSET" && random.below(2) == 0) {
            fields.push_back(element("Field", element("VariableName", "SUFFIX_+")));
        }
        fields.push_back(field(row.type, "", format.constData(), anyOf(random, {"LEFT", "RIGHT"}).constData()));
    }
    const QByteArray dictionary =
        element("Dictionary", element("DictionaryName", "All") + element("VariableList", variables));
    const QByteArray table = random.below(3) == 0 ? output("Table", "Points", "All", fields, {"NUMBER"})
                                                  : output("Table", "Points", "All", fields);
    return element("ReportTemplate", element("Name", "T") + element("Tables", table) +
                                         element("Dictionaries", dictionary) +
                                         element("Options", separatorOption("124")));
}

QByteArray randomData(RandomNumbers &random)
{
    QByteArrayList names;
    for (const TypeRow &row : types) {
        names.append(row.type);
    }
    QByteArray csv = names.join(',') + '\n';
    const int rows = 1 + random.below(20);
    for (int i = 0; i < rows; ++i) {
        QByteArrayList cells;
        for (const TypeRow &row : types) {
            cells.append(row.values[static_cast<std::size_t>(random.below(8))]);
        }
        csv += cells.join(',') + '\n';
    }
    return csv;
}

TEST(StepFit, TheWidestValueIsTheWidestCellThatIsPrinted)
{
    RandomRuns runs("fits against printed tables", 1, 60);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        TestJob test;
        test.measures = true;
        test.folder.put("t.xml", randomTemplate(random));
        test.folder.put("p.csv", randomData(random));
        const bool zeroBlank = random.below(2) == 0;
        test.run(jobs::templateJob(R"("p": {"csv": "p.csv"})", R"({"table": "Points", "data": "p"})",
                                   randomSettings(random) + (zeroBlank ? R"("options": {"zeroBlank": true}, )" : "")));
        ASSERT_FALSE(test.error) << "seed " << runs.seed() << ": " << test.error->message().toStdString();
        ASSERT_EQ(test.fits.size(), 1U);
        const std::vector<FieldFit> &fields = test.fits[0].fields;
        ASSERT_EQ(fields.size(), std::size(types));
        const QStringList lines = test.text().split(u'\n', Qt::SkipEmptyParts); // of a table at the top: no heading
        EXPECT_EQ(test.fits[0].rows, static_cast<quint64>(lines.size()));
        for (std::size_t i = 0; i < fields.size(); ++i) {
            qsizetype widest = -1;
            quint64 row = 0;
            quint64 tooWide = 0;
            for (qsizetype line = 0; line < lines.size(); ++line) {
                const QString printed = lines[line].split(u'|')[static_cast<qsizetype>(i)];
                const QString cell = printed.trimmed();
                // The cell of a flag that is not set is a blank of its own in the widest of columns.
                tooWide += fields[i].width > 0 && cell.size() > fields[i].width ? 1U : 0U;
                if (cell.size() > widest) {
                    widest = cell.size();
                    row = static_cast<quint64>(line) + 1;
                    if (cell.size() <= kareport::WidestText::mostKept && fields[i].row == row) {
                        EXPECT_EQ(fields[i].widest.text, cell) << "seed " << runs.seed() << " " << types[i].type;
                    }
                }
            }
            EXPECT_EQ(fields[i].widest.width, widest) << "seed " << runs.seed() << " " << types[i].type;
            EXPECT_EQ(fields[i].row, row) << "seed " << runs.seed() << " " << types[i].type;
            EXPECT_EQ(fields[i].tooWide, tooWide) << "seed " << runs.seed() << " " << types[i].type;
        }
    }
}

} // namespace
