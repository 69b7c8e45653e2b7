#include "ImportGuess.h"

#include "VariableType.h"

#include <QHash>
#include <QJsonDocument>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

/// A dictionary of points.
Variables points(const DataUnits &units = {})
{
    struct Row
    {
        const char *name;
        int type;
    };
    Variables variables;
    QHash<QString, int> types;
    for (const Row &row :
         {Row{"Number", VARIABLE_NUMBER}, Row{"Northing", VARIABLE_COORDINATE}, Row{"Easting", VARIABLE_COORDINATE},
          Row{"Elevation", VARIABLE_ELEVATION}, Row{"Description", VARIABLE_TEXT}, Row{"Station", VARIABLE_STATION}})
    {
        variables.names.append(QString::fromUtf8(row.name));
        types.insert(QString::fromUtf8(row.name).toLower(), row.type);
    }
    variables.find = [types, units](const QString &name) -> std::optional<ValueParser> {
        const auto type = types.constFind(name.toLower());
        return type == types.constEnd() ? std::nullopt
                                        : std::optional(ValueParser(*type, static_cast<unsigned>(*type), units));
    };
    return variables;
}

std::shared_ptr<const FileBytes> file(const QByteArray &content)
{
    return FileBytes::holding(QStringLiteral("a.txt"), content);
}

QByteArray utf16(const char *text)
{
    QByteArray bytes = "\xFF\xFE";
    for (const QChar character : QString::fromUtf8(text)) {
        bytes += char(character.unicode() & 0xFF);
        bytes += char(character.unicode() >> 8);
    }
    return bytes;
}

TEST(ImportGuess, FindsOutHowAFileIsWritten)
{
    struct Row
    {
        QByteArray content;
        QJsonObject options;
        const char *reason;
    };
    const auto option = [](const char *key, const QJsonValue &value) {
        return QJsonObject{{QString::fromUtf8(key), value}};
    };
    const Row rows[] = {
        {"Number,Northing\n1,2.5\n", {}, "as most files are"},
        {"Number;Northing\n1;2.5\n", option("delimiter", ";"), "semicolons"},
        {"Number;Northing\n1;2,5\n", {{"delimiter", ";"}, {"decimal", ","}}, "a spreadsheet of another country"},
        {"Number\tNorthing\n1\t2.5\n", option("delimiter", "\t"), "tabs"},
        {"Number Northing\n1   2.5\n", option("delimiter", "whitespace"), "blanks"},
        {"Pt;N;E\n1;2,5;3\n", {{"delimiter", ";"}, {"decimal", ","}}, "names that are not variables"},
        {"1,2.5,3,4,oak\n2,3.5,4,5,elm\n", {{"header", false}, {"order", "PNEZD"}}, "points without names"},
        {"1;2,5;3\n2;3;4\n",
         {{"delimiter", ";"}, {"decimal", ","}, {"header", false}, {"order", "PNE"}},
         "with fewer columns"},
        {"oak,1,2\nelm,2,3\n", {{"header", false}, {"order", "PNE"}}, "a point number may be a text"},
        {"1,oak,2\n2,elm,3\n", option("header", false), "but a coordinate is none"},
        {"Number,Description\n1,Gr\xFCn\n", option("encoding", "windows-1252"), "no UTF-8"},
        {"Number,Description\n1,Gr\xC3\xBCn\n", {}, "UTF-8"},
        {"Number,Description\n1,\x81\n", option("encoding", "latin-1"), "no character of Windows"},
        {utf16("Number,Northing\n1,2.5\n"), option("encoding", "utf-16"), "UTF-16"},
        {"", {}, "an empty file"},
        {"oak\nelm\n", {}, "one column"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(guessTextFile(file(row.content), points()).options, row.options)
            << row.reason << ": "
            << QJsonDocument(guessTextFile(file(row.content), points()).options).toJson().constData();
    }
}

TEST(ImportGuess, FilesOfOneShapeAreKnownAgain)
{
    const auto shape = [](const char *content) { return guessTextFile(file(content), points()).shape; };
    EXPECT_EQ(shape("Number,Northing\n1,2\n"), shape("Number,Northing\n7,8\n9,10\n"));
    EXPECT_EQ(shape("Number,Northing\n1,2\n"), shape("number;NORTHING\n1;2,5\n")) << "names in any case";
    EXPECT_NE(shape("Number,Northing\n1,2\n"), shape("Number,Easting\n1,2\n"));
    EXPECT_NE(shape("Number,Northing\n1,2\n"), shape("Number,Northing,Easting\n1,2,3\n"));
    EXPECT_EQ(shape("1,2,3\n"), shape("7,8,9\n2,3,4\n")) << "as many columns";
    EXPECT_NE(shape("1,2,3\n"), shape("1,2,3,4\n"));
}

TEST(ImportGuess, AJobReadsWhatIsShown)
{
    const auto preview = [](const char *content, const QJsonObject &options) {
        return previewTextFile(
            file(content), options, [](const DataUnits &units) { return points(units); }, 20);
    };
    DataPreview shown = preview("Number,Northing,Other\n1,2.5,x\n2,abc,y\n3,4\n", {});
    ASSERT_EQ(shown.columns.size(), 3U);
    EXPECT_EQ(shown.columns[0].variable, QStringLiteral("Number"));
    EXPECT_EQ(shown.columns[2].name, QStringLiteral("Other"));
    EXPECT_EQ(shown.columns[2].variable, QString());
    ASSERT_EQ(shown.rows.size(), 3U);
    EXPECT_EQ(shown.rows[0][1].text, QStringLiteral("2.5"));
    EXPECT_EQ(shown.rows[0][1].wrong, QString());
    EXPECT_TRUE(shown.rows[1][1].wrong.contains(QStringLiteral("expected")));
    EXPECT_EQ(shown.rows[1][2].wrong, QString()) << "it is not read";
    EXPECT_TRUE(shown.rows[2][2].wrong.contains(QStringLiteral("2 cells"))) << "a row is too short";
    ASSERT_TRUE(shown.error.has_value());
    EXPECT_EQ(shown.error->place->line, 3) << "the first thing that is wrong";

    shown = preview("1;0,5\n", {{"delimiter", ";"},
                                {"decimal", ","},
                                {"header", false},
                                {"columns", QJsonObject{{"Northing", 2}}},
                                {"units", QJsonObject{{"length", "ft"}}}});
    EXPECT_FALSE(shown.error.has_value());
    EXPECT_EQ(shown.columns[1].variable, QStringLiteral("Northing"));
    EXPECT_EQ(shown.rows.size(), 1U);
    EXPECT_TRUE(preview("1;2\n", {{"units", QJsonObject{{"length", "yard"}}}}).error.has_value());
    EXPECT_TRUE(preview("1;2\n", {{"header", false}}).error.has_value()) << "no column is a variable";
    EXPECT_EQ(preview("1;2\n", {{"header", false}, {"delimiter", ";"}}).columns.size(), 2U)
        << "but the columns are there to be chosen";
    EXPECT_TRUE(preview("a\xFF\xFE", {{"encoding", "utf-16"}}).error.has_value());
}

TEST(ImportGuess, OfALongFileTheBeginningIsEnough)
{
    QByteArray content = "Number,Northing\n";
    for (int row = 0; row < 50'000; ++row) {
        content += QByteArray::number(row) + ",1234.5\n";
    }
    const auto begin = beginOfText(file(content));
    EXPECT_LT(begin->view().size(), 300'000U);
    EXPECT_TRUE(begin->view().ends_with('\n')) << "no row is cut";
    EXPECT_TRUE(content.startsWith(QByteArray(begin->view().data(), qsizetype(begin->view().size()))));
    EXPECT_EQ(beginOfText(file("1,2"))->view(), "1,2");
    const auto wide = beginOfText(file(utf16(content.constData())));
    EXPECT_TRUE(wide->view().ends_with(std::string_view("\n\0", 2)));
    EXPECT_EQ(guessTextFile(wide, points()).options.value("encoding"), QJsonValue("utf-16"));
}

} // namespace
