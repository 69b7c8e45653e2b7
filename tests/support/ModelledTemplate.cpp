#include "ModelledTemplate.h"

#include "UDataObjectList.h"
#include "UPointNumber.h"

#include <algorithm>
#include <iterator>

namespace
{

using markup::field;

/// A table of the template, with the heading and the rows that its fields lay out.
struct KnownTable
{
    const char *name;
    const char16_t *heading;
    bool isSorted;
    int numberWidth; ///< of its first column; 0 without that
};

constexpr KnownTable tables[] = {
    {"Points", u"Point |     North", false, 6},
    {"Sorted", u"Point |     North", true, 6},
    {"Wide", u"Point number|     North", false, 12},
    {"Bare", u"", false, 0},
};

QByteArray tablesMarkup()
{
    const QByteArray north = field("Northing", "North", "10.3", "RIGHT");
    const auto table = [](const char *name, const std::vector<QByteArray> &fields,
                          std::initializer_list<const char *> sortKeys = {}) {
        return markup::output("Table", name, "Survey", fields, sortKeys);
    };
    return table("Points", {field("Number", "Point", "6"), north}) +
           table("Sorted", {field("Number", "Point", "6"), north}, {"Northing"}) +
           table("Wide", {field("Number", "Point number", "6"), north}) + table("Bare", {field("Northing", "", "0.3")});
}

QByteArray blockMarkup()
{
    return markup::output(
        "Block", "Site", "Survey",
        {field("Note", "Client:  ", "30"), field("Northing", "North", "12.3", "RIGHT"), field("Number", "Point", "8")});
}

/// The coordinate of a point: all differ, and their order is not that of the points.
double northingOf(int point)
{
    constexpr int apart = 17; // has no factor in common with the step
    return (point * 5 % apart) * 2.5;
}

QString rowOf(const KnownTable &table, int point)
{
    const QString north = QString::number(northingOf(point), 'f', 3);
    return table.numberWidth == 0
               ? north
               : QStringLiteral("P%1").arg(point).leftJustified(table.numberWidth) + u'|' + north.rightJustified(10);
}

} // namespace

ModelledTemplate::ModelledTemplate(UReportDoc &report) : report_(report)
{
    folders_.putIntoLibrary(markup::surveyTemplate(tablesMarkup(), blockMarkup(), markup::separatorOption("124")));
    EXPECT_TRUE(
        report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QString(), QStringLiteral("Site")));
    report.SetModifiedFlag(false);
}

bool ModelledTemplate::writeTable(ReportModel &model, const ReportStep &step)
{
    const KnownTable &table = tables[std::size_t(step.b) % std::size(tables)];
    const int count = step.a % 15;
    UDataObjectList list;
    std::vector<int> points;
    for (int point = 0; point < count; ++point) {
        UDataObject &object = list.Add();
        object.Set(1, UPointNumber(QStringLiteral("P%1").arg(point)));
        object.Set(2, northingOf(point));
        points.push_back(point);
    }
    if (table.isSorted) {
        std::sort(points.begin(), points.end(), [](int a, int b) { return northingOf(a) < northingOf(b); });
    }
    ModelTable expected;
    expected.heading = QString::fromUtf16(table.heading);
    for (const int point : points) {
        expected.rows += rowOf(table, point);
    }
    expected.before = step.c % 4 - 1;
    expected.after = step.c / 4 % 4 - 1;
    const int headingAfter = step.c / 16 % 5 - 1;
    expected.headingAfter = headingAfter == -1 ? 2 : headingAfter;
    const bool hasName = step.c / 80 % 2 == 0;
    expected.name = hasName ? QString::fromLatin1(table.name) : QString();
    report_.WriteTableName(hasName);
    model.writeTable(expected);
    return report_.WriteDataTable(QString::fromLatin1(table.name), &list, expected.before, expected.after,
                                  headingAfter);
}

bool ModelledTemplate::writeBlock(ReportModel &model, const ReportStep &step)
{
    UDataObject site;
    QStringList lines;
    if (step.a % 2 == 0) {
        site.Set(6, QStringLiteral(" Harbour Board "));
        lines += QStringLiteral("Client:  |Harbour Board");
    }
    if (step.a / 2 % 2 == 0) {
        site.Set(2, -7.25);
        lines += QStringLiteral("North|-7.250");
    }
    if (step.a / 4 % 2 == 0) {
        site.Set(1, UPointNumber(QStringLiteral("12A")));
        lines += QStringLiteral("Point|12A");
    }
    const int before = step.b % 4 - 1;
    const int after = step.c % 4 - 1;
    model.writeBlock(lines, before, after);
    return report_.WriteDataBlock(&site, before, after);
}
