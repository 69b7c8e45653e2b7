#pragma once

#include "ColumnNotes.h"
#include "InputError.h"
#include "Job.h"
#include "JobData.h"
#include "JsonSource.h"
#include "NameQuestions.h"
#include "Placeholders.h"
#include "ResultOutputs.h"
#include "ShownRows.h"
#include "StepFit.h"
#include "TemplatePlaces.h"
#include "UReportDoc.h"

#include <QSet>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace kareport
{

/// A table or block of the template that a step writes.
struct WrittenRecord
{
    QString what; ///< "table" or "block", translated
    TemplatePart part;
    QString name;
    QString use; ///< the name of its dictionary
    const sXmlReportFields &fields;
    const JsonPath &path; ///< of the step
};

/// Writes the steps of a job into a report that has the job's template, one after the other.
class JobSteps
{
public:
    /// @param source     the job file, for the places of errors
    /// @param notes      receive what the user should know of the report
    /// @param isStopped  is asked after each step
    JobSteps(const Job &job, const JsonSource &source, JobData &data, UReportDoc &report, StepNotes notes,
             const std::function<bool()> &isStopped)
        : job_(job), source_(source), data_(data), report_(report), notes_(notes), isStopped_(isStopped)
    {}

    /// Says what the placeholders of lines and headings are replaced by; null where they have none. They must outlive the steps.
    void setPlaceholders(const Placeholders *placeholders) { placeholders_ = placeholders; }
    /// Says which outputs receive the values that are written; null for none. They must outlive the steps.
    void setResults(ResultOutputs *results) { results_ = results; }
    /// Adds to a list how the data of each step fits, from the remarks on it, which must have the widest values.
    void measureInto(std::vector<StepFit> &fits, FormatWidths widths)
    {
        fits_ = &fits;
        widths_ = std::make_unique<FormatWidths>(std::move(widths));
    }

    /// @return what is wrong with a step or with its data; nothing when all steps were written or the work was stopped
    /// @throws std::bad_alloc where the report has lost text: half a report counts as none
    std::optional<InputError> write();

private:
    using Wrong = std::optional<InputError>;

    Wrong write(const Job::Heading &step, const JsonPath &path);
    Wrong write(const Job::Line &step, const JsonPath &path);
    Wrong write(const Job::LineFeed &step, const JsonPath &path);
    Wrong write(const Job::NewPage &step, const JsonPath &path);
    Wrong write(const Job::Clear &step, const JsonPath &path);
    Wrong write(const Job::Block &step, const JsonPath &path);
    Wrong write(const Job::Table &step, const JsonPath &path);

    Wrong noSuchRecord(const QString &what, const QString &name, const QStringList &names, const JsonPath &path) const;
    /// The first of two errors.
    static Wrong firstOf(const Wrong &first, const Wrong &second) { return first ? first : second; }
    Wrong wrongRecord(const WrittenRecord &record) const;
    static void expectMemory(bool isWritten);
    /// @param shown  the fields that show what is read; null where more is made of it
    Expected<std::unique_ptr<RowList>> openRows(const QString &data, const QString &dictionary, bool firstOnly,
                                                const sXmlReportFields *shown);
    Wrong noteColumns(const SourceColumns &columns, const QString &data, const WrittenRecord &record);
    void noteUnits(const ColumnComparison &compared, const QString &data);
    Wrong noteField(const UnfilledField &field, const WrittenRecord &record);
    Wrong noteSortKeys(const WrittenRecord &record);
    Wrong noteSource(const RowList &rows);
    Wrong noteLeftOut(ShownRows &rows, const WrittenRecord &record);
    /// What a table step makes of its rows.
    struct ShapedRows
    {
        ShownRows *rows = nullptr; ///< null where it asks for nothing
        QStringList needed;        ///< the variables of the data that it names
    };
    Expected<ShapedRows> shape(std::unique_ptr<RowList> &rows, const Job::Table &step, const sXmlReportTable &table);
    QStringList neededVariables(const QString &table, const QStringList &named) const;
    QString shownText(const QString &text) const;
    void addResultText(ResultText kind, QString text, int style);
    void describeResults(const QString &data, const QString &dictionary, const QStringList &needed);
    void addFit(bool isTable, const QString &name, const sXmlReportFields &fields, const QString &data,
                const JsonPath &path);
    Wrong noteValues(RowList &rows, const std::optional<SourceColumns> &columns, const WrittenRecord &record);
    Wrong noteValue(const ColumnRemarks &column, bool isRead, RowList &rows, const WrittenRecord &record);
    InputError inTemplate(TemplatePart part, const QString &variable, const WrittenRecord &record, const QString &text);

    const Job &job_;
    const JsonSource &source_;
    JobData &data_;
    UReportDoc &report_;
    StepNotes notes_;
    const std::function<bool()> &isStopped_;
    const Placeholders *placeholders_ = nullptr;
    ResultOutputs *results_ = nullptr;
    std::vector<StepFit> *fits_ = nullptr; ///< null where nothing is measured
    std::unique_ptr<FormatWidths> widths_;
    std::unique_ptr<VariablePlaces>
        places_; ///< of the template; null until one is asked for, and where it cannot be read
    bool arePlacesRead_ = false;
    NameQuestions questions_;
    QSet<QString> comparedData_; ///< dictionaries and data sets whose columns were compared with them
    QSet<QString> notedUnits_;   ///< data sets and keys of units
    DataUnits units_;            ///< of the data that was opened last
};

} // namespace kareport
