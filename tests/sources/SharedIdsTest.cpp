#include "CsvObjectList.h"
#include "GeoPackageFile.h"
#include "InputErrorText.h"
#include "JobFolder.h"
#include "JsonFileList.h"
#include "SqliteObjectList.h"
#include "VariableType.h"

#include <gtest/gtest.h>

// Columns whose variables have one identifier.

namespace
{

using kareport::RowList;

/// Number, and two variables of one identifier.
kareport::Variables variables()
{
    kareport::Variables result;
    result.names = {QStringLiteral("Number"), QStringLiteral("Before"), QStringLiteral("After")};
    result.find = [](const QString &name) -> std::optional<kareport::ValueParser> {
        const kareport::DataUnits units;
        if (name == u"Number") {
            return kareport::ValueParser(VARIABLE_TEXT, 1, units);
        }
        return name == u"Before" || name == u"After" ? std::optional(kareport::ValueParser(VARIABLE_DOUBLE, 2, units))
                                                     : std::nullopt;
    };
    return result;
}

/// What shows of each row.
QStringList shownOf(RowList &list)
{
    QStringList shown;
    for (std::size_t i = 0; const UDataObject *object = list.GetAt(i); ++i) {
        const UDictEntry *entry = object->Find(2);
        shown.append(entry != nullptr ? QString::number(std::get<double>(entry->value())) : QStringLiteral("-"));
    }
    return shown;
}

void expectNote(RowList &list, const char *place, const char *reason)
{
    EXPECT_EQ(shownOf(list), QStringList({QStringLiteral("1"), QStringLiteral("2"), QStringLiteral("3"),
                                          QStringLiteral("5"), QStringLiteral("7"), QStringLiteral("-")}))
        << reason << ": the last value of a row";
    const auto notes = list.differences();
    ASSERT_EQ(notes.size(), 1U) << reason << ": said once";
    EXPECT_EQ(notes[0].place ? placeText(notes[0]) : QString(), QLatin1StringView(place)) << reason;
    EXPECT_EQ(notes[0].text.toStdString(),
              "a row has values in several columns whose variables have one ID: that of \"After\", the last one, shows")
        << reason;
}

TEST(SharedIds, ARowWithTwoValuesOfOneIsNotedOnce)
{
    const JobFolder folder;
    const auto csv = kareport::FileBytes::holding(QStringLiteral("p.csv"),
                                                  "Number,Before,After\na,1,\nb,,2\nc,3,3\nd,4,5\ne,6,7\nf,,\n");
    kareport::CsvObjectList text(csv, kareport::CsvDialect(), variables(), {});
    expectNote(text, "5:5", "CSV: both are there in line 5, and differ");

    const auto json = kareport::FileBytes::holding(
        QStringLiteral("p.json"), "[{\"Before\":1},{\"After\":2},{\"Before\":3,\"After\":3},\n"
                                  "{\"Before\":4,\"After\":5},{\"Before\":6,\"After\":7},{\"Number\":\"f\"}]");
    kareport::JsonFileList objects(json, {}, variables(), {});
    expectNote(objects, "2:21", "JSON");

    geo::runSql(folder.path("p.db"), "CREATE TABLE p (Number TEXT, Before REAL, After REAL); "
                                     "INSERT INTO p VALUES ('a', 1, NULL), ('b', NULL, 2), ('c', 3, 3), ('d', 4, 5), "
                                     "('e', 6, 7), ('f', NULL, NULL)");
    kareport::SqliteObjectList table({folder.path("p.db"), QStringLiteral("p"), QString(), {}}, variables(), {});
    expectNote(table, "", "SQLite, which has no places");
}

TEST(SharedIds, RowsThatHaveOneValueEachAreSound)
{
    const auto csv = kareport::FileBytes::holding(QStringLiteral("p.csv"), "Number,Before,After\na,1,\nb,,2\nc,3,3\n");
    kareport::CsvObjectList list(csv, kareport::CsvDialect(), variables(), {});
    EXPECT_EQ(shownOf(list).size(), 3);
    EXPECT_TRUE(list.differences().empty());
}

} // namespace
