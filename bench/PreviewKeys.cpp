// How long it takes from a key in a template's editor to the repainted first page, with many rows of data.
#include "BenchProfile.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "OpenTemplate.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QLabel>
#include <QStandardPaths>
#include <QTemporaryDir>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <vector>

namespace
{

constexpr double nanosecondsInMillisecond = 1e6;

bool write(const QString &path, const QByteArray &content)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

QByteArray points(int rows)
{
    QByteArray data = "Number,Northing,Easting,Elevation,Order,Held,Description\n";
    constexpr int columnsBytes = 64;
    data.reserve(qsizetype(rows) * columnsBytes);
    for (int row = 0; row < rows; ++row) {
        const QByteArray number = QByteArray::number(row + 1);
        const QByteArray mixed = QByteArray::number((row * 7919LL) % rows);
        data += number + ',' + mixed + ".5," + number + ".25,97." + mixed + ",1,true,Point " + number + '\n';
    }
    return data;
}

kareport::TemplateWindow *openWindow()
{
    for (QWidget *widget : QApplication::topLevelWidgets()) {
        if (auto *window = dynamic_cast<kareport::TemplateWindow *>(widget)) {
            return window;
        }
    }
    return nullptr;
}

/// Waits for the pages and has them painted. @return milliseconds
double painted(kareport::TemplateWindow &window, const QElapsedTimer &timer)
{
    while (!window.arePagesUpToDate()) {
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }
    window.page().viewport()->repaint();
    return static_cast<double>(timer.nsecsElapsed()) / nanosecondsInMillisecond;
}

void print(const char *what, std::vector<double> times)
{
    std::sort(times.begin(), times.end());
    std::printf("%-34s median %7.1f ms, worst %7.1f ms, %zu keys\n", what, times[times.size() / 2], times.back(),
                times.size());
}

/// Types keys one after the other at a place of the text, each waiting for its page.
void typeKeys(kareport::TemplateWindow &window, const QString &after, const char *what)
{
    constexpr int keys = 200;
    auto &edit = window.edit();
    const qsizetype at = edit.wholeText().indexOf(after) + after.size();
    edit.select({at, at});
    std::vector<double> times;
    for (int key = 0; key < keys; ++key) {
        QElapsedTimer timer;
        timer.start();
        if (key % 2 == 0) {
            edit.insertPlainText(QStringLiteral("x"));
        } else {
            edit.textCursor().deletePreviousChar();
        }
        times.push_back(painted(window, timer));
    }
    print(what, times);
}

/// Changes the order of the rows: how soon that is said, and when the page is there.
void changeOrder(kareport::TemplateWindow &window)
{
    auto &edit = window.edit();
    QString text = edit.wholeText();
    text.replace(QStringLiteral("<Sort><VariableName>Number"), QStringLiteral("<Sort><VariableName>Northing"));
    QElapsedTimer timer;
    timer.start();
    edit.replaceBy(text, {0, 0});
    double said = -1;
    while (!window.arePagesUpToDate()) {
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        if (said < 0 && !window.message().isHidden()) {
            window.message().repaint();
            said = static_cast<double>(timer.nsecsElapsed()) / nanosecondsInMillisecond;
        }
    }
    std::printf("%-34s said after %.1f ms, page after %.1f ms\n", "another order of all rows", said,
                painted(window, timer));
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QStandardPaths::setTestModeEnabled(true);
    kareport::useBenchProfile();
    constexpr int usualRows = 1'000'000;
    const int rows = argc > 2 ? std::atoi(argv[2]) : usualRows;
    if (argc < 2) {
        std::fputs("usage: ka_preview_keys EXAMPLES [ROWS]\n", stderr);
        return 2;
    }
    const QTemporaryDir folder;
    const QString examples = QString::fromLocal8Bit(argv[1]);
    QFile::copy(examples + QStringLiteral("/survey.xml"), folder.filePath(QStringLiteral("survey.xml")));
    if (!write(folder.filePath(QStringLiteral("points.csv")), points(rows)) ||
        !write(folder.filePath(QStringLiteral("job.json")),
               R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 100},
                   "template": {"file": "survey.xml", "name": "CONTROL"}, "data": {"p": {"csv": "points.csv"}},
                   "report": [{"table": "Points", "data": "p"}]})"))
    {
        return 1;
    }
    DeskApplication desk;
    DeskFrame frame;
    kareport::openTemplateAt(folder.filePath(QStringLiteral("survey.xml")));
    kareport::TemplateWindow *window = openWindow();
    if (window == nullptr) {
        return 1;
    }
    QElapsedTimer timer;
    timer.start();
    painted(*window, timer);
    timer.start();
    window->setData({folder.filePath(QStringLiteral("job.json"))});
    std::printf("%-34s %.1f ms\n", "first page of the data", painted(*window, timer));
    typeKeys(*window, QStringLiteral("<Label>Northing"), "a key in a label");
    typeKeys(*window, QStringLiteral("<Format>14.4</Format>"), "a key between two elements");
    changeOrder(*window);
    typeKeys(*window, QStringLiteral("<Label>Easting"), "a key in a label, other order");
    return 0;
}
