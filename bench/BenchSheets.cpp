#include "ReportPages.h"
#include "SheetLayout.h"
#include "SheetPane.h"
#include "SheetThumbnails.h"
#include "SheetView.h"

#include <QApplication>
#include <QPlainTextDocumentLayout>
#include <QScrollBar>
#include <QTextCursor>
#include <QTextDocument>

#include <benchmark/benchmark.h>

#include <memory>
#include <optional>
#include <vector>

namespace
{

/// Rows of a point list, 80 characters long, 72 to a page, and their sheets in a window.
struct Shown
{
    explicit Shown(qint64 pages, bool given = false)
    {
        document.setDocumentLayout(new QPlainTextDocumentLayout(&document));
        QFont font;
        font.setFamilies({QStringLiteral("DejaVu Sans Mono")});
        font.setFixedPitch(true);
        font.setPointSize(8);
        document.setDefaultFont(font);
        document.setUndoRedoEnabled(false);
        document.setPlainText(
            QStringLiteral("P1234     |    1234.567 |     5000.123 |    16000.456 |   12.345 | iron pipe\n")
                .repeated(pages * 72));
        const kareport::SheetPaper paper{QSize(11906, 16838), QRect(567, 567, 10659, 13490), 600, 72};
        layout = std::make_unique<kareport::SheetLayout>(document, paper, [this, given] { return pagesOf(given); });
        pane.resize(1000, 760);
        pane.show();
    }

    std::optional<std::vector<kareport::ReportPage>> pagesOf(bool given) const
    {
        if (!given) {
            return std::nullopt;
        }
        return kareport::reportPages(QStringView(document.toPlainText()), {}, 72);
    }
    void finish()
    {
        while (!layout->work(1000)) {
        }
        pane.sheetsChanged();
        QCoreApplication::processEvents();
    }

    QTextDocument document;
    std::unique_ptr<kareport::SheetLayout> layout;
    kareport::SheetPane pane{[this] { return layout.get(); }};
};

/// One step of the wheel, until the window shows it.
void scrollSheets(benchmark::State &state)
{
    Shown shown(state.range(0));
    shown.finish();
    QScrollBar &bar = *shown.pane.view().verticalScrollBar();
    bar.setValue(bar.maximum() / 2);
    int direction = 1;
    for (auto _ : state) {
        const int before = bar.value();
        bar.setValue(before + direction * 3 * bar.singleStep());
        direction = bar.value() == bar.maximum() || bar.value() == 0 ? -direction : direction;
        QCoreApplication::processEvents();
    }
}
BENCHMARK(scrollSheets)->Arg(100)->Arg(10'000)->Unit(benchmark::kMillisecond);

/// A sheet further, with its small picture.
void nextSheet(benchmark::State &state)
{
    Shown shown(state.range(0));
    shown.finish();
    shown.pane.view().setFit(kareport::SheetView::Fit::Page);
    int sheet = 0;
    for (auto _ : state) {
        sheet = (sheet + 1) % shown.layout->count();
        shown.pane.view().goToSheet(sheet);
        shown.pane.thumbnails().setShown(sheet);
        QCoreApplication::processEvents();
    }
}
BENCHMARK(nextSheet)->Arg(100)->Arg(10'000)->Unit(benchmark::kMillisecond);

/// From the text to the last of its sheets, in slices.
void findSheets(benchmark::State &state)
{
    Shown shown(state.range(0), state.range(1) != 0);
    for (auto _ : state) {
        shown.layout = std::make_unique<kareport::SheetLayout>(shown.document, shown.layout->paper(),
                                                               [&] { return shown.pagesOf(state.range(1) != 0); });
        while (!shown.layout->work(8)) {
        }
    }
    state.counters["sheets"] = shown.layout->count();
}
BENCHMARK(findSheets)->ArgsProduct({{100, 10'000}, {0, 1}})->Unit(benchmark::kMillisecond);

/// A key in the text, until the window shows it.
void typeBesideSheets(benchmark::State &state)
{
    Shown shown(state.range(0));
    shown.finish();
    QTextCursor cursor(&shown.document);
    cursor.setPosition(
        static_cast<int>(shown.layout->sheets()[static_cast<std::size_t>(shown.layout->count() / 2)].start));
    for (auto _ : state) {
        const int position = cursor.position();
        cursor.insertText(QStringLiteral("x"));
        shown.layout->noteEdit(position, 0, 1);
        shown.pane.view().forgetRows();
        while (!shown.layout->work(8)) {
        }
        shown.pane.sheetsChanged();
        QCoreApplication::processEvents();
        cursor.deletePreviousChar();
        shown.layout->noteEdit(position, 1, 0);
        while (!shown.layout->work(8)) {
        }
    }
}
BENCHMARK(typeBesideSheets)->Arg(100)->Arg(10'000)->Unit(benchmark::kMillisecond);

} // namespace
