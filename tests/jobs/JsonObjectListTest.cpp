#include "JsonObjectList.h"

#include "InputErrorText.h"
#include "JobFolder.h"
#include "VariableType.h"

#include <gtest/gtest.h>

#include <numbers>

namespace
{

using kareport::DataUnits;
using kareport::errorOf;
using kareport::JsonNode;
using kareport::JsonSource;
using kareport::ValueParser;

constexpr unsigned id = 3;

/// Reads the root of a JSON text as one object; its members of the name "V" are of a type.
class StoredObject
{
public:
    StoredObject(const QByteArray &json, int type, const DataUnits &units = {})
    {
        auto read = JsonSource::fromBytes(QStringLiteral("job.json"), json);
        EXPECT_EQ(errorOf(read), nullptr) << json.constData();
        auto &source = std::get<JsonSource>(read);
        const auto findVariable = [&](const QString &name) -> std::optional<ValueParser> {
            return name == u"V" ? std::optional(ValueParser(type, id, units)) : std::nullopt;
        };
        kareport::storeJsonObject(JsonNode(source, error), findVariable, object);
    }

    /// The value with its kind; "none" when there is none.
    QString text() const
    {
        const UDictEntry *entry = object.Find(id);
        if (entry == nullptr) {
            return QStringLiteral("none");
        }
        const QString kind = QString::number(entry->GetKind()) + u' ';
        switch (entry->GetKind()) {
        case 1: return kind + QString::number(*static_cast<const bool *>(entry->GetData()) ? 1 : 0);
        case 4: return kind + QString::number(*static_cast<const qint32 *>(entry->GetData()));
        case 8: return kind + QString::number(*static_cast<const double *>(entry->GetData()), 'g', 15);
        case 16: return kind + *static_cast<const QString *>(entry->GetData());
        case 32: return kind + static_cast<const UPointNumber *>(entry->GetData())->Convert();
        default: return QStringLiteral("?");
        }
    }

    UDataObject object;
    std::optional<kareport::InputError> error;
};

TEST(JsonObjectList, StoresMembersByTheTypeOfTheVariable)
{
    struct Row
    {
        int type;
        const char *json;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {VARIABLE_INTEGER, R"({"V": 12})", "4 12", "a whole number"},
        {VARIABLE_INTEGER, R"({"V": 12.0})", "4 12", "12.0 is whole"},
        {VARIABLE_INTEGER, R"({"V": -2147483648})", "4 -2147483648", "the smallest"},
        {VARIABLE_INTEGER, R"({"V": 2147483647})", "4 2147483647", "the largest"},
        {VARIABLE_INTEGER, R"({"V": "12"})", "4 12", "a text of a number"},
        {VARIABLE_DOUBLE, R"({"V": 1250.5})", "8 1250.5", "a number"},
        {VARIABLE_DOUBLE, R"({"V": "INF"})", "8 inf", "infinite has to be a text in JSON"},
        {VARIABLE_DOUBLE, R"({"V": "NAN"})", "8 nan", "not-a-number has to be a text in JSON"},
        {VARIABLE_COORDINATE, R"({"V": -2.5})", "8 -2.5", "metres"},
        {VARIABLE_STATION, R"({"V": "12+345.678"})", "8 12345.678", "a text with its plus"},
        {VARIABLE_STATION, R"({"V": 12345.678})", "8 12345.678", "a number"},
        {VARIABLE_TEXT, R"({"V": "Harbour Board"})", "16 Harbour Board", "a text"},
        {VARIABLE_TEXT, R"({"V": "\u00e4\ud834\udd1e"})", "16 \xC3\xA4\xF0\x9D\x84\x9E", "escapes"},
        {VARIABLE_TEXT, R"({"V": 12})", "16 12", "a number as a text"},
        {VARIABLE_NAME, R"({"V": 0.1})", "16 0.1", "a number as a text"},
        {VARIABLE_NUMBER, R"({"V": "BM-3"})", "32 BM-3", "a point's number"},
        {VARIABLE_NUMBER, R"({"V": 12})", "32 12", "a point's number without quotes"},
        {VARIABLE_NUMBER, R"({"V": 100000})", "32 100000", "no exponent"},
        {VARIABLE_NUMBER, R"({"V": 9007199254740993})", "32 9007199254740993", "with all its digits"},
        {VARIABLE_TEXT, R"({"V": -9223372036854775807})", "16 -9223372036854775807", "with all its digits"},
        {VARIABLE_BOOLEAN, R"({"V": true})", "1 1", "true"},
        {VARIABLE_BOOLEAN, R"({"V": false})", "1 0", "false"},
        {VARIABLE_BOOLEAN, R"({"V": "Yes"})", "1 1", "a word"},
        {VARIABLE_FLAG, R"({"V": 1})", "1 1", "1"},
        {VARIABLE_FLAG, R"({"V": 0})", "1 0", "0"},
        {VARIABLE_FLAG, R"({"V": "*"})", "1 1", "a star"},
        {VARIABLE_DOUBLE, R"({"V": null})", "none", "null means no value"},
        {VARIABLE_TEXT, R"({"V": ""})", "none", "an empty text means no value"},
        {VARIABLE_DOUBLE, R"({"V": ""})", "none", "an empty text means no value"},
        {VARIABLE_DOUBLE, R"({})", "none", "no member"},
        {VARIABLE_DOUBLE, R"({"W": [1, {}], "X": {"V": 1}, "Y": true})", "none", "what the dictionary does not know"},
    };
    for (const Row &row : rows) {
        const StoredObject stored(row.json, row.type);
        EXPECT_FALSE(stored.error) << row.reason << ": " << textOfError(stored.error).toStdString();
        EXPECT_EQ(stored.text(), QString::fromUtf8(row.expected)) << row.reason;
    }
}

TEST(JsonObjectList, NumbersAreMultipliedIntoInternalUnits)
{
    DataUnits units;
    units.length = kareport::LengthUnit::UsSurveyFoot;
    units.area = kareport::AreaUnit::Hectare;
    units.angle = kareport::AngleUnit::Radian;
    EXPECT_EQ(StoredObject(R"({"V": 3937})", VARIABLE_LENGTH, units).text(), QStringLiteral("8 1200"));
    EXPECT_EQ(StoredObject(R"({"V": "3937"})", VARIABLE_LENGTH, units).text(), QStringLiteral("8 1200"));
    EXPECT_EQ(StoredObject(R"({"V": 1.5})", VARIABLE_AREA, units).text(), QStringLiteral("8 15000"));
    EXPECT_EQ(StoredObject(R"({"V": 0.5})", VARIABLE_BEARING, units).text(), QStringLiteral("8 0.5"));
    EXPECT_EQ(StoredObject(R"({"V": 180})", VARIABLE_BEARING).text(),
              QStringLiteral("8 ") + QString::number(std::numbers::pi, 'g', 15));
    units.angle = kareport::AngleUnit::Degree;
    units.sexagesimal = true;
    EXPECT_EQ(StoredObject(R"({"V": "180-00-00"})", VARIABLE_ANGLE, units).text(),
              QStringLiteral("8 ") + QString::number(std::numbers::pi, 'g', 15));
}

TEST(JsonObjectList, AValueThatDoesNotFitIsAnErrorWithItsPlace)
{
    struct Row
    {
        int type;
        const char *json;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {VARIABLE_INTEGER, R"({"V": @1.5})", "a whole number", "not whole"},
        {VARIABLE_INTEGER, R"({"V": @3000000000})", "a whole number", "beyond 32 bits"},
        {VARIABLE_INTEGER, R"({"V": @-3000000000})", "a whole number", "beyond 32 bits below 0"},
        {VARIABLE_INTEGER, R"({"V": @"twelve"})", "a whole number", "a word"},
        {VARIABLE_INTEGER, R"({"V": @true})", "a whole number", "a boolean"},
        {VARIABLE_DOUBLE, R"({"V": @"1,5"})", "a number", "a decimal comma"},
        {VARIABLE_DOUBLE, R"({"V": @[1]})", "a number", "a list"},
        {VARIABLE_DOUBLE, R"({"V": @{}})", "a number", "an object"},
        {VARIABLE_DOUBLE, R"({"V": @false})", "a number", "a boolean"},
        {VARIABLE_TEXT, R"({"V": @["a"]})", "a text", "a list"},
        {VARIABLE_STATION, R"({"V": @"1+2+3"})", "12+345.678", "no station"},
        {VARIABLE_BOOLEAN, R"({"V": @2})", "yes or no", "neither 0 nor 1"},
        {VARIABLE_FLAG, R"({"V": @"x"})", "yes or no", "a letter"},
        {VARIABLE_DOUBLE, "{\"W\": 1,\n  \"V\": @\"x\"}", "\"V\"", "the variable is named"},
    };
    for (const Row &row : rows) {
        const MarkedText marked(row.json);
        const StoredObject stored(marked.text, row.type);
        EXPECT_EQ(placeText(stored.error), marked.place) << row.reason;
        EXPECT_TRUE(textOfError(stored.error).contains(QString::fromUtf8(row.contains)))
            << row.reason << ": " << textOfError(stored.error).toStdString();
    }
}

TEST(JsonObjectList, AnElementThatIsNotAnObjectIsAnError)
{
    auto read = JsonSource::fromBytes(QStringLiteral("job.json"), "{\"values\": [{},\n 5]}");
    auto &source = std::get<JsonSource>(read);
    UDataObject object;
    const auto nothing = [](const QString &) -> std::optional<ValueParser> { return std::nullopt; };
    std::optional<kareport::InputError> error;
    const JsonNode values = JsonNode(source, error)[QStringLiteral("values")];
    kareport::storeJsonObject(values[0], nothing, object);
    EXPECT_FALSE(error);
    kareport::storeJsonObject(values[1], nothing, object);
    EXPECT_EQ(placeText(error), QStringLiteral("2:2"));
    EXPECT_EQ(textOfError(error), QStringLiteral("an object was expected"));
}

/// The list of the values of a data set "d", whose variable "V" is a number with the identifier `id`.
kareport::JsonObjectList listOf(const JsonSource &source, bool firstOnly, const kareport::ReadProgress &progress = {})
{
    const auto findVariable = [](const QString &name) -> std::optional<ValueParser> {
        return name == u"V" ? std::optional(ValueParser(VARIABLE_DOUBLE, id, DataUnits())) : std::nullopt;
    };
    const kareport::JsonPath path = {QStringLiteral("data"), QStringLiteral("d"), QStringLiteral("values")};
    return {source, path, findVariable, firstOnly, progress};
}

TEST(JsonObjectList, HasTheObjectsAsRowsUntilOneIsWrong)
{
    struct Row
    {
        const char *values;
        bool firstOnly;
        std::size_t rows;
        const char *place; ///< of the error; null for none
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"([{"V": 1}, {"V": 2}])", false, 2, nullptr, "a list of objects"},
        {R"({"V": 1})", false, 1, nullptr, "an object is a row"},
        {"[]", false, 0, nullptr, "no row"},
        {R"([{"V": 1}, {"V": 2}])", true, 1, nullptr, "one row is enough"},
        {R"([{"V": 1}, {"V": "x"}])", true, 1, nullptr, "what is not looked at is not wrong"},
        {"[{\"V\": 1},\n{\"V\": \"x\"},\n{\"V\": \"y\"}]", false, 2, "2:7", "the first error counts"},
    };
    for (const Row &row : rows) {
        const QByteArray json = QByteArray(R"({"data": {"d": {"values":)") + "\n" + row.values + "}}}";
        const auto read = JsonSource::fromBytes(QStringLiteral("job.json"), json);
        ASSERT_EQ(errorOf(read), nullptr) << row.reason;
        kareport::JsonObjectList list = listOf(std::get<JsonSource>(read), row.firstOnly);
        std::size_t count = 0;
        while (list.GetAt(count) != nullptr) {
            ++count;
        }
        EXPECT_EQ(count, row.rows) << row.reason;
        EXPECT_EQ(list.error().has_value(), row.place != nullptr) << row.reason;
    }
}

TEST(JsonObjectList, AValueInThePlaceOfAnotherOneIsNotedOnce)
{
    struct Row
    {
        const char *rows;
        const char *note; ///< with its place; empty for none
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"([{"A":1},{"B":2}])", "", "each row has one"},
        {R"([{"A":1,"B":1}])", "", "both are the same"},
        {R"([{"A":1,"B":null}])", "", "null is no value"},
        {R"([{"A":1,"B":2},{"A":3,"B":4}])",
         R"(job.json:1:14: note: a row has values of several variables that have one ID: that of "B" is shown)",
         "the first row that has two"},
        {R"([{"B":2,"A":1}])",
         R"(job.json:1:8: note: a row has values of several variables that have one ID: that of "B" is shown)",
         "members have no order of their own"},
        {R"({"A":1,"B":2})",
         R"(job.json:1:13: note: a row has values of several variables that have one ID: that of "B" is shown)",
         "a single row"},
    };
    const auto findVariable = [](const QString &name) -> std::optional<ValueParser> {
        return name == u"A" || name == u"B" ? std::optional(ValueParser(VARIABLE_LENGTH, id, {})) : std::nullopt;
    };
    for (const Row &row : rows) {
        auto read = JsonSource::fromBytes(QStringLiteral("job.json"), "{\"v\":" + QByteArray(row.rows) + '}');
        ASSERT_EQ(errorOf(read), nullptr);
        kareport::JsonObjectList list(std::get<JsonSource>(read), {QStringLiteral("v")}, findVariable, false, {});
        const auto notes = list.differences();
        ASSERT_EQ(notes.size(), *row.note == 0 ? 0U : 1U) << row.reason;
        EXPECT_EQ(notes.empty() ? QString() : notes[0].messageAs(QStringLiteral("note")), QLatin1StringView(row.note))
            << row.reason;
    }
}

TEST(JsonObjectList, EndsWhenTheWorkIsStopped)
{
    QByteArray json = R"({"data": {"d": {"values": [{"V": 1})";
    for (int i = 1; i < 1000; ++i) {
        json += R"(,{"V": 1})";
    }
    const auto read = JsonSource::fromBytes(QStringLiteral("job.json"), json + "]}}}");
    ASSERT_EQ(errorOf(read), nullptr);
    kareport::JsonObjectList list =
        listOf(std::get<JsonSource>(read), false, [](std::size_t done) { return done < 512; });
    std::size_t count = 0;
    while (list.GetAt(count) != nullptr) {
        ++count;
    }
    EXPECT_EQ(count, 512U);
    EXPECT_FALSE(list.error()) << "stopping is not an error";
}

} // namespace
