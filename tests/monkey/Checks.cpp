#include "World.h"

#include "COneViewPane.h"
#include "CommandList.h"
#include "DeskFrame.h"
#include "PaneDock.h"
#include "ReportContent.h"
#include "ReportEdit.h"
#include "ReportTextDecoder.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QAction>
#include <QApplication>
#include <QBuffer>
#include <QDockWidget>
#include <QFile>
#include <QFileInfo>
#include <QMenuBar>
#include <QMessageBox>
#include <QTabBar>
#include <QTextDocument>

#include <algorithm>
#include <functional>

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

/// In which an editor has started, or the desk has seen that it has ended.
constexpr int editorTime = 1500; // milliseconds

/// Whether a report can be seen, or an editor outside holds it.
bool isWithinReach(const UReportDoc &report, const QDir &folder)
{
    return report.IsShown() || (report.GetExternalEditorFlag() && isEditorOpen(folder));
}

/// Where two texts begin to differ, for the log.
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

/// A text with the line ends that a control has.
QString asShown(QString text)
{
    return text.replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\r', u'\n').replace(QChar(0xA0), u' ');
}

} // namespace

bool World::isRich(const UReportDoc &report)
{
    return report.GetText().startsWith(u"{\\rtf") || report.GetRTFDataFlag();
}

bool World::showsRich(const UReportDoc &report, const QString &shown)
{
    // What was edited in a view with formats is the report's text without them. What is typed and reads like rich
    // text is there as it is.
    return asShown(shown) == asShown(textOf(report)) || asShown(shown) == asShown(kareport::shownPlainText(report));
}

QString World::check()
{
    if (!wrong_.isEmpty()) {
        return wrong_ + describePanes();
    }
    if (!answers_.stuck.isEmpty()) {
        return QStringLiteral("a window cannot be closed: ") + answers_.stuck.join(u' ');
    }
    if (QApplication::activeModalWidget() != nullptr) {
        return QStringLiteral("a window stays open after the step");
    }
    const std::function<QString()> parts[] = {[this] { return checkClosed(); },  [this] { return checkTexts(); },
                                              [this] { return checkFiles(); },   [this] { return checkWindows(); },
                                              [this] { return checkActive(); },  [this] { return checkPages(); },
                                              [this] { return checkCommands(); }};
    for (const auto &part : parts) {
        if (const QString wrong = part(); !wrong.isEmpty()) {
            return wrong + describePanes();
        }
    }
    return {};
}

const Seen *World::seen(quint64 id) const
{
    const auto found = std::find_if(before_.begin(), before_.end(), [id](const Seen &seen) { return seen.id == id; });
    return found == before_.end() ? nullptr : &*found;
}

QString World::checkClosed() const
{
    auto given = std::count_if(given_.begin(), given_.end(), [](const Answer &answer) {
        return answer.button == QMessageBox::No && answer.question.startsWith(QStringLiteral("Save changes to"));
    });
    for (const Seen &gone : closed_) {
        const Seen *was = seen(gone.id);
        if (was == nullptr && mayChange.count(gone.report) == 0) {
            continue; // the report of a job that went wrong has come and gone
        }
        const bool hadChanges = gone.isModified || (was != nullptr && was->isModified);
        if (!hadChanges || gone.text.isEmpty() || isKept(gone.text)) {
            continue;
        }
        if (--given < 0) {
            return nameOf(gone) + QStringLiteral(" was closed with changes that were not given up") +
                   describeWritten(gone.text);
        }
    }
    return {};
}

bool World::isReloaded(const Seen &was) const
{
    return !was.path.isEmpty() && std::any_of(given_.begin(), given_.end(), [&was](const Answer &answer) {
        return answer.button == QMessageBox::Yes && answer.question.contains(QStringLiteral("by another program")) &&
               answer.question.contains(was.path);
    });
}

QString World::checkTexts() const
{
    for (const UReportDoc *report : reports()) {
        const Seen *was = seen(ids_.value(report));
        // One that follows its files may be made again at any time.
        const bool follows = frame_->runs().followsFiles() && frame_->runs().recipeOf(report) != nullptr;
        if (was == nullptr || follows || isReloaded(*was)) {
            continue;
        }
        const QString text = textOf(*report);
        if (text != was->text && mayChange.count(report) == 0) {
            return QStringLiteral("the text of %1 has changed, which this step does not do: %2")
                .arg(nameOf(*was), difference(was->text, text));
        }
    }
    for (const UReportView *view : viewsOnScreen()) {
        const UReportDoc *report = view->GetDocument();
        if (report == nullptr) {
            continue;
        }
        const QString text = asShown(textOf(*report));
        const QString shown = view->GetEdit().document()->toPlainText();
        if (isRich(*report) || view->ShowsFormats()) {
            if (!showsRich(*report, shown)) {
                return QStringLiteral("a view of %1, which is rich text, shows another text than the report has: %2")
                    .arg(nameOf(*report), difference(text, shown));
            }
            continue;
        }
        if (view->GetEdit().isLoading() ? !text.startsWith(shown) : text != shown) {
            return QStringLiteral("a view of %1 shows another text than the report has: %2")
                .arg(nameOf(*report), difference(text, shown));
        }
    }
    return {};
}

/// Every command can act or says why not.
QString World::checkCommands() const
{
    if (!frame_->isVisible()) {
        return {};
    }
    frame_->UpdateCommands();
    for (const kareport::ListedCommand &command : kareport::listedCommands(*frame_->menuBar())) {
        if (command.action->isEnabled() != command.action->statusTip().isEmpty()) {
            return QStringLiteral("the command %1 is %2 and says \"%3\"")
                .arg(command.name, command.action->isEnabled() ? QStringLiteral("enabled") : QStringLiteral("disabled"),
                     command.action->statusTip());
        }
    }
    return {};
}

QString World::checkWindows()
{
    const auto lost = [this] {
        const std::vector<UReportDoc *> all = reports();
        const auto found = std::find_if(all.begin(), all.end(),
                                        [this](const UReportDoc *report) { return !isWithinReach(*report, folder_); });
        return found == all.end() ? nullptr : *found;
    };
    if (lost() != nullptr) {
        wait(editorTime); // an editor starts, or the desk sees that it has ended
        if (const UReportDoc *report = lost()) {
            return QStringLiteral("%1 cannot be seen").arg(nameOf(*report));
        }
    }
    for (const UReportDoc *report : reports()) {
        if (report->GetTitle().endsWith(u" 2") && reports().size() == 1 && report->GetPathName().isEmpty() &&
            closed_.empty() && before_.empty())
        {
            return QStringLiteral("the only report has a number: %1").arg(nameOf(*report));
        }
    }
    return {};
}

} // namespace monkey
