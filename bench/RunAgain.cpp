// The report of a job of many rows, open at the desk in its middle: from the choice of another unit to the page painted with
// it.
//
//   ka_run_again [ROWS]    100,000 rows unless it is said; prints milliseconds, one line a time
#include "BenchProfile.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "DeskRuns.h"
#include "ReportEdit.h"
#include "ReportEntry.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QJsonObject>
#include <QTemporaryDir>
#include <QTextDocument>

#include <algorithm>
#include <cstdio>
#include <vector>

namespace
{

bool put(const QString &path, const QByteArray &content)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

QByteArray rows(int count)
{
    QByteArray text = "Number,Northing,Easting,Elevation,Station,Description\n";
    for (int row = 0; row < count; ++row) {
        const QByteArray number = QByteArray::number(row);
        text += number + ',' + QByteArray::number(5'000'000 + row * 0.25, 'f', 3) + ',' +
                QByteArray::number(400'000 + row * 0.5, 'f', 3) + ',' + QByteArray::number(100 + row % 50) + ".25," +
                number + ".5,nail in kerb\n";
    }
    return text;
}

QByteArray pointsTemplate()
{
    struct Column
    {
        const char *name;
        const char *type;
        const char *format;
    };
    constexpr Column columns[] = {{"Number", "NUMBER", "8"},         {"Northing", "COORDINATE", "15.3"},
                                  {"Easting", "COORDINATE", "15.3"}, {"Elevation", "ELEVATION", "10.3"},
                                  {"Station", "STATION", "16"},      {"Description", "TEXT", "20"}};
    QByteArray fields;
    QByteArray variables;
    int id = 0;
    for (const Column &column : columns) {
        fields += QByteArray("<Field><VariableName>") + column.name + "</VariableName><Label>" + column.name +
                  "</Label><Format>" + column.format + "</Format></Field>";
        variables += "<Variable><ID>" + QByteArray::number(++id) + "</ID><VariableName>" + column.name +
                     "</VariableName><Type>" + column.type + "</Type></Variable>";
    }
    return "<ReportTemplate><Name>T</Name><Title>Points</Title><Tables><Table><Name>Points</Name><Use>D</Use><OutputList>" +
           fields +
           "</OutputList></Table></Tables><Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>" +
           variables + "</VariableList></Dictionary></Dictionaries></ReportTemplate>";
}

UReportView *openInView(DeskFrame &frame, const QString &job)
{
    if (!frame.OpenFile(job)) {
        return nullptr;
    }
    auto *report = dynamic_cast<UReportDoc *>(GetReportTemplate()->GetDocuments().back());
    auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    if (window != nullptr && window->isCreated()) {
        window->ShowReport();
    }
    for (UView *view : report->GetViews()) {
        if (auto *shown = dynamic_cast<UReportView *>(view); shown != nullptr && view->IsVisible()) {
            shown->GetEdit().finishLoading();
            return shown;
        }
    }
    return nullptr;
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QApplication::setApplicationName(QStringLiteral("KaReport"));
    kareport::useBenchProfile();
    const int count = argc > 1 ? QByteArray(argv[1]).toInt() : 100'000;
    const QTemporaryDir folder;
    const QString job = folder.filePath(QStringLiteral("job.json"));
    if (!put(folder.filePath(QStringLiteral("p.csv")), rows(count)) ||
        !put(folder.filePath(QStringLiteral("t.xml")), pointsTemplate()) ||
        !put(job, R"({"template": {"file": "t.xml", "name": "T"}, "data": {"p": {"csv": "p.csv"}},
                      "report": [{"table": "Points", "data": "p"}]})"))
    {
        return 1;
    }
    DeskApplication desk;
    DeskFrame frame;
    kareport::installDialogs(&frame);
    frame.show();
    UReportView *view = openInView(frame, job);
    if (view == nullptr) {
        std::fprintf(stderr, "the report was not made\n");
        return 1;
    }
    kareport::ReportEdit &edit = view->GetEdit();
    edit.goToLine(edit.document()->blockCount() / 2);
    QCoreApplication::processEvents();
    std::vector<qint64> times;
    for (const char *unit : {"ft", "m", "usft", "km", "mm", "ft", "m", "usft", "m"}) {
        QElapsedTimer time;
        time.start();
        if (!frame.runs().runWith(*view->GetDocument(), {{QStringLiteral("lengthUnit"), QString::fromLatin1(unit)}})) {
            return 1;
        }
        edit.viewport()->repaint();
        times.push_back(time.elapsed());
        QCoreApplication::processEvents();
        std::printf("to %s: %lld ms, line %d of %d\n", unit, static_cast<long long>(times.back()),
                    edit.textCursor().blockNumber() + 1, edit.document()->blockCount());
    }
    std::sort(times.begin(), times.end());
    std::printf("median %lld ms, longest %lld ms\n", static_cast<long long>(times[times.size() / 2]),
                static_cast<long long>(times.back()));
    return 0;
}
