#include "World.h"

#include "COneViewPane.h"
#include "DeskFrame.h"
#include "PaneDock.h"
#include "ReportEdit.h"
#include "ReportTextDecoder.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QApplication>
#include <QBuffer>
#include <QDockWidget>
#include <QFile>
#include <QFileInfo>
#include <QMessageBox>
#include <QTabBar>
#include <QTextDocument>

#include <algorithm>

namespace monkey
{

namespace
{

QString nameOf(const Seen &seen)
{
    return u'"' + seen.title + QStringLiteral("\" (report ") + QString::number(seen.id) + u')';
}

QString nameOf(const UReportDoc &report)
{
    return u'"' + report.GetTitle() + u'"';
}

/// Whether somebody can see a report, or an editor outside holds it.
bool isWithinReach(const UReportDoc &report)
{
    const auto *window = dynamic_cast<const UReportWindowDlg *>(report.GetReportWindow());
    return report.IsShown() || (window != nullptr && window->isCreated()) || report.GetExternalEditorFlag();
}

/// Where two texts part, for whoever reads the log.
QString difference(const QString &one, const QString &other)
{
    const auto [a, b] = std::mismatch(one.begin(), one.end(), other.begin(), other.end());
    const auto around = [](const QString &text, qsizetype at) {
        return text.mid(std::max<qsizetype>(0, at - 10), 30).toHtmlEscaped().replace(u'\n', QStringLiteral("\\n"));
    };
    const qsizetype at = a - one.begin();
    return QStringLiteral("%1 and %2 characters, from %3: '%4', '%5'")
        .arg(one.size())
        .arg(other.size())
        .arg(at)
        .arg(around(one, at), around(other, at));
}

/// How the panes stand, for whoever reads the log.
QString panesOf(const DeskFrame &frame)
{
    const COneViewPane *active = frame.GetActivePane();
    QStringList lines;
    for (const QDockWidget *dock : frame.findChildren<QDockWidget *>()) {
        const auto *paneDock = dynamic_cast<const kareport::PaneDock *>(dock);
        const COneViewPane *pane = paneDock != nullptr ? paneDock->pane() : nullptr;
        const QRect place = dock->geometry();
        lines.append(QStringLiteral("  %1%2%3%4%5 at %6,%7 of %8 x %9")
                         .arg(dock->windowTitle(), dock->isHidden() ? QStringLiteral(", hidden") : QString(),
                              dock->isFloating()         ? QStringLiteral(", floats")
                              : dock->window() != &frame ? QStringLiteral(", floats with others")
                                                         : QString(),
                              pane == nullptr     ? QStringLiteral(", left by its pane")
                              : pane->IsInFront() ? QStringLiteral(", in front")
                                                  : QString(),
                              pane != nullptr && pane == active ? QStringLiteral(", active") : QString())
                         .arg(place.x())
                         .arg(place.y())
                         .arg(place.width())
                         .arg(place.height()));
    }
    const QWidget *focus = QApplication::focusWidget();
    const QWidget *window = QApplication::activeWindow();
    return QStringLiteral("\n%1\n  keyboard in %2, active window %3")
        .arg(lines.join(u'\n'),
             focus != nullptr ? QLatin1String(focus->metaObject()->className()) : QLatin1String("nothing"),
             window != nullptr ? QLatin1String(window->metaObject()->className()) : QLatin1String("none"));
}

/// A text with the line ends that a control has.
QString asShown(QString text)
{
    return text.replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\r', u'\n').replace(QChar(0xA0), u' ');
}

bool isRich(const UReportDoc &report)
{
    return report.GetText().startsWith(u"{\\rtf") || report.GetRTFDataFlag();
}

} // namespace

QString World::check()
{
    if (!answers_.stuck.isEmpty()) {
        return QStringLiteral("a window cannot be closed: ") + answers_.stuck.join(u' ');
    }
    if (QApplication::activeModalWidget() != nullptr) {
        return QStringLiteral("a window stays open after the step");
    }
    for (const auto &part :
         {&World::checkClosed, &World::checkTexts, &World::checkWindows, &World::checkActive, &World::checkPages})
    {
        if (const QString wrong = (this->*part)(); !wrong.isEmpty()) {
            return wrong + panesOf(*frame_);
        }
    }
    return {};
}

const Seen *World::seen(quint64 id) const
{
    const auto found = std::find_if(before_.begin(), before_.end(), [id](const Seen &seen) { return seen.id == id; });
    return found == before_.end() ? nullptr : &*found;
}

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
    return std::any_of(written.begin(), written.end(), [&text](const QString &path) {
        if (path.endsWith(u".rtf", Qt::CaseInsensitive)) {
            return true; // the rich text is compared by other tests
        }
        QFile file(path);
        QString kept;
        return file.open(QIODevice::ReadOnly) && !kareport::decodeReportText(file.readAll(), kept) && kept == text;
    });
}

QString World::checkClosed() const
{
    auto given = std::count_if(given_.begin(), given_.end(),
                               [](const Answer &answer) { return answer.button == QMessageBox::No; });
    for (const Seen &gone : closed_) {
        const Seen *was = seen(gone.id);
        const bool hadChanges = gone.isModified || (was != nullptr && was->isModified);
        if (!hadChanges || gone.text.isEmpty() || isKept(gone.text)) {
            continue;
        }
        if (--given < 0) {
            return nameOf(gone) + QStringLiteral(" was closed with changes that nobody gave up");
        }
    }
    return {};
}

QString World::checkTexts() const
{
    const bool isReloaded = std::any_of(given_.begin(), given_.end(), [](const Answer &answer) {
        return answer.button == QMessageBox::Yes && answer.question.contains(QStringLiteral("by another program"));
    });
    for (const UReportDoc *report : reports()) {
        const Seen *was = seen(ids_.value(report));
        if (was == nullptr || isReloaded) {
            continue;
        }
        const QString text = textOf(*report);
        if (text != was->text && mayChange.count(report) == 0) {
            return QStringLiteral("the text of %1 has changed, which this step does not do: %2")
                .arg(nameOf(*was), difference(was->text, text));
        }
        if (was->isModified && !report->IsModified() && !text.isEmpty() && !isKept(text)) {
            return QStringLiteral("%1 counts as saved and is in no file").arg(nameOf(*was));
        }
    }
    for (const UReportView *view : viewsOnScreen()) {
        const UReportDoc *report = view->GetDocument();
        if (report == nullptr || isRich(*report) || view->ShowsFormats()) {
            continue;
        }
        const QString text = asShown(textOf(*report));
        const QString shown = view->GetEdit().document()->toPlainText();
        if (text != shown) {
            return QStringLiteral("a view of %1 shows another text than the report has: %2")
                .arg(nameOf(*report), difference(text, shown));
        }
    }
    return {};
}

QString World::checkWindows() const
{
    for (const UReportDoc *report : reports()) {
        if (!isWithinReach(*report)) {
            return QStringLiteral("nobody can see %1").arg(nameOf(*report));
        }
        if (report->GetTitle().endsWith(u" 2") && reports().size() == 1 && report->GetPathName().isEmpty() &&
            closed_.empty() && before_.empty())
        {
            return QStringLiteral("the only report has a number: %1").arg(nameOf(*report));
        }
    }
    return {};
}

QString World::checkActive() const
{
    if (frame_ == nullptr || !frame_->isVisible()) {
        return {};
    }
    const std::vector<UReportView *> shown = viewsOnScreen();
    const COneViewPane *pane = frame_->GetActivePane();
    const QDockWidget *dock = pane != nullptr ? pane->GetDock() : nullptr;
    if (!shown.empty() && (dock == nullptr || !pane->IsInFront())) {
        return QStringLiteral("a report is on the screen, and no pane on the screen is active");
    }
    const auto *active = dynamic_cast<UReportView *>(frame_->GetActiveView());
    if (active != nullptr && active->GetParentPane() == pane &&
        std::find(shown.begin(), shown.end(), active) == shown.end())
    {
        return QStringLiteral("the active view is not on the screen");
    }
    const UReportView *typedInto = viewWithKeyboard();
    if (typedInto != nullptr && (typedInto != active || typedInto->GetParentPane() != pane)) {
        return QStringLiteral("the view with the keyboard is not the active one");
    }
    const QWidget *focus = QApplication::focusWidget();
    const QList<QDockWidget *> docks = frame_->findChildren<QDockWidget *>();
    const bool hasPanes = std::any_of(docks.begin(), docks.end(), [](const QDockWidget *shownDock) {
        const auto *paneDock = dynamic_cast<const kareport::PaneDock *>(shownDock);
        return paneDock != nullptr && paneDock->pane() != nullptr && paneDock->pane()->IsInFront() &&
               paneDock->window() == QApplication::activeWindow();
    });
    const auto *tabs = qobject_cast<const QTabBar *>(focus);
    const bool isInTabs = mayBeInTabs_ && tabs != nullptr && tabs->count() > 1 && !tabs->visibleRegion().isEmpty();
    if (hasPanes && !isInTabs && (dock == nullptr || focus == nullptr || !dock->isAncestorOf(focus))) {
        return QStringLiteral("the keyboard is not in the active pane");
    }
    if (typedInto != nullptr && frame_->GetCommandDocument() != typedInto->GetDocument()) {
        return QStringLiteral("commands are not for the report that has the keyboard");
    }
    return {};
}

QString World::checkPages() const
{
    if (steps_ % 7 != 0) {
        return {}; // a PDF takes its time
    }
    for (const UReportDoc *report : reports()) {
        if (isRich(*report) || report->IsEmpty()) {
            continue;
        }
        QBuffer pdf;
        pdf.open(QIODevice::WriteOnly);
        if (!report->WritePdf(pdf)) {
            continue; // margins without room are told by their own message
        }
        const qsizetype pages = pdf.data().count("/Type /Page\n");
        if (pages < pagesOf(*report)) {
            return QStringLiteral("the PDF of %1 has %2 pages, the report %3")
                .arg(nameOf(*report))
                .arg(pages)
                .arg(pagesOf(*report));
        }
    }
    return {};
}

} // namespace monkey
