#pragma once

#include "InputError.h"
#include "JobReader.h"
#include "JsonSource.h"
#include "KeptData.h"
#include "TemplateCheck.h"
#include "TemplateOutline.h"
#include "UReportDoc.h"
#include "WrittenCells.h"

#include <QByteArray>
#include <QDateTime>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// A report that pages are made in, without a view. It is made and deleted by the thread of the windows, as all reports are;
/// the pages may be made in it by another one.
class PreviewReport : public UReportDoc
{
public:
    PreviewReport();
    /// The title as it was set: windows would number one that is taken.
    void SetTitle(const QString &title) override;
};

/// A piece of a page that shows a field of the template.
struct PreviewCell
{
    qint64 at = 0; ///< its first character in the text of the pages
    qsizetype size = 0;
    bool isLabel = false; ///< in the heading of a table
    TextRange field;      ///< the element of the field in the template's text
    TextRange target;     ///< where the cursor goes for it: to the label, or to the name of the variable
};

/// The first pages of a report.
struct PreviewPages
{
    QString text;                   ///< lines ended by CR LF, as the report has them
    std::vector<qint64> starts;     ///< of the pages in the text
    bool isWhole = false;           ///< there are no more pages
    std::vector<PreviewCell> cells; ///< by their places
    QString templateName;           ///< that they were made with

    /// The cell at a place in the text; null where there is none.
    const PreviewCell *cellAt(qint64 at) const;
};

/// The pages and remarks of a template's text.
struct PreviewResult
{
    std::optional<PreviewPages> pages; ///< nothing where they could not be made
    std::optional<InputError> wrong;   ///< why not; nothing when it was stopped
    bool isStopped = false;
};

/// Makes the first pages of a report of a template that is being edited: the same ones as the whole report would have. The
/// data is read once and kept. Used by one thread at a time.
class TemplatePreview
{
public:
    /// Pages that are made, and lines where pages are long.
    static constexpr int mostPages = 3;
    static constexpr int mostLines = 1000;

    /// @param path  of the template file, for messages and for the jobs that use it
    /// @param now   the time of reports that do not say theirs
    TemplatePreview(QString path, QDateTime now);
    ~TemplatePreview();

    /// Shows the templates with rows made up to their types.
    void useSamples();
    /// Shows the template of a job with its data. @return what is wrong with the job; the data before it is then used further
    std::optional<InputError> useJob(const Expected<JsonSource> &source);
    bool usesSamples() const { return data_ == nullptr; }
    /// The template of the job; empty while samples are shown.
    QString jobTemplate() const;
    /// The files that the data comes from; none for samples.
    QStringList dataFiles() const;

    /// Makes the pages.
    /// @param text    of the template, its lines ended by LF, for places; @param bytes  the same as the file would have it
    /// @param name    the template that samples are shown of; a job says its own
    /// @param report  a new one
    /// @param isStopped  is asked now and then; its true ends the work
    /// @param outline    of the text, where it is known already; null to have it made
    PreviewResult make(const QString &text, const QByteArray &bytes, const QString &name, PreviewReport &report,
                       const std::function<bool()> &isStopped, const TemplateOutline *outline = nullptr);
    /// What the check of templates says of a text, in its order.
    static std::vector<TemplateRemark> remarksOn(const QString &text);
    /// How often data was opened or ordered so far.
    int openings() const { return openings_ + (data_ ? data_->openings() : 0); }

private:
    std::optional<InputError> makePages(const QString &text, const QByteArray &bytes, const QString &name,
                                        PreviewReport &report, const std::function<bool()> &isStopped,
                                        const TemplateOutline *outline, std::optional<PreviewPages> &pages);
    Expected<std::shared_ptr<KeptData>> dataFor(const QString &file, const QString &name);
    std::optional<InputError> write(const QByteArray &bytes, const QString &file) const;
    InputError withOwnPath(InputError error, const QString &file) const;

    QString path_;
    QDateTime now_;
    QTemporaryDir folder_;
    std::shared_ptr<KeptData> data_; ///< of a job; null for samples
    int openings_ = 0;
};

} // namespace kareport
