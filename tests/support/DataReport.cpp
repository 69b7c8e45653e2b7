#include "DataReport.h"

TableReport::TableReport(const std::vector<QByteArray> &fields, const char *separator, int linesPerPage,
                         std::initializer_list<const char *> sortKeys)
{
    folders_.putIntoLibrary(markup::surveyTemplate(markup::output("Table", "Points", "Survey", fields, sortKeys),
                                                   QByteArray(), markup::separatorOption(separator)));
    report.FixPage(linesPerPage, 80);
    EXPECT_TRUE(
        report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QStringLiteral("Points"), QString()));
    report.SetModifiedFlag(false);
}

void TableReport::goToLine(int line)
{
    report.Write(QStringLiteral("start"), 0);
    report.NewPage(0);
    report.LineFeed(line - 1);
}

UDataObject &TableReport::add(const char *number)
{
    UDataObject &object = list.Add();
    object.Set(1, UPointNumber(QString::fromUtf8(number)));
    return object;
}

QString TableReport::write(int before, int after, int headingAfter)
{
    const qsizetype size = report.GetText().size();
    EXPECT_TRUE(report.WriteDataTable(&list, before, after, headingAfter));
    return report.GetText().sliced(size).toString();
}

BlockReport::BlockReport(const std::vector<QByteArray> &fields, const char *separator, int linesPerPage)
{
    folders_.putIntoLibrary(markup::surveyTemplate(QByteArray(), markup::output("Block", "Site", "Survey", fields),
                                                   markup::separatorOption(separator)));
    report.FixPage(linesPerPage, 80);
    EXPECT_TRUE(
        report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QString(), QStringLiteral("Site")));
    report.SetModifiedFlag(false);
}

QString BlockReport::write(int before, int after)
{
    const qsizetype size = report.GetText().size();
    EXPECT_TRUE(report.WriteDataBlock(&object, before, after));
    return report.GetText().sliced(size).toString();
}
