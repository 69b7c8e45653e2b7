#include "TableDesk.h"

#include "UReportWindowDlg.h"

#include <QAction>
#include <QRegularExpression>

TableDesk::TableDesk()
{
    folder.put("t.xml", "<ReportTemplate><Name>T</Name><Title>Points</Title>"
                        "<Tables><Table><Name>Points</Name><Use>D</Use><OutputList>"
                        "<Field><VariableName>Number</VariableName><Label>Pt</Label><Format>5</Format></Field>"
                        "<Field><VariableName>North</VariableName><Label>North</Label><Format>12.3</Format>"
                        "<Align>RIGHT</Align></Field></OutputList></Table></Tables>"
                        "<Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>"
                        "<Variable><ID>1</ID><VariableName>Number</VariableName><Type>NUMBER</Type></Variable>"
                        "<Variable><ID>2</ID><VariableName>North</VariableName><Type>COORDINATE</Type></Variable>"
                        "</VariableList></Dictionary></Dictionaries></ReportTemplate>");
    putRows(3);
    folder.put("job.json", R"({"template": {"file": "t.xml", "name": "T"}, "data": {"p": {"csv": "p.csv"}},
        "page": {"linesPerPage": 60, "charsPerRow": 80}, "report": [{"table": "Points", "data": "p"}]})");
    answer = MessageAnswer::No;
}

QByteArray TableDesk::rows(int count, int first)
{
    QByteArray rows = "Number,North\n";
    for (int row = 0; row < count; ++row) {
        rows += QByteArray::number(row + 1) + ',' + QByteArray::number(first + row) + '\n';
    }
    return rows;
}

UReportDoc *TableDesk::open(const char *job)
{
    if (!frame->OpenFile(folder.path(job))) {
        return nullptr;
    }
    UReportDoc *report = reports().back();
    auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    if (window != nullptr && window->isCreated()) {
        window->ShowReport();
    }
    QCoreApplication::processEvents();
    return report;
}

UReportView *TableDesk::viewOf(const UReportDoc &report)
{
    for (UView *view : report.GetViews()) {
        if (auto *reportView = dynamic_cast<UReportView *>(view); reportView != nullptr && view->IsVisible()) {
            return reportView;
        }
    }
    return nullptr;
}

QStringList TableDesk::northings(const UReportDoc &report)
{
    static const QRegularExpression row(QStringLiteral("^\\s*[0-9]+[^0-9.]+(-?[0-9]+\\.[0-9]+)\\s*$"));
    QStringList found;
    for (const QString &line : textOf(report).split(u'\n')) {
        if (const QRegularExpressionMatch match = row.match(line); match.hasMatch()) {
            found.append(match.captured(1));
        }
    }
    return found;
}

bool TableDesk::isEnabled(unsigned command)
{
    frame->UpdateCommands();
    return frame->CommandAction(command)->isEnabled();
}
