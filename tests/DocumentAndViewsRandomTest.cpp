#include "RandomRuns.h"
#include "RandomSequence.h"
#include "ReportModel.h"
#include "SavedReports.h"
#include "ViewFixture.h"

#include <QTemporaryDir>

#include <cstdio>

// Random operations of a host and of users on a report with several views, against a plain model of it. A sequence that fails
// is shortened and printed as the steps of a test.

namespace
{

using kareport::ReportEdit;

enum class Op
{
    // of a host
    WriteLine,
    Write,
    LineFeed,
    NewPage,
    Table,
    Heading,
    HeaderFlag,
    LinesPerPage,
    SetData,
    Clear,
    RichText,
    // of users, in view `a`
    Type,
    LineEnd,
    Backspace,
    Delete,
    Cut,
    Paste,
    TypeOver,
    Undo,
    Redo,
    TakeAll,
    OpenView,
    CloseView,
    // of both
    Reload,
    count
};

constexpr const char *opNames[] = {"WriteLine",  "Write",        "LineFeed", "NewPage",  "Table",     "Heading",
                                   "HeaderFlag", "LinesPerPage", "SetData",  "Clear",    "RichText",  "Type",
                                   "LineEnd",    "Backspace",    "Delete",   "Cut",      "Paste",     "TypeOver",
                                   "Undo",       "Redo",         "TakeAll",  "OpenView", "CloseView", "Reload"};
static_assert(std::size(opNames) == std::size_t(Op::count));

/// What the numbers mean is brought into what there is, so that every step makes sense in every state.
struct Step
{
    Op op;
    int a;
    int b;
    int c;
};

/// An edit as the control tells of it, in the characters of the document.
struct SeenEdit
{
    qint64 at;
    qint64 removed;
    QString inserted;
};

/// Sees every edit in a control.
class EditSpy
{
public:
    explicit EditSpy(ReportEdit &edit) : edit_(edit), before_(edit.toPlainText())
    {
        connection_ = QObject::connect(edit.document(), &QTextDocument::contentsChange,
                                       [this](int position, int removed, int added) { see(position, removed, added); });
    }
    ~EditSpy() { QObject::disconnect(connection_); }
    EditSpy(const EditSpy &) = delete;
    EditSpy &operator=(const EditSpy &) = delete;

    std::vector<SeenEdit> edits;

private:
    void see(int position, int removed, int added)
    {
        const QString after = edit_.toPlainText();
        // The end of the text is counted with an edit that touches it.
        const int over = std::max(0, position + added - static_cast<int>(after.size()));
        qsizetype at = position;
        qsizetype gone = removed - over;
        qsizetype put = added - over;
        if (gone < 0 || before_.size() - gone + put != after.size()) {
            at = 0;
            gone = before_.size();
            put = after.size();
        }
        const auto inDocument = [](QString text) { return text.replace(u'\n', QStringLiteral("\r\n")); };
        if (gone > 0 || put > 0) {
            edits.push_back({inDocument(before_.first(at)).size(), inDocument(before_.sliced(at, gone)).size(),
                             inDocument(after.sliced(at, put))});
        }
        before_ = after;
    }

    ReportEdit &edit_;
    QString before_;
    QMetaObject::Connection connection_;
};

QString joined(const std::vector<qint64> &numbers)
{
    QStringList texts;
    for (const qint64 number : numbers) {
        texts += QString::number(number);
    }
    return texts.join(u' ');
}

QString shown(const std::vector<kareport::ReportPage> &pages)
{
    QStringList texts;
    for (const kareport::ReportPage &page : pages) {
        texts += QStringLiteral("%1-%2/%3").arg(page.begin).arg(page.end).arg(page.lines);
    }
    return texts.join(u' ');
}

/// A report with its views, beside its model.
class Pair
{
public:
    Pair() : model_(headerOf(QString(), 0).chopped(3))
    {
        shown_.report.FixPage(9, 80);
        model_.setLinesPerPage(9);
        openView();
    }
    Pair(const Pair &) = delete;
    Pair &operator=(const Pair &) = delete;

    /// @return what is wrong afterwards; empty when nothing is
    QString carryOut(const Step &step)
    {
        const QString textBefore = model_.text();
        const std::vector<qint64> startsBefore = model_.starts();
        const bool isUser = step.op >= Op::Type && step.op <= Op::TakeAll;
        isUser ? actInView(step) : actAsHost(step);
        QString wrong = compare();
        if (wrong.isEmpty() && step.op == Op::Undo && canUndoExactly_ && model_.text() == beforeEdit_ &&
            model_.starts() != startsBeforeEdit_)
        {
            wrong =
                QStringLiteral("undone: pages %1 and not %2").arg(joined(model_.starts()), joined(startsBeforeEdit_));
        }
        canUndoExactly_ =
            isUser && step.op != Op::Undo && step.op != Op::Redo && step.op != Op::TakeAll && editsSeen_ == 1;
        beforeEdit_ = textBefore;
        startsBeforeEdit_ = startsBefore;
        return wrong;
    }

private:
    UReportDoc &report() { return shown_.report; }

    void openView() { views_.push_back(&shown_.open()); }

    static QString line(int seed)
    {
        static const QStringList lines = {QString(),
                                          QStringLiteral("a"),
                                          QStringLiteral("12.345  67.890"),
                                          QStringLiteral("  "),
                                          QStringLiteral("\u2126 ohm"),
                                          QStringLiteral("two\r\nlines"),
                                          QStringLiteral("\r\n"),
                                          headerOf(QString(), 7)};
        return lines[seed % lines.size()];
    }

    static QString data(int seed)
    {
        QString text;
        for (int i = 0; i < seed % 23; ++i) {
            text += line(seed / 7 + i * 3) + (seed % 5 == 1 ? QStringLiteral("\n") : QStringLiteral("\r\n"));
        }
        return seed % 3 == 0 ? text + QStringLiteral("end") : text;
    }

    void actAsHost(const Step &step)
    {
        switch (step.op) {
        case Op::WriteLine: {
            const int before = step.a % 4 - 1;
            const int after = step.b % 12 == 11 ? 30 : step.b % 4;
            report().WriteLine(line(step.c), before, after, step.c % 4);
            model_.writeLine(line(step.c), before, after);
            isModified_ = true;
            break;
        }
        case Op::Write:
            report().Write(line(step.c), 0);
            model_.write(line(step.c));
            isModified_ = isModified_ || !line(step.c).isEmpty();
            break;
        case Op::LineFeed: {
            const int count = step.a % 8 == 7 ? 25 : step.a % 5 - 1;
            report().LineFeed(count);
            model_.lineFeed(count);
            isModified_ = isModified_ || count > 0;
            break;
        }
        case Op::NewPage: {
            const int needed = step.a % 2 == 0 ? -1 : step.b % 12;
            const qint64 before = model_.size();
            const bool isNew = report().NewPage(needed);
            wrongAnswer_ = wrongAnswer_ || isNew != model_.newPage(needed);
            isModified_ = isModified_ || model_.size() > before || (isNew && report().GetHeaderFlag());
            break;
        }
        case Op::Table:
            for (int i = 0; i < step.a % 15; ++i) {
                const QString row = QStringLiteral("%1  %2").arg(i, 4).arg(i * 1.25);
                report().WriteLine(row, 0, 1, 0);
                model_.writeLine(row, 0, 1);
                isModified_ = true;
            }
            break;
        case Op::Heading: {
            const QString heading = line(step.c % 7);
            report().SetHeading(heading, step.a % 3, step.b % 3);
            model_.setHeading(heading, step.a % 3, step.b % 3);
            if (step.c % 2 == 0) {
                report().WriteHeading();
                model_.writeHeading();
                isModified_ = true;
            }
            break;
        }
        case Op::HeaderFlag:
            report().SetHeaderFlag(step.a % 2 == 0);
            model_.setHeaderFlag(step.a % 2 == 0);
            break;
        case Op::LinesPerPage: {
            const int lines = step.a % 12 + 1;
            report().FixPage(lines, 80);
            model_.setLinesPerPage(lines);
            break;
        }
        case Op::SetData:
            report().SetData(data(step.c));
            model_.setData(data(step.c));
            break;
        case Op::Clear:
            report().Clear();
            model_.clear();
            isModified_ = true;
            break;
        case Op::RichText: actInRichText(step); break;
        case Op::OpenView:
            if (views_.size() < 3) {
                openView();
            }
            return;
        case Op::CloseView:
            if (views_.size() > 1) {
                shown_.close(std::size_t(step.a) % views_.size());
                views_.erase(views_.begin() + step.a % static_cast<int>(views_.size()));
            }
            return;
        case Op::Reload: reload(); break;
        default: return;
        }
        report().UpdateAllViews(nullptr, 0, nullptr);
    }

    void reload()
    {
        const QString path = folder_.filePath(QStringLiteral("a.rep"));
        if (report().IsEmpty() || model_.text().contains(QStringLiteral("\n\n")) || !isAllCrLf()) {
            return; // such a file comes back with other line ends
        }
        report().SetPathName(path, false);
        wrongAnswer_ = wrongAnswer_ || !report().OnSaveDocument(path) || report().IsModified() ||
                       !kareport::reloadSavedReport(report());
        model_.reload(model_.text());
        model_.setLinesPerPage(report().GetLinesPerPage());
        isModified_ = false;
    }

    bool isAllCrLf() const
    {
        const QString text = model_.text();
        return text.count(u'\n') == text.count(QStringLiteral("\r\n")) &&
               text.count(u'\r') == text.count(QStringLiteral("\r\n"));
    }

    /// Rich-text mode on, something written and typed, and off again: what was typed is then the report's text.
    void actInRichText(const Step &step)
    {
        report().Clear();
        model_.clear();
        report().SetRTFDataFlag(true);
        for (int i = 0; i < step.a % 20; ++i) {
            report().WriteLine(line(1 + i % 3), 0, 1, i % 4);
            model_.writeLine(line(1 + i % 3), 0, 1);
        }
        report().UpdateAllViews(nullptr, 0, nullptr);
        UReportView &view = *views_[std::size_t(step.b) % views_.size()];
        ReportEdit &edit = view.GetEdit();
        putCursor(edit, step.c % std::max(1, edit.document()->characterCount()));
        QTest::keyClick(&edit, step.c % 2 == 0 ? Qt::Key_X : Qt::Key_Return);
        report().SetRTFDataFlag(false);
        // The image ends its last paragraph without a line end of its own: the text is the control's.
        followText(edit);
        isModified_ = true;
    }

    void followText(ReportEdit &edit)
    {
        const std::vector<qint64> starts = report().GetPageStarts();
        model_.setData(edit.windowText());
        if (starts != model_.starts()) {
            model_.adoptStarts(starts);
        }
    }

    void actInView(const Step &step)
    {
        UReportView &view = *views_[std::size_t(step.a) % views_.size()];
        ReportEdit &edit = view.GetEdit();
        const int length = edit.document()->characterCount();
        const int place = step.b % length;
        const int other = std::min(length - 1, place + step.c % (step.c % 3 == 0 ? 200 : 12));
        EditSpy spy(edit);
        switch (step.op) {
        case Op::Type:
            putCursor(edit, place);
            QTest::keyClick(&edit, step.c % 2 == 0 ? Qt::Key_X : Qt::Key_Space);
            break;
        case Op::LineEnd:
            putCursor(edit, place);
            QTest::keyClick(&edit, Qt::Key_Return);
            break;
        case Op::Backspace:
            putCursor(edit, place);
            QTest::keyClick(&edit, Qt::Key_Backspace);
            break;
        case Op::Delete:
            putCursor(edit, place);
            QTest::keyClick(&edit, Qt::Key_Delete);
            break;
        case Op::Cut:
            putWholeLines(edit, place, other, step.c % 2 == 0);
            clip_ = edit.textCursor().selectedText().replace(QChar::ParagraphSeparator, u'\n');
            edit.textCursor().removeSelectedText();
            break;
        case Op::Paste:
            putWholeLines(edit, place, place, step.c % 2 == 0);
            edit.textCursor().insertText(clip_);
            break;
        case Op::TypeOver:
            putWholeLines(edit, place, other, step.c % 2 == 0);
            QTest::keyClick(&edit, Qt::Key_Y);
            break;
        case Op::Undo: edit.undo(); break;
        case Op::Redo: edit.redo(); break;
        case Op::TakeAll:
            view.OnChange();
            model_.withCrLf();
            isModified_ = true;
            break;
        default: break;
        }
        editsSeen_ = spy.edits.size();
        for (const SeenEdit &seen : spy.edits) {
            if (!isAllCrLf()) {
                model_.withCrLf();
            }
            model_.replace(seen.at, seen.removed, seen.inserted);
            isModified_ = true;
        }
    }

    static void putWholeLines(ReportEdit &edit, int from, int to, bool isWhole)
    {
        QTextCursor cursor(edit.document());
        cursor.setPosition(from);
        if (isWhole) {
            cursor.movePosition(QTextCursor::StartOfBlock);
        }
        const int start = cursor.position();
        cursor.setPosition(std::max(start, to));
        if (isWhole) {
            cursor.movePosition(QTextCursor::StartOfBlock);
        }
        putCursor(edit, cursor.position(), start);
    }

    QString compare()
    {
        if (wrongAnswer_) {
            return QStringLiteral("an operation answered wrong");
        }
        if (report().CopyText() != model_.text()) {
            return QStringLiteral("the text is \"%1\" and not \"%2\"").arg(report().CopyText(), model_.text());
        }
        if (report().GetPageStarts() != model_.starts()) {
            return QStringLiteral("pages start at %1 and not at %2")
                .arg(joined(report().GetPageStarts()), joined(model_.starts()));
        }
        const std::vector<kareport::ReportPage> pages = model_.pages();
        if (shown(report().GetPages()) != shown(pages)) {
            return QStringLiteral("pages are %1 and not %2").arg(shown(report().GetPages()), shown(pages));
        }
        if (report().IsModified() != isModified_) {
            return QStringLiteral("modified is %1").arg(report().IsModified());
        }
        for (std::size_t i = 0; i < views_.size(); ++i) {
            const QString wrong = compareView(*views_[i], pages);
            if (!wrong.isEmpty()) {
                return QStringLiteral("view %1: ").arg(i) + wrong;
            }
        }
        return QString();
    }

    QString compareView(UReportView &view, const std::vector<kareport::ReportPage> &pages)
    {
        const QString text = model_.text();
        QString expected = text;
        expected.replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\n', QStringLiteral("\r\n"));
        ReportEdit &edit = view.GetEdit();
        if (edit.windowText() != expected) {
            return QStringLiteral("shows \"%1\" and not \"%2\"").arg(edit.windowText(), expected);
        }
        kareport::ReportViewWidget &widget = widgetOf(view);
        const int count = std::max(1, static_cast<int>(pages.size()));
        if (widget.pageCount() != count) {
            return QStringLiteral("has %1 pages and not %2").arg(widget.pageCount()).arg(count);
        }
        for (int page = 1; page <= static_cast<int>(pages.size()); ++page) {
            const auto line = QStringView(text).first(pages[std::size_t(page) - 1].begin).count(u'\n');
            widget.goToPage(page);
            if (edit.textCursor().blockNumber() != line || widget.currentPage() != page) {
                return QStringLiteral("page %1 begins in line %2 and not %3; that is page %4")
                    .arg(page)
                    .arg(edit.textCursor().blockNumber())
                    .arg(line)
                    .arg(widget.currentPage());
            }
        }
        return QString();
    }

    ShownReport shown_;
    ReportModel model_;
    std::vector<UReportView *> views_;
    QTemporaryDir folder_;
    QString clip_;
    bool isModified_ = false;
    bool wrongAnswer_ = false;
    bool canUndoExactly_ = false;
    std::size_t editsSeen_ = 0;
    QString beforeEdit_;
    std::vector<qint64> startsBeforeEdit_;
};

/// @param failed  receives how many steps were carried out when something was wrong
QString play(const std::vector<Step> &steps, std::size_t *done = nullptr)
{
    Pair pair;
    for (std::size_t i = 0; i < steps.size(); ++i) {
        const QString wrong = pair.carryOut(steps[i]);
        if (!wrong.isEmpty()) {
            if (done != nullptr) {
                *done = i + 1;
            }
            return wrong;
        }
    }
    return QString();
}

std::vector<Step> randomSteps(quint64 seed)
{
    constexpr int length = 120;
    RandomNumbers random(seed);
    std::vector<Step> steps;
    for (int i = 0; i < length; ++i) {
        // Users have more to do than hosts, and undo most of it.
        Op op = static_cast<Op>(random.below(int(Op::count)));
        if (random.below(3) == 0) {
            op = static_cast<Op>(int(Op::Type) + random.below(int(Op::Redo) - int(Op::Type) + 1));
        } else if (random.below(4) == 0) {
            op = random.below(2) == 0 ? Op::Undo : Op::Table;
        } else if ((op == Op::SetData || op == Op::Clear || op == Op::RichText) && random.below(4) != 0) {
            op = Op::WriteLine;
        }
        steps.push_back({op, random.below(1000), random.below(5000), random.below(1000)});
    }
    return steps;
}

TEST(DocumentAndViewsRandom, AgreeWithThePlainModel)
{
    RandomRuns runs("Document and views", 2024, 150);
    while (runs.next()) {
        std::vector<Step> steps = randomSteps(runs.seed());
        std::size_t done = 0;
        if (play(steps, &done).isEmpty()) {
            continue;
        }
        steps.resize(done);
        steps =
            shortenedSequence<Step>(steps, [](const std::vector<Step> &shorter) { return !play(shorter).isEmpty(); });
        QString text;
        for (const Step &step : steps) {
            text += QStringLiteral("    {Op::%1, %2, %3, %4},\n")
                        .arg(QLatin1StringView(opNames[int(step.op)]))
                        .arg(step.a)
                        .arg(step.b)
                        .arg(step.c);
        }
        FAIL() << "seed " << runs.seed() << ": " << play(steps).toStdString() << "\n" << text.toStdString();
    }
}

TEST(DocumentAndViewsRandom, SequencesThatWereFound)
{
    struct Row
    {
        std::vector<Step> steps;
        const char *reason;
    };
    const Row rows[] = {
        {{{Op::HeaderFlag, 106, 695, 208},
          {Op::Table, 100, 4574, 796},
          {Op::WriteLine, 492, 1756, 346},
          {Op::TypeOver, 263, 2394, 279},
          {Op::Table, 976, 2227, 851},
          {Op::TypeOver, 51, 3135, 471},
          {Op::Undo, 438, 4587, 831}},
         "the end of a header line is none"},
        {{{Op::Table, 14, 0, 0}, {Op::Cut, 0, 40, 501}, {Op::Undo, 0, 0, 0}}, "a cut over a page's start, undone"},
        {{{Op::LineFeed, 7, 0, 0}, {Op::NewPage, 0, 0, 0}},
         "blank lines alone are one page, whatever was begun in them"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(play(row.steps).toStdString(), "") << row.reason;
    }
}

} // namespace
