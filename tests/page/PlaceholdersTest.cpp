#include "Placeholders.h"
#include "PageMark.h"
#include "PageWriter.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::pageMark;
using kareport::PageWriter;
using kareport::Placeholders;

Placeholders placeholdersIn(kareport::LengthUnit length, const std::optional<QString> &title = QStringLiteral("Job"))
{
    UJobSettings settings;
    settings.lengthUnit = length;
    settings.areaUnit = kareport::AreaUnit::Acre;
    settings.angleUnit = kareport::AngleUnit::Gon;
    return {settings, QStringLiteral("TALVEN"), QDateTime(QDate(2024, 3, 5), QTime(14, 7)), title};
}

TEST(Placeholders, StandForTheirValues)
{
    const Placeholders placeholders = placeholdersIn(kareport::LengthUnit::UsSurveyFoot);
    const struct
    {
        const char *text;
        const char *shown;
        const char *reason;
    } rows[] = {
        {"", "", "nothing"},
        {"North", "North", "no placeholder"},
        {"{lengthUnit}", "US ft", "not the international foot"},
        {"{areaUnit}|{angleUnit}", "ac|gon", "two of them"},
        {"{date}, {time}", "Mar 05, 2024, 02:07PM", "as in page headers"},
        {"{title} {application}", "Job TALVEN", "names"},
        {"{{", "{", "a brace"},
        {"{{lengthUnit}", "{lengthUnit}", "a brace before a name"},
        {"{{{lengthUnit}}", "{US ft}", "a brace, a placeholder and another brace"},
        {"a } b", "a } b", "a closing brace alone"},
        {"{LengthUnit} {x} {", "{LengthUnit} {x} {", "what is wrong stays"},
    };
    for (const auto &row : rows) {
        EXPECT_EQ(placeholders.textOf(QString::fromUtf8(row.text), QStringLiteral("T")).toStdString(), row.shown)
            << row.reason;
    }
    EXPECT_EQ(placeholders.textOf(u"p {page}", QString()), QStringLiteral("p ") + QChar(pageMark));
    EXPECT_EQ(placeholders.labelOf(u"p {page}", QString()), QStringLiteral("p ") + QString(3, pageMark));
    EXPECT_EQ(placeholdersIn(kareport::LengthUnit::InternationalFoot, std::nullopt)
                  .textOf(u"{title} {lengthUnit}", QStringLiteral("T"))
                  .toStdString(),
              "T ft")
        << "without a title, that of the template";
}

TEST(Placeholders, WhatIsWrongIsSaidWithWhatWouldBeRight)
{
    const std::string all =
        "one of {lengthUnit}, {areaUnit}, {angleUnit}, {date}, {time}, {title}, {application}, {page} "
        "was expected";
    const struct
    {
        const char *text;
        std::string message;
        const char *reason;
    } rows[] = {
        {"{lenghtUnit}", "unknown placeholder {lenghtUnit}: " + all + "; did you mean \"{lengthUnit}\"?", "misspelt"},
        {"{PAGE}", "unknown placeholder {PAGE}: " + all + "; did you mean \"{page}\"?", "in capitals"},
        {"{page} {wholly}", "unknown placeholder {wholly}: " + all, "nothing is near"},
        {"{}", "unknown placeholder {}: " + all, "no name"},
        {"a {b", "\"{b\" begins a placeholder that does not end: \"}\" was expected, or \"{{\" for a brace", "no end"},
        {"{a placeholder that is longer than a message may be}",
         "unknown placeholder {a placeholder that is longer than a mess…}: " + all, "a long name is cut short"},
    };
    for (const auto &row : rows) {
        const auto wrong = Placeholders::wrongIn(QString::fromUtf8(row.text));
        ASSERT_TRUE(wrong) << row.reason;
        EXPECT_EQ(wrong->toStdString(), row.message) << row.reason;
    }
    for (const QString &name : Placeholders::names()) {
        EXPECT_FALSE(Placeholders::wrongIn(u'{' + name + u'}')) << name.toStdString();
    }
    EXPECT_FALSE(Placeholders::wrongIn(u"{{x a } b"));
}

TEST(Placeholders, PageMarksBecomeTheNumberOfThePage)
{
    const QString one(1, pageMark);
    const QString three(3, pageMark);
    EXPECT_EQ(kareport::withPageNumber(QString(u'a' + one + u'b'), 12), u"a12b"_qs);
    EXPECT_EQ(kareport::withPageNumber(QString(three + u'|' + one), 12), u" 12|12"_qs);
    EXPECT_EQ(kareport::withPageNumber(three, 1234), u"1234"_qs);

    PageWriter writer;
    writer.setLinesPerPage(10);
    writer.setHeaderFlag(true);
    writer.setPageMarks(true);
    writer.setHeading({QStringLiteral("sheet ") + one, 0, 1});
    const QString first = one + QStringLiteral(" of text");
    writer.writeNumberedLine(first, 1, 0, 1, 0);
    const QString next = QStringLiteral("next ") + one;
    writer.writeNumberedLine(next, next.size(), -1, 1, 0); // begins a page
    writer.writeLine(QStringView(one), 0, 1, 0);
    const QString text = writer.text().view().toString();
    EXPECT_TRUE(text.contains(u"sheet 1\r\n1 of text\r\n")) << text.toStdString();
    EXPECT_TRUE(text.contains(u"sheet 2\r\nnext 2\r\n")) << "the page that the line is on: " << text.toStdString();
    EXPECT_TRUE(text.endsWith(one + QStringLiteral("\r\n"))) << "of a text of the data nothing is made";

    PageWriter plain;
    plain.writeNumberedLine(QStringView(one), 1, 0, 0, 0);
    EXPECT_EQ(plain.text().view(), one) << "without placeholders every text stays";
}

} // namespace
