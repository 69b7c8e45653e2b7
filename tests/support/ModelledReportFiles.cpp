#include "LoadedText.h"
#include "ModelledReport.h"
#include "ReportContent.h"
#include "RichTextReader.h"

#include <QFile>
#include <QTextDocument>

#include <algorithm>

// The files of a modelled report: saved, loaded after what it holds, and loaded in its place.

namespace
{

/// What each page of a text shows.
QStringList inkOfPages(const QString &text, const std::vector<kareport::ReportPage> &pages)
{
    QStringList inks;
    for (const kareport::ReportPage &page : pages) {
        inks.append(ModelledReport::inkOf(text.sliced(page.begin, page.end - page.begin)));
    }
    return inks;
}

/// The lines of a text, without the empty ones at its end.
QString linesOf(QString text)
{
    text.replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    while (text.endsWith(u'\n')) {
        text.chop(1);
    }
    return text;
}

} // namespace

void ModelledReport::reload()
{
    const QString path = folder_.filePath(QStringLiteral("a.rep"));
    const QString text = model_.text();
    if (report().IsEmpty() || (text.contains(u'\n') && !text.contains(QStringLiteral("\r\n")))) {
        return; // with no line end of a report in it, such a file reads as that of an editor
    }
    report().SetPathName(path, false);
    wrongAnswer_ = wrongAnswer_ || !report().OnSaveDocument(path) || report().IsModified() ||
                   !kareport::reloadSavedReport(report());
    isRich_ = false;
    model_.reload(text);
    model_.setLinesPerPage(report().GetLinesPerPage());
    isModified_ = false;
}

void ModelledReport::load(const ReportStep &step)
{
    static const QStringList lines = {QStringLiteral("loaded"), QString(), QStringLiteral("1.5  x"),
                                      headerOf(QStringLiteral("Loaded"), 3)};
    const bool keepsEnds = step.a % 2 == 0;
    QStringList chosen;
    for (int i = 0; i <= step.b % 25; ++i) {
        chosen.append(lines[(step.c / (i + 1) + i) % lines.size()]);
    }
    const QString path = folder_.filePath(QStringLiteral("loaded.rep"));
    putFile(path, chosen.join(QStringLiteral("\r\n")).toLatin1() + "\r\n");
    wrongAnswer_ = wrongAnswer_ || report().LoadFile(path, keepsEnds) != 1;
    if (keepsEnds) {
        for (QString &line : chosen) {
            line += u'\n';
        }
    }
    model_.load(chosen);
    isModified_ = true;
}

void ModelledReport::saveAlone()
{
    const QString path = folder_.filePath(QStringLiteral("alone.rep"));
    const QString text = model_.text();
    wrongAnswer_ = wrongAnswer_ || !report().OnSaveDocument(path);
    isModified_ = false;
    if (text.isEmpty() || (text.contains(u'\n') && !text.contains(QStringLiteral("\r\n")))) {
        return; // there is no file, or one that reads as that of an editor
    }
    QFile file(path);
    kareport::LoadedText saved;
    const bool isRead = file.open(QIODevice::ReadOnly) &&
                        kareport::loadReportText(file.readAll(), saved) == kareport::TextLoading::Whole;
    if (!isRead || saved.text.piece(0, saved.text.size()) != text || saved.pageStarts != ReportModel::headersIn(text)) {
        wrongSave_ = QStringLiteral("saved alone: ") + brief(saved.text.piece(0, saved.text.size()));
    }
}

void ModelledReport::saveRichText()
{
    constexpr qint64 longestSaved = 100'000; // characters
    if (model_.size() == 0 || model_.size() > longestSaved) {
        return;
    }
    const QString path = folder_.filePath(QStringLiteral("alone.rtf"));
    wrongAnswer_ = wrongAnswer_ || !report().OnSaveDocument(path);
    for (Shown &shown : views_) { // which were updated for it
        shown.isStale = false;
        shown.isEdited = false;
    }
    QFile file(path);
    QTextDocument saved;
    const bool isRead =
        file.open(QIODevice::ReadOnly) && !kareport::readRichText(QByteArrayView(file.readAll()), saved);
    const QString lines = linesOf(saved.toPlainText());
    if (!isRead || (isRich_ ? inkOf(lines) != inkOf(image_) : lines != linesOf(model_.text()))) {
        wrongSave_ = QStringLiteral("saved as rich text: ") + brief(lines);
    }
}

void ModelledReport::openSaved()
{
    constexpr qint64 longestOpened = 4'000; // characters: it doubles the text
    constexpr qsizetype longestLine = 500;  // longer ones are read in pieces
    const QStringList written = model_.text().split(u'\n');
    const bool isTooLong =
        std::any_of(written.begin(), written.end(), [](const QString &line) { return line.size() > longestLine; });
    if (isRich_ || model_.size() == 0 || model_.size() > longestOpened || isTooLong) {
        return;
    }
    const QString path = folder_.filePath(QStringLiteral("opened.rep"));
    wrongAnswer_ = wrongAnswer_ || !report().OnSaveDocument(path) || !report().OnOpenDocument(path);
    QFile file(path);
    wrongAnswer_ = wrongAnswer_ || !file.open(QIODevice::ReadOnly);
    // As hosts have always read it: a character a byte, CR LF as LF, and no byte-order mark before the first word.
    const QString read = QString::fromLatin1(file.readAll()).replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    QStringList lines;
    for (qsizetype at = 0; at < read.size(); at += lines.back().size()) {
        const qsizetype feed = read.indexOf(u'\n', at);
        lines.append(read.sliced(at, (feed < 0 ? read.size() : feed + 1) - at));
    }
    if (const qsizetype word = lines.front().indexOf(u"TALVEN"); model_.lineCount() == 0 && word > 0) {
        lines.front().remove(0, word);
    }
    const bool hasHeader = model_.headerFlag();
    model_.setHeaderFlag(false);
    model_.load(lines);
    model_.setHeaderFlag(hasHeader);
    isModified_ = false;
}

void ModelledReport::reloadRichText(const ReportStep &step)
{
    constexpr qint64 longestLoaded = 8'000; // characters
    if (isRich_ || model_.size() == 0 || model_.size() > longestLoaded) {
        return;
    }
    const QString text = model_.text();
    const std::vector<qint64> starts = model_.starts();
    // Pages that no header line begins are in no file.
    const bool hasHeaders = !starts.empty() && starts.front() == 0 && starts == ReportModel::headersIn(text);
    const QStringList pages = hasHeaders ? inkOfPages(text, model_.pages()) : QStringList();
    const QString path = folder_.filePath(QStringLiteral("a.rtf"));
    report().SetPathName(path, false);
    wrongAnswer_ = wrongAnswer_ || !report().OnSaveDocument(path) || !kareport::reloadSavedReport(report()) ||
                   report().IsModified();
    wrongSave_ = wrongWithRichText(text, pages);
    if (!wrongSave_.isEmpty()) {
        wrongSave_.prepend(QStringLiteral("loaded as rich text: "));
    }
    const int lines = report().GetLineCount();
    Shown *shown = step.a % 2 != 0 ? visibleView(step.b) : nullptr;
    if (shown != nullptr) {
        model_.clear();
        model_.countLinesOfFile(lines);
        model_.setLinesPerPage(report().GetLinesPerPage());
        typeIntoReloaded(*shown, step);
        return;
    }
    report().Clear();
    report().FixPage(9, 80);
    report().SetData(text);
    model_.clear();
    model_.countLines(lines);
    model_.setLinesPerPage(9);
    model_.setData(text);
    isModified_ = true;
}

void ModelledReport::typeIntoReloaded(Shown &shown, const ReportStep &step)
{
    kareport::ReportEdit &edit = shown.view->GetEdit();
    const QString before = edit.windowText();
    putCursor(edit, placeIn(edit.document()->characterCount(), step.c));
    const bool endsLine = step.c % 2 != 0;
    // In the text every line end before the cursor is one character more.
    const QString typed = QString(before).insert(edit.textCursor().position() + edit.textCursor().blockNumber(),
                                                 endsLine ? QStringLiteral("\r\n") : QStringLiteral("x"));
    QTest::keyClick(&edit, endsLine ? Qt::Key_Return : Qt::Key_X);
    // What was rich text is now the text that it shows, whose pages begin with its header lines.
    model_.setData(typed);
    isModified_ = true;
    for (Shown &one : views_) {
        one.isStale = false;
        one.isEdited = false;
    }
    if (step.a % 4 == 1) {
        EditSpy spy(edit);
        edit.undo();
        for (const SeenEdit &seen : spy.edits) {
            model_.replace(seen.at, seen.removed, seen.inserted);
        }
        wrongAnswer_ = wrongAnswer_ || spy.edits.empty() || model_.text() != before;
    }
}

QString ModelledReport::wrongWithRichText(const QString &before, const QStringList &pagesBefore)
{
    const QString loaded = kareport::shownPlainText(report());
    if (!report().HoldsRichTextSource() || linesOf(loaded) != linesOf(before)) {
        return QStringLiteral("\"%1\" and not \"%2\"").arg(brief(loaded), brief(before));
    }
    ReportModel model{QString()};
    model.setLinesPerPage(report().GetLinesPerPage());
    model.reload(loaded);
    const std::vector<kareport::ReportPage> pages = model.pages();
    if (shown(report().GetPages()) != shown(pages)) {
        return QStringLiteral("pages are %1 and not %2").arg(brief(shown(report().GetPages())), brief(shown(pages)));
    }
    if (!pagesBefore.isEmpty() && inkOfPages(loaded, pages) != pagesBefore) {
        return QStringLiteral("the pages are not those of before: %1").arg(brief(shown(pages)));
    }
    for (const Shown &one : views_) {
        if (linesOf(one.view->GetEdit().windowText()) != linesOf(before)) {
            return QStringLiteral("a view shows \"%1\"").arg(brief(one.view->GetEdit().windowText()));
        }
        if (const QString wrong = wrongWithPages(*one.view, loaded, pages); !wrong.isEmpty()) {
            return wrong;
        }
    }
    return QString();
}
