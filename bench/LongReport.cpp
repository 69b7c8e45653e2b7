// A long report opened at the desk, or a text in a bare control in pieces of 10,000 lines: from the call to all of it
// shown, the longest time in which the window did not answer, and the processor time of the work that took longest.
//
//   ka_long_report FILE              the report file FILE is opened
//   ka_long_report FILE --bare       the text FILE in the bare control
//   ka_long_report FILE --view-edit  a report that was made of the lines of FILE is opened by View\Edit Report
#include "BenchProfile.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "ProcessorTime.h"
#include "ReportEdit.h"
#include "ReportEntry.h"
#include "ReportWindowEntry.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QFontDatabase>
#include <QPlainTextEdit>
#include <QTextBlock>
#include <QTimer>

#include <algorithm>
#include <cstdio>
#include <functional>

namespace
{

/// Ticks as often as possible and keeps the longest time between two ticks.
class Pulse
{
public:
    Pulse()
    {
        QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { beat(); });
        timer_.start(1);
        since_.start();
    }
    void beat()
    {
        longest_ = std::max(longest_, since_.restart());
        const double now = threadMilliseconds();
        longestWork_ = std::max(longestWork_, now - work_);
        work_ = now;
    }
    qint64 longest() const { return longest_; }
    /// The most processor time between two ticks.
    double longestWork() const { return longestWork_; }

private:
    QTimer timer_;
    QElapsedTimer since_;
    qint64 longest_ = 0;
    double work_ = threadMilliseconds();
    double longestWork_ = 0;
};

void waitUntil(const std::function<bool()> &isDone)
{
    while (!isDone()) {
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }
}

void openBare(const QByteArray &bytes, QPlainTextEdit &edit)
{
    constexpr int linesOfPiece = 10'000;
    edit.setUndoRedoEnabled(false);
    edit.show();
    for (qsizetype at = 0; at < bytes.size();) {
        qsizetype end = at;
        for (int line = 0; line < linesOfPiece && end < bytes.size(); ++line) {
            const qsizetype feed = bytes.indexOf('\n', end);
            end = feed < 0 ? bytes.size() : feed + 1;
        }
        QTextCursor cursor(edit.document());
        cursor.movePosition(QTextCursor::End);
        cursor.insertText(QString::fromUtf8(QByteArrayView(bytes).sliced(at, end - at)));
        at = end;
        QCoreApplication::processEvents();
    }
}

/// A report of the lines of a text, as a job makes it: the report window shows them.
UReportWindowDlg *makeInWindow(const QByteArray &text)
{
    UReportDoc *report = CreateReportWindow(QStringLiteral("Report"), false, false);
    for (const QByteArray &line : text.split('\n')) {
        report->WriteLine(QString::fromUtf8(line), 0, 1, 0);
    }
    report->SetReportWindowActive();
    return dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
}

/// Waits until the report that was opened last is shown as a whole. @return its lines
int linesOfShownReport()
{
    const auto *report = dynamic_cast<UReportDoc *>(GetReportTemplate()->GetDocuments().back());
    const auto *view = dynamic_cast<UReportView *>(report->GetViews().front());
    waitUntil([view] { return !view->GetEdit().isLoading(); });
    return view->GetEdit().document()->blockCount();
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QApplication::setApplicationName(QStringLiteral("KaReport"));
    kareport::useBenchProfile();
    const QStringList arguments = QApplication::arguments();
    if (arguments.size() < 2) {
        std::fprintf(stderr, "ka_long_report FILE [--bare | --view-edit]\n");
        return 1;
    }
    const bool isBare = arguments.value(2) == QStringLiteral("--bare");
    const bool isEdited = arguments.value(2) == QStringLiteral("--view-edit");
    QFile file(arguments[1]);
    if ((isBare || isEdited) && !file.open(QIODevice::ReadOnly)) {
        return 1;
    }
    DeskApplication desk;
    DeskFrame frame;
    kareport::installDialogs(&frame);
    QPlainTextEdit edit;
    edit.setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    edit.setLineWrapMode(QPlainTextEdit::NoWrap);
    edit.resize(1000, 700);
    if (!isBare) {
        frame.show();
    }
    UReportWindowDlg *window = isEdited ? makeInWindow(file.readAll()) : nullptr;
    QCoreApplication::processEvents();
    Pulse pulse;
    QElapsedTimer time;
    time.start();
    int lines = 0;
    if (isBare) {
        openBare(file.readAll(), edit);
        lines = edit.document()->blockCount();
    } else {
        if (window != nullptr) {
            window->OnShowReport();
        } else if (!frame.OpenFile(arguments[1])) {
            return 1;
        }
        lines = linesOfShownReport();
    }
    QCoreApplication::processEvents();
    pulse.beat();
    std::printf("{\"seconds\": %.3f, \"longest_pause_ms\": %lld, \"longest_work_ms\": %.1f, \"lines\": %d}\n",
                static_cast<double>(time.elapsed()) / 1000, static_cast<long long>(pulse.longest()),
                pulse.longestWork(), lines);
    std::fflush(stdout);
    std::_Exit(0); // the time to close everything is not measured
}
