#include "JobSteps.h"

#include "DictionaryVariables.h"
#include "NearestName.h"
#include "PageMark.h"
#include "ReportOutline.h"
#include "TemplateCheck.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <new>

namespace kareport
{

/// What has been found writable is not written for one reason only.
void JobSteps::expectMemory(bool isWritten)
{
    if (!isWritten) {
        throw std::bad_alloc();
    }
}

std::optional<InputError> JobSteps::write()
{
    for (const Job::Step &step : job_.steps) {
        if (results_ != nullptr) {
            results_->beginStep(step);
        }
        auto wrong = std::visit([&](const auto &action) { return write(action, step.path); }, step.action);
        if (wrong || isStopped_()) {
            return wrong;
        }
        expectMemory(!report_.HasLostText());
    }
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Heading &step, const JsonPath & /*path*/)
{
    const QString text = shownText(step.text);
    report_.AnnounceEntry(ReportOutline::headingLevel, QString(text).remove(QChar(pageMark)).simplified());
    addResultText(ResultText::Heading, text, 0);
    report_.SetHeading(text, step.before, step.after);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Line &step, const JsonPath & /*path*/)
{
    const QString text = shownText(step.text);
    addResultText(ResultText::Line, text, step.style);
    report_.WriteLine(text, step.before, step.after, step.style);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::LineFeed &step, const JsonPath & /*path*/)
{
    report_.LineFeed(step.count);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::NewPage &step, const JsonPath & /*path*/)
{
    report_.NewPage(step.linesNeeded);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Clear & /*step*/, const JsonPath & /*path*/)
{
    report_.Clear();
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Block &step, const JsonPath &path)
{
    const sXmlReportBlock *block = report_.GetTemplate()->GetBlock(step.name);
    if (block == nullptr) {
        QStringList names;
        report_.GetTemplate()->GetAllBlocks(names);
        return noSuchRecord(Xlate("block"), step.name, names, path);
    }
    const WrittenRecord record = {Xlate("block"), TemplatePart::Block, step.name, block->Use, block->Fields, path};
    if (auto wrong = wrongRecord(record)) {
        return wrong;
    }
    const auto opened = openRows(step.data, block->Use, true, &block->Fields);
    if (const InputError *error = errorOf(opened)) {
        return *error;
    }
    RowList &rows = *std::get<std::unique_ptr<RowList>>(opened);
    // All rows must be valid, though only the first one is shown. It is kept: a query is not run again for it.
    UDataObject first;
    bool hasRow = false;
    for (std::size_t row = 0; const UDataObject *object = rows.GetAt(row); ++row) {
        if (!hasRow) {
            first = *object;
            hasRow = true;
        }
    }
    if (auto error = rows.error()) {
        return error;
    }
    const auto columns = rows.columns();
    if (auto wrong = columns ? noteColumns(*columns, step.data, record) : std::nullopt) {
        return wrong;
    }
    if (auto wrong = noteSource(rows)) {
        return wrong;
    }
    if (!hasRow) {
        return isStopped_() ? std::nullopt : std::optional(data_.noRow(step.data, path));
    }
    describeResults(step.data, block->Use, QStringList());
    expectMemory(report_.WriteDataBlock(step.name, &first, step.before, step.after));
    addFit(false, step.name, block->Fields, step.data, path);
    return noteValues(rows, columns, record);
}

JobSteps::Wrong JobSteps::noSuchRecord(const QString &what, const QString &name, const QStringList &names,
                                       const JsonPath &path) const
{
    return source_.errorAt(
        path, Xlate("the template has no %1 named \"%2\": %3").arg(what, name, oneOfExpected(name, names)));
}

/// A text of the job as the report shows it.
QString JobSteps::shownText(const QString &text) const
{
    if (placeholders_ == nullptr) {
        return text;
    }
    const UXmlReportTpl *tpl = report_.GetTemplate();
    return placeholders_->textOf(text, tpl != nullptr ? tpl->GetTemplateTitle() : QString());
}

/// Hands a line of text to the results, which have no pages.
void JobSteps::addResultText(ResultText kind, QString text, int style)
{
    if (results_ != nullptr) {
        results_->addText(kind, text.remove(QChar(pageMark)), style);
    }
}

void JobSteps::addFit(bool isTable, const QString &name, const sXmlReportFields &fields, const QString &data,
                      const JsonPath &path)
{
    if (fits_ != nullptr) {
        fits_->push_back({isTable, name, data, source_.errorAt(path, QString()), notes_.remarks.rows,
                          fieldFits(isTable, name, fields, notes_.remarks, *widths_)});
    }
}

/// What keeps a table or block that the template has from being written.
JobSteps::Wrong JobSteps::wrongRecord(const WrittenRecord &record) const
{
    if (report_.GetTemplate()->GetDictionary(record.use) == nullptr) {
        return source_.errorAt(record.path,
                               Xlate("the %1 \"%2\" cannot be written: the template has no dictionary named \"%3\"")
                                   .arg(record.what, record.name, record.use));
    }
    for (const sXmlReportField &field : record.fields) {
        if (field.Width > widestColumn || field.Width < -widestColumn || field.Decimals > widestColumn) {
            return source_.errorAt(
                record.path,
                Xlate("the %1 \"%2\" cannot be written: the format of its field \"%3\" is beyond %4 characters")
                    .arg(record.what, record.name, field.VariableName, QString::number(widestColumn)));
        }
    }
    return std::nullopt;
}

/// The rows of a data set, typed by a dictionary of the template.
Expected<std::unique_ptr<RowList>> JobSteps::openRows(const QString &data, const QString &dictionary, bool firstOnly,
                                                      const sXmlReportFields *shown)
{
    const UXmlReportTpl *tpl = report_.GetTemplate();
    const JobData::VariablesIn variablesIn = [this, tpl, dictionary, shown](const DataUnits &units) {
        units_ = units;
        Variables variables = variablesOf(*tpl, dictionary, units);
        if (shown != nullptr) {
            variables.shown.emplace();
            for (const sXmlReportField &field : *shown) {
                variables.shown->append(field.VariableName);
            }
        }
        return variables;
    };
    return data_.open(data, variablesIn, firstOnly);
}

} // namespace kareport
