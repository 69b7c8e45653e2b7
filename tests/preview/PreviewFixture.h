#pragma once

#include "JobFolder.h"
#include "JobRunner.h"
#include "TemplatePreview.h"

#include <QDateTime>

/// Makes pages of a template in a folder as the editor does.
class Previewed
{
public:
    explicit Previewed(const QString &path) : preview(path, time()) {}

    static QDateTime time() { return QDateTime(QDate(2024, 3, 5), QTime(14, 7)); }

    /// The pages of a text; those before stay where it is broken.
    const kareport::PreviewResult &show(
        const QString &text, const QString &name = QString(),
        const std::function<bool()> &isStopped = [] { return false; })
    {
        kareport::PreviewReport report;
        result = preview.make(text, text.toUtf8(), name, report, isStopped);
        return result;
    }
    /// The text of the pages with LF for its line ends, or what is wrong.
    QString shown() const
    {
        if (!result.pages) {
            return result.wrong ? result.wrong->message() : QStringLiteral("(stopped)");
        }
        return QString(result.pages->text).replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    }
    /// What the text of a cell is.
    QString textOf(const kareport::PreviewCell &cell) const { return result.pages->text.mid(cell.at, cell.size); }

    kareport::TemplatePreview preview;
    kareport::PreviewResult result;
};

/// The whole report of a job in a folder, as the command line makes it; what is wrong begins with "error: ".
inline QString wholeReport(const QString &job)
{
    auto source = kareport::JsonSource::read(job);
    if (const auto *wrong = kareport::errorOf(source)) {
        return QStringLiteral("error: ") + wrong->text;
    }
    auto read = kareport::readJob(std::get<kareport::JsonSource>(source));
    if (const auto *wrong = kareport::errorOf(read)) {
        return QStringLiteral("error: ") + wrong->text;
    }
    auto &known = std::get<kareport::Job>(read);
    known.outputs.clear();
    known.now = known.now ? known.now : Previewed::time();
    UReportDoc report(kareport::surroundingsOf(known));
    kareport::Progress progress(false);
    if (const auto wrong = kareport::JobRunner(known, std::get<kareport::JsonSource>(source), progress).run(report)) {
        return QStringLiteral("error: ") + wrong->text;
    }
    return report.CopyText().replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
}
