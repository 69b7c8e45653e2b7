#include "ReportEdit.h"
#include "UReportDoc.h"
#include "UReportView.h"

#include "DefaultPrinter.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPlainTextEdit>
#include <QTextBlock>
#include <QTextDocument>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <memory>
#include <vector>

// A report in its view compared with the same text in a bare control: what the view adds must stay small, at N and at 10 N.

namespace
{

QString reportOfLines(qint64 lines, QStringView lineEnd)
{
    QString text;
    text.reserve(lines * 82);
    for (qint64 i = 0; i < lines; ++i) {
        text += QString::number(i).leftJustified(80, u'.');
        text += lineEnd;
    }
    return text;
}

QString richTextOfLines(qint64 lines)
{
    QString text = QStringLiteral("{\\rtf1\\ansi{\\fonttbl{\\f0\\fmodern Lucida Console;}}\\f0\\fs16 ");
    for (qint64 i = 0; i < lines; ++i) {
        text += QStringLiteral("{\\b Point %1} north 1234.567 {\\ul east} 2345.678\\par\n").arg(i);
    }
    return text + u'}';
}

/// Lays a window out and paints it, as its first appearance does.
void appear(QWidget &window)
{
    window.resize(800, 600);
    window.show();
    benchmark::DoNotOptimize(window.grab());
}

/// A document that outlives its views.
struct Report
{
    explicit Report(const QString &text)
    {
        document.SetAutoDelete(false);
        document.SetData(text);
    }
    UReportView *open()
    {
        auto &view = views.emplace_back(std::make_unique<UReportView>());
        document.AddView(view.get());
        view->OnInitialUpdate();
        appear(*view->GetWidget());
        return view.get();
    }

    UReportDoc document;
    std::vector<std::unique_ptr<UReportView>> views;
};

void showBare(benchmark::State &state)
{
    const QString text = reportOfLines(state.range(0), u"\r\n");
    for (auto _ : state) {
        auto edit = std::make_unique<QPlainTextEdit>();
        edit->setLineWrapMode(QPlainTextEdit::NoWrap);
        edit->setPlainText(text);
        appear(*edit);
        state.PauseTiming();
        edit.reset();
        state.ResumeTiming();
    }
}
BENCHMARK(showBare)->Arg(30'000)->Arg(300'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

void showReport(benchmark::State &state)
{
    for (auto _ : state) {
        state.PauseTiming();
        Report report(reportOfLines(state.range(0), u"\r\n"));
        state.ResumeTiming();
        report.open();
        state.PauseTiming();
        report.views.clear();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        state.ResumeTiming();
    }
}
BENCHMARK(showReport)->Arg(30'000)->Arg(300'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

void showRichText(benchmark::State &state)
{
    for (auto _ : state) {
        Report report(richTextOfLines(state.range(0)));
        report.open();
    }
}
BENCHMARK(showRichText)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);

/// A key at the beginning, the middle and the end in turn, so that each is the first at a new place, and what it paints.
void pressKeys(benchmark::State &state, QPlainTextEdit &edit)
{
    QTextDocument *document = edit.document();
    int turn = 0;
    std::vector<double> times; // milliseconds
    for (auto _ : state) {
        state.PauseTiming();
        const int length = document->characterCount() - 1;
        QTextCursor cursor(document);
        cursor.setPosition(turn % 3 == 0 ? 0 : turn % 3 == 1 ? length / 2 : length);
        edit.setTextCursor(cursor);
        QCoreApplication::processEvents();
        QKeyEvent key(QEvent::KeyPress, turn % 10 == 9 ? Qt::Key_Return : Qt::Key_X, Qt::NoModifier,
                      turn % 10 == 9 ? QStringLiteral("\r") : QStringLiteral("x"));
        ++turn;
        state.ResumeTiming();
        const auto start = std::chrono::steady_clock::now();
        QCoreApplication::sendEvent(&edit, &key);
        QCoreApplication::processEvents();
        times.push_back(std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count());
    }
    // The longest ones are those in which the control itself gets more memory, and the system's own pauses.
    std::sort(times.begin(), times.end());
    state.counters["p99_ms"] = times[times.size() * 99 / 100];
    state.counters["worst_ms"] = times.back();
}

void keyInBare(benchmark::State &state)
{
    QPlainTextEdit edit;
    edit.setLineWrapMode(QPlainTextEdit::NoWrap);
    edit.setPlainText(reportOfLines(state.range(0), u"\r\n"));
    appear(edit);
    pressKeys(state, edit);
}
BENCHMARK(keyInBare)->Arg(30'000)->Arg(300'000)->Iterations(1000)->Unit(benchmark::kMicrosecond);

/// @param state  lines, views
void keyInReport(benchmark::State &state)
{
    Report report(reportOfLines(state.range(0), u"\r\n"));
    UReportView *view = report.open();
    for (qint64 i = 1; i < state.range(1); ++i) {
        report.open();
    }
    pressKeys(state, view->GetEdit());
}
BENCHMARK(keyInReport)
    ->Args({30'000, 1})
    ->Args({300'000, 1})
    ->Args({300'000, 2})
    ->Args({1'000'000, 1})
    ->Iterations(1000)
    ->Unit(benchmark::kMicrosecond);

} // namespace
