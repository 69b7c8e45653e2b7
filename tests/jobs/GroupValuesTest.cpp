#include "LayersJob.h"

#include <gtest/gtest.h>

// That no binary rounding reaches what is computed and added up.

namespace
{

using jobs::run;
using jobs::TestJob;

QStringList notesOf(const TestJob &test)
{
    QStringList notes;
    for (const auto &note : test.notes.said()) {
        notes.append(note.about.text);
    }
    return notes;
}

TEST(GroupValues, DegreesMinutesAndSecondsAreAddedAsSuch)
{
    QByteArray rows;
    for (int i = 0; i < 9; ++i) {
        rows += QByteArray(i == 0 ? "" : ",") + R"({"Number": ")" + QByteArray::number(i) + R"(", "Turn": "0-00-20"})";
    }
    TestJob test;
    const QString text = run(test, R"("table": "Angles", "data": "v", "totals": [{"sum": "Turn"}])",
                             R"("v": {"units": {"angle": "dms"}, "values": [)" + rows + "]}");
    EXPECT_EQ(text.trimmed().section(u'\n', -1).section(u'|', 1, 1).trimmed(), QStringLiteral("0.0"))
        << "0.05 degrees are a tie, which goes to the even digit";
}

TEST(GroupValues, ADifferenceOfSecondsIsNotOutsideItself)
{
    TestJob test;
    const QString text = run(test, R"("table": "Angles", "data": "v",
        "flags": [{"variable": "Note", "text": "off", "of": "Bearing", "beside": "Other", "outside": "0-00-20"}])",
                             R"("v": {"units": {"angle": "dms"}, "values": [
        {"Number": "1", "Bearing": "10-00-20", "Other": "10-00-00"}, {"Number": "2", "Bearing": "77-13-49", "Other": "77-13-29"},
        {"Number": "3", "Bearing": "359-59-50", "Other": "0-00-10"}, {"Number": "4", "Bearing": "0-00-10", "Other": "359-59-49"},
        {"Number": "5", "Bearing": "S10-00-20W", "Other": "S10-00-00W"}]})");
    QString flags;
    for (const QString &line : text.split(u'\n').sliced(3)) {
        flags += line.section(u'|', 0, 0).trimmed() + line.section(u'|', 3).trimmed() + u' ';
    }
    EXPECT_EQ(flags.trimmed(), QStringLiteral("1 2 3 4off 5"));
}

TEST(GroupValues, DirectionsStayWithinATurn)
{
    TestJob test;
    const QString text = run(test, R"("table": "Angles", "data": "v",
        "compute": [{"variable": "Turn", "difference": ["Bearing", "Other"]}])",
                             R"("v": {"units": {"angle": "deg"}, "values": [
        {"Number": "1", "Bearing": 10, "Other": 350}, {"Number": "2", "Bearing": 350, "Other": 10},
        {"Number": "3", "Bearing": 270, "Other": 90}]})");
    QString turns;
    for (const QString &line : text.split(u'\n').sliced(3)) {
        turns += line.section(u'|', 1, 1).trimmed() + u' ';
    }
    EXPECT_EQ(turns.trimmed(), QStringLiteral("20.0 -20.0 180.0"));
}

TEST(GroupValues, ANumberBeyondAllIsInfiniteAndNotZero)
{
    TestJob test;
    const QString text =
        run(test, R"("table": "Wide", "data": "v", "compute": [{"variable": "Step", "product": ["Row", "Length"]}],
        "where": [{"of": "Step", "above": 1e300}])",
            R"("v": {"values": [{"Row": 2000000000, "Length": 1e307}, {"Row": 1, "Length": 1}]})");
    EXPECT_EQ(text.count(u'\n'), 4) << "one row: " << text.toStdString();
    EXPECT_EQ(notesOf(test).filter(QStringLiteral("\"Step\"")).filter(QStringLiteral("infinite")).size(), 1)
        << notesOf(test).join(u'\n').toStdString();
}

TEST(GroupValues, WhatARunningSumPassesOverIsNoted)
{
    TestJob test;
    run(test, R"("table": "Wide", "data": "v", "running": [{"variable": "Step", "sum": "Length"}])",
        R"("v": {"values": [{"Number": "1", "Length": 1}, {"Number": "2"}, {"Number": "3", "Length": "INF"}]})");
    EXPECT_EQ(notesOf(test).filter(QStringLiteral("running")).join(u'|').toStdString(),
              "1 value of the variable \"Length\" is missing and in no running sum of the table \"Wide\", in row 2|"
              "1 value of the variable \"Length\" is infinite or not a number and in no running sum of the table "
              "\"Wide\", in row 3");
}

TEST(GroupValues, ATotalThatIsTooWideIsSaidSo)
{
    TestJob test;
    run(test, R"("table": "Free", "data": "v", "totals": [{"label": "All", "sum": "Area"}])",
        R"("v": {"values": [{"Number": "1", "Area": 9999.5}, {"Number": "2", "Area": 9999.5}]})");
    EXPECT_EQ(notesOf(test).filter(QStringLiteral("wider")).join(u'\n').toStdString(),
              "1 total is wider than the field \"Area\" of the table \"Free\", under row 2, line 5 of the report");
}

TEST(GroupValues, ALabelIsNotTakenForTheTotal)
{
    TestJob test;
    const QString text = run(test, R"("table": "Wide", "data": "v", "totals": [{"label": "1", "count": "Number"}])",
                             R"("v": {"values": [{"Number": "1"}]})");
    const QStringList lines = text.split(u'\n').sliced(4);
    ASSERT_GE(lines.size(), 3) << text.toStdString();
    EXPECT_EQ(lines[1].toStdString(), "1") << "the label has no room before the first column";
    EXPECT_EQ(lines[2].section(u'|', 0, 0).trimmed().toStdString(), "1");
}

TEST(GroupValues, AnOffsetInAHeadingHasTheSignOfItsColumn)
{
    TestJob test;
    const QString text = run(test, R"("table": "Sides", "data": "v", "sort": "Side",
        "groups": [{"by": "Side", "heading": "Line {Side}, {max:Side}"}])",
                             R"("v": {"values": [{"Number": "1", "Side": -2.5}, {"Number": "2", "Side": 2.5}]})");
    EXPECT_TRUE(text.contains(u"Line -2.5, -2.5\n")) << text.toStdString();
    EXPECT_TRUE(text.contains(u"Line +2.5, +2.5\n")) << text.toStdString();
}

TEST(GroupValues, ANumberThatIsOnlyCountedIsNoted)
{
    TestJob test;
    run(test, R"("table": "Free", "data": "v", "totals": [{"count": ["Area", "Layer"]}])",
        R"("v": {"values": [{"Number": "1", "Area": 1, "Layer": "a"}, {"Number": "2"}]})");
    EXPECT_EQ(notesOf(test).filter(QStringLiteral("in no total")).join(u'\n').toStdString(),
              "1 value of the variable \"Area\" is missing and in no total of the table \"Free\", in row 2");
}

} // namespace
