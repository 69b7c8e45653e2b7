#include "DeskCommandIds.h"
#include "DeskFrame.h"
#include "PageHeader.h"
#include "Pages.h"
#include "ReportContent.h"
#include "ReportEdit.h"
#include "ReportTextDecoder.h"
#include "RichTextReader.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "World.h"

#include <QApplication>
#include <QFile>
#include <QFileInfo>
#include <QTest>
#include <QTextDocument>

#include <algorithm>

namespace monkey
{

namespace
{

/// The characters of a text, whatever ends its lines.
QString plainLines(QString text)
{
    text.replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\r', u'\n').replace(QChar(0xA0), u' ');
    while (text.endsWith(u'\n')) {
        text.chop(1);
    }
    return text;
}

/// What is seen of a rich text, as far as it can be read.
template <typename View>
QString seenOf(View rich)
{
    QTextDocument document;
    kareport::readRichText(rich, document);
    return plainLines(document.toPlainText());
}

/// Whether a rich text shows what a report shows: the report's text, read as characters or as the bytes of a file, or as it is.
bool showsSame(const QByteArray &rich, const QString &text)
{
    const QString seen = seenOf(QByteArrayView(rich));
    if (seen == plainLines(text)) {
        return true; // also what was typed and reads like rich text
    }
    return kareport::isRichText(text) &&
           (seen == seenOf(QStringView(text)) || seen == seenOf(QByteArrayView(text.toLatin1())));
}

/// Whether a file holds a text, as it is read when it is opened.
bool loadsAs(const QString &path, const QString &text)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return false;
    }
    const QByteArray content = file.readAll();
    QString kept;
    if (!kareport::decodeReportText(content, kept) && kept == text) {
        return true;
    }
    return kareport::isRichText(QByteArrayView(content)) && showsSame(content, text);
}

} // namespace

QStringList World::writtenFiles() const
{
    QStringList written;
    const QHash<QString, Stamp> now = lookAtFiles();
    for (auto file = now.begin(); file != now.end(); ++file) {
        if (filesBefore_.value(file.key()) != file.value()) {
            written.append(file.key());
        }
    }
    return written;
}

bool World::isKept(const QString &text) const
{
    const QStringList written = writtenFiles();
    return std::any_of(written.begin(), written.end(), [&text](const QString &path) { return loadsAs(path, text); });
}

QString World::describeWritten(const QString &text) const
{
    constexpr int shown = 120;
    const auto start = [&](const QByteArray &bytes) {
        return QString::fromLatin1(bytes.first(qMin(bytes.size(), shown)).toPercentEncoding(" {}\\\""));
    };
    QString described = QStringLiteral("\n  text of %1: %2").arg(text.size()).arg(start(text.toUtf8()));
    for (const QString &path : writtenFiles()) {
        QFile file(path);
        const QByteArray content = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
        described += QStringLiteral("\n  %1 of %2: %3").arg(path).arg(content.size()).arg(start(content));
    }
    return described;
}

QString World::checkSaved(const UReportDoc &report, const Seen &was)
{
    const QString text = textOf(report);
    const QString path = report.GetPathName();
    const bool isSaved = was.isModified && !report.IsModified();
    // Under another name, also where there was nothing to save.
    const bool isSavedAs = path != was.path && !path.isEmpty() && !report.IsModified();
    if ((!isSaved && !isSavedAs) || text.isEmpty()) {
        return {};
    }
    if (isSaved && !isKept(text)) {
        return QStringLiteral("%1 counts as saved and is in no file").arg(was.title) + describeWritten(text);
    }
    if (isSavedAs && !loadsAs(path, text)) {
        return QStringLiteral("%1 is not what it was saved as, %2").arg(was.title, path) + describeWritten(text);
    }
    if ((path.endsWith(u".rep") || path.endsWith(u".rtf")) && !isRich(report)) {
        saved_.insert(was.id, {path, lookAtFiles().value(path)});
    }
    return {};
}

QString World::checkFiles()
{
    for (const UReportDoc *report : reports()) {
        const Seen *was = seen(ids_.value(report));
        if (was == nullptr || isReloaded(*was)) {
            continue;
        }
        if (const QString wrong = checkSaved(*report, *was); !wrong.isEmpty()) {
            return wrong;
        }
    }
    return {};
}

std::vector<UReportDoc *> World::savedReports() const
{
    const QHash<QString, Stamp> files = lookAtFiles();
    std::vector<UReportDoc *> found;
    for (UReportDoc *report : reports()) {
        const Saved saved = saved_.value(ids_.value(report));
        if (!report->IsModified() && !report->IsEmpty() && !isRich(*report) && saved.stamp.size >= 0 &&
            report->GetPathName() == saved.path && files.value(saved.path) == saved.stamp)
        {
            found.push_back(report);
        }
    }
    return found;
}

void World::reopen(Chance &chance)
{
    const std::vector<UReportDoc *> all = savedReports();
    if (all.empty()) {
        return;
    }
    const UReportDoc &report = *all[static_cast<std::size_t>(chance.below(static_cast<qsizetype>(all.size())))];
    const bool byCommand = chance.oneIn(2);
    did = report.GetPathName() + (byCommand ? QStringLiteral(" by the command") : QString());
    const QString ending = QFileInfo(report.GetPathName()).suffix();
    // A report may have a name whose file was removed: to open that name brings the report to the front.
    const auto isTaken = [](const QString &path) {
        const std::vector<UReportDoc *> open = reports();
        return QFile::exists(path) || std::any_of(open.begin(), open.end(), [&path](const UReportDoc *each) {
                   return each->GetPathName() == path;
               });
    };
    QString copy;
    for (int number = 1; copy.isEmpty() || isTaken(copy); ++number) {
        copy = files().filePath(QStringLiteral("copy %1.%2").arg(number).arg(ending));
    }
    const qint64 limit = fileLimit();
    limitFiles(-1);
    const bool isCopied = QFile::copy(report.GetPathName(), copy);
    limitFiles(limit);
    wrong_ = isCopied ? openSaved(report, copy, byCommand) : QStringLiteral("it is not there");
    if (wrong_.isEmpty() && ending == u"rtf") {
        wrong_ = editOpened(copy, chance);
    }
    if (!wrong_.isEmpty()) {
        wrong_.prepend(did + QStringLiteral(" opened again: "));
    }
}

QString World::openSaved(const UReportDoc &report, const QString &copy, bool byCommand)
{
    // What it is compared with, as the report may be closed meanwhile.
    const QString text = textOf(report);
    const std::vector<qint64> starts = report.GetPageStarts();
    // Pages that no header line begins are in no file.
    const bool hasHeaders = !starts.empty() && starts.front() == 0 && kareport::pageHeadersIn(text) == starts;
    const std::vector<Page> pages = pagesFor(report);
    if (byCommand) {
        answers_.nextFile = copy;
        frame_->OnCommand(kareport::fileOpenCommand);
        answers_.nextFile.clear();
    } else {
        frame_->OpenFile(copy);
    }
    const std::vector<UReportDoc *> all = reports();
    const auto opened =
        std::find_if(all.begin(), all.end(), [&copy](const UReportDoc *open) { return open->GetPathName() == copy; });
    if (opened == all.end()) {
        return QStringLiteral("no report has it");
    }
    const bool isRichText = copy.endsWith(u".rtf") && isRich(**opened);
    const QString kept = isRichText ? kareport::shownPlainText(**opened) : textOf(**opened);
    if (isRichText ? plainLines(kept) != plainLines(text) : kept != text) {
        return QStringLiteral("another text") + describeWritten(text);
    }
    const std::vector<Page> openedPages = pagesFor(**opened);
    const auto isSame = [](const Page &one, const Page &other) { return one.ink == other.ink; };
    if (hasHeaders && (!std::equal(pages.begin(), pages.end(), openedPages.begin(), openedPages.end(), isSame) ||
                       (!isRichText && (*opened)->GetPageStarts() != starts)))
    {
        return QStringLiteral("other pages, %1 and not %2").arg(openedPages.size()).arg(pages.size());
    }
    return {};
}

QString World::editOpened(const QString &copy, Chance &chance)
{
    UReportView *view = viewWithKeyboard();
    if (view == nullptr || view->GetDocument() == nullptr || view->GetDocument()->GetPathName() != copy ||
        !isRich(*view->GetDocument()) || !view->GetEdit().hasFocus()) // sheets take no text
    {
        return {};
    }
    const UReportDoc &report = *view->GetDocument();
    QPlainTextEdit &edit = view->GetEdit();
    QTextCursor cursor = edit.textCursor();
    cursor.setPosition(static_cast<int>(chance.below(edit.document()->characterCount())));
    edit.setTextCursor(cursor);
    const QString before = view->GetEdit().windowText();
    // In the text every line end before the cursor is one character more.
    const QString typed = QString(before).insert(cursor.position() + cursor.blockNumber(), u'y');
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Y);
    did += QStringLiteral(", typed at %1").arg(cursor.position());
    if (textOf(report) != typed || report.GetPageStarts() != kareport::pageHeadersIn(typed) || !report.IsModified()) {
        return QStringLiteral("what was typed gives another text, or other pages: ") + textOf(report).left(500);
    }
    if (chance.oneIn(2)) {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Z, Qt::ControlModifier);
        did += QStringLiteral(" and undone");
        if (textOf(report) != before) {
            return QStringLiteral("what was undone gives another text: ") + textOf(report).left(500);
        }
    }
    return {};
}

void World::openLong()
{
    const QString path = files().filePath(QStringLiteral("points.rep"));
    if (!QFile::exists(path)) {
        constexpr int lines = 7000;
        constexpr int linesPerPage = 60;
        QByteArray content = "\xEF\xBB\xBF";
        for (int line = 0; line < lines; ++line) {
            content += line % linesPerPage == 0
                           ? "TALVEN Survey - Points         Mar 05, 2024  02:07PM    Page:" +
                                 QByteArray::number(line / linesPerPage + 1).rightJustified(3)
                           : "Point " + QByteArray::number(line).rightJustified(6) + QByteArray(70, '.');
            content += "\r\r\n";
        }
        const qint64 limit = fileLimit();
        limitFiles(-1);
        QFile file(path);
        if (file.open(QIODevice::WriteOnly)) {
            file.write(content);
        }
        file.close();
        limitFiles(limit);
    }
    did = path;
    frame_->OpenFile(path);
}

} // namespace monkey
