#include "JobRunner.h"

#include "CsvObjectList.h"
#include "Folders.h"
#include "Interrupt.h"
#include "JsonObjectList.h"
#include "ReportEntry.h"
#include "ReportTextCodec.h"
#include "TemplateCheck.h"
#include "TemplateSource.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <QFileInfo>

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

/// Rows that end when the work is to stop.
class StoppableList : public UDataObjectList
{
public:
    explicit StoppableList(std::function<bool()> isStopped) : isStopped_(std::move(isStopped)) {}

    UDataObject *GetAt(std::size_t index) override
    {
        const bool isEnd = index % rowsBetween == 0 && isStopped_();
        return isEnd ? nullptr : UDataObjectList::GetAt(index);
    }

private:
    static constexpr std::size_t rowsBetween = 256;

    std::function<bool()> isStopped_;
};

} // namespace

/// Carries out the steps of a job, one after the other.
class JobRunner::Steps
{
public:
    explicit Steps(JobRunner &runner) : runner_(runner), report_(*runner.report_) {}

    std::optional<InputError> run()
    {
        for (const Job::Step &step : runner_.job_.steps) {
            path_ = step.path;
            std::visit(*this, step.action);
            if (error_ || runner_.source_.failed() || runner_.isStopped()) {
                break;
            }
            if (report_.HasLostText()) {
                throw std::bad_alloc(); // half a report is none
            }
        }
        return error_ ? error_ : runner_.source_.error();
    }

    void operator()(const Job::Heading &step) { report_.SetHeading(step.text, step.before, step.after); }
    void operator()(const Job::Line &step) { report_.WriteLine(step.text, step.before, step.after, step.style); }
    void operator()(const Job::LineFeed &step) { report_.LineFeed(step.count); }
    void operator()(const Job::NewPage &step) { report_.NewPage(step.linesNeeded); }
    void operator()(const Job::Clear & /*step*/) { report_.Clear(); }

    void operator()(const Job::Block &step)
    {
        const sXmlReportBlock *block = report_.GetTemplate()->GetBlock(step.name);
        if (!isWritable(block, step.name, Xlate("block"),
                        [](const UXmlReportTpl &tpl, QStringList &names) { tpl.GetAllBlocks(names); }))
        {
            return;
        }
        const auto list = openData(step.data, block->Use, true);
        // All rows must be good, though only the first one is shown.
        for (std::size_t row = 0; list && list->GetAt(row) != nullptr; ++row) {
        }
        const bool isGood = list && !takeError(list.get());
        const UDataObject *object = isGood ? list->GetAt(0) : nullptr;
        if (isGood && object == nullptr && !runner_.isStopped()) {
            failWithoutRow(step.data);
        }
        if (object != nullptr && !failed()) {
            needMemory(report_.WriteDataBlock(step.name, object, step.before, step.after));
        }
    }

    void operator()(const Job::Table &step)
    {
        const sXmlReportTable *table = report_.GetTemplate()->GetTable(step.name);
        if (!isWritable(table, step.name, Xlate("table"),
                        [](const UXmlReportTpl &tpl, QStringList &names) { tpl.GetAllTables(names); }))
        {
            return;
        }
        const auto list = openData(step.data, table->Use, false);
        if (list && !takeError(list.get()) && !failed()) {
            needMemory(report_.WriteDataTable(step.name, list.get(), step.before, step.after, step.headingAfter));
            takeError(list.get());
        }
    }

private:
    /// What has been found writable is not written for one reason only.
    static void needMemory(bool isWritten)
    {
        if (!isWritten) {
            throw std::bad_alloc();
        }
    }

    bool failed() const { return error_ || runner_.source_.failed(); }

    template <typename Record, typename GetNames>
    bool isWritable(const Record *record, const QString &name, const QString &what, GetNames getNames)
    {
        const UXmlReportTpl &tpl = *report_.GetTemplate();
        if (record == nullptr) {
            QStringList names;
            getNames(tpl, names);
            runner_.source_.fail(
                path_, Xlate("the template has no %1 named \"%2\": one of %3 was expected")
                           .arg(what, name, names.isEmpty() ? Xlate("none") : names.join(QStringLiteral(", "))));
            return false;
        }
        if (tpl.GetDictionary(record->Use) == nullptr) {
            runner_.source_.fail(path_,
                                 Xlate("the %1 \"%2\" cannot be written: the template has no dictionary named \"%3\"")
                                     .arg(what, name, record->Use));
            return false;
        }
        for (const sXmlReportField &field : record->Fields) {
            if (field.Width > widestColumn || field.Width < -widestColumn || field.Decimals > widestColumn) {
                runner_.source_.fail(
                    path_, Xlate("the %1 \"%2\" cannot be written: the format of its field \"%3\" is beyond %4 "
                                 "characters")
                               .arg(what, name, field.VariableName, QString::number(widestColumn)));
                return false;
            }
        }
        return true;
    }

    /// The rows of a data set, typed by a dictionary of the template.
    std::unique_ptr<UDataObjectList> openData(const QString &name, const QString &dictionary, bool firstOnly)
    {
        const Job::DataSet &set = *runner_.job_.data.constFind(name);
        const UXmlReportTpl *tpl = report_.GetTemplate();
        const FindVariable findVariable = [tpl, &set,
                                           dictionary](const QString &variable) -> std::optional<ValueParser> {
            qint32 id = 0;
            qint32 type = 0;
            if (!tpl->FindVariable(dictionary, variable, id, type)) {
                return std::nullopt;
            }
            return ValueParser(type, static_cast<unsigned>(id), set.units);
        };
        return set.csv.isEmpty() ? readValues(name, findVariable, firstOnly) : openCsv(name, set, findVariable);
    }

    std::unique_ptr<UDataObjectList> openCsv(const QString &name, const Job::DataSet &set,
                                             const FindVariable &findVariable)
    {
        // A pipe can be read once only: its bytes serve every step.
        auto &bytes = files_[set.csv];
        if (!bytes) {
            auto file = FileBytes::open(set.csv);
            if (const InputError *error = errorOf(file)) {
                JsonNode(runner_.source_)["data"][name]["csv"].fail(
                    Xlate("the data file \"%1\" cannot be read: %2").arg(set.csv, error->text));
                return nullptr;
            }
            bytes = std::get<std::shared_ptr<const FileBytes>>(file);
        }
        Progress &progress = runner_.progress_;
        progress.begin(Xlate("Reading %1").arg(QFileInfo(set.csv).fileName()), bytes->view().size());
        return std::make_unique<CsvObjectList>(bytes, set.delimiter, findVariable, [this, &progress](std::size_t read) {
            progress.advance(read);
            return !runner_.isStopped();
        });
    }

    std::unique_ptr<UDataObjectList> readValues(const QString &name, const FindVariable &findVariable, bool firstOnly)
    {
        const JsonNode values = JsonNode(runner_.source_)["data"][name]["values"];
        auto list = std::make_unique<StoppableList>([this] { return runner_.isStopped(); });
        if (values.isObject()) {
            storeJsonObject(values, findVariable, list->Add());
            return list;
        }
        for (qsizetype i = 0; i < (firstOnly ? qMin<qsizetype>(values.size(), 1) : values.size()); ++i) {
            storeJsonObject(values[i], findVariable, list->Add());
        }
        return list;
    }

    void failWithoutRow(const QString &data)
    {
        const QString &csv = runner_.job_.data.constFind(data)->csv;
        if (csv.isEmpty()) {
            runner_.source_.fail(path_, Xlate("the data \"%1\" has no row: a block shows the first one").arg(data));
        } else {
            error_ = InputError{csv, TextPlace(),
                                Xlate("a row was expected behind the header row: a block shows the first one")};
        }
    }

    bool takeError(UDataObjectList *list)
    {
        const auto *csv = dynamic_cast<const CsvObjectList *>(list);
        if (csv != nullptr && csv->error()) {
            error_ = csv->error();
        }
        return error_.has_value();
    }

    JobRunner &runner_;
    UReportDoc &report_;
    JsonPath path_;
    std::optional<InputError> error_;
    QHash<QString, std::shared_ptr<const FileBytes>> files_; ///< by their paths
};

JobRunner::JobRunner(const Job &job, JsonSource &source, Progress &progress, MakeReport make)
    : job_(job), source_(source), progress_(progress), surroundings_(job), make_(std::move(make))
{
    // In a program with windows the report belongs to it.
    if (UApplication::Get() == nullptr) {
        application_.emplace();
        application_->AddDocTemplate(makeReportTemplate());
    }
}

JobRunner::~JobRunner() = default;

std::optional<InputError> JobRunner::run(ReportTextWriter *stream)
{
    stream_ = stream;
    if (auto error = prepare()) {
        return error;
    }
    report_->StreamText(stream);
    return Steps(*this).run();
}

bool JobRunner::isStopped() const
{
    return isInterrupted() || (stream_ != nullptr && stream_->hasFailed()) || (isToStop_ && isToStop_());
}

std::optional<InputError> JobRunner::prepare()
{
    // No page is measured before the face is known.
    setDefaultPrinter({PrinterSource::None});
    report_ = make_ ? make_(job_.header) : CreateReport(QString(), job_.header, false, nullptr, 0, nullptr);
    if (report_ == nullptr) {
        return InputError{source_.path(), std::nullopt, Xlate("the report could not be made")};
    }
    if (job_.title) {
        report_->SetReportFileName(*job_.title);
    }
    report_->SetRTFDataFlag(std::any_of(job_.outputs.begin(), job_.outputs.end(),
                                        [](const Output &output) { return output.kind == OutputKind::RichTextImage; }));
    DefaultPrinter printer = job_.page.printer;
    if (!needsFonts(job_)) {
        printer.source = PrinterSource::BuiltIn; // the page is fixed: no printer is asked
    }
    setDefaultPrinter(printer);
    if (job_.page.fontName) {
        report_->SetFontName(*job_.page.fontName);
    }
    report_->FixPage(job_.page.linesPerPage, job_.page.charsPerRow);
    report_->SetPageSize();
    if (report_->GetLinesPerPage() < 1 || report_->GetCharsPerRow() < 1) {
        const JsonNode page = JsonNode(source_)["page"];
        page.fail(Xlate("the margins leave no room on the page: smaller margins or a smaller font were expected"));
        return source_.error();
    }
    report_->SetJobSettings(job_.settings);
    if (auto error = loadTemplate()) {
        return error;
    }
    applyOptions();
    // A title is set when the page is known: its header line is built then.
    if (job_.title) {
        report_->SetTitle(*job_.title);
    } else if (!job_.reportTemplate) {
        report_->SetHeader();
    }
    return std::nullopt;
}

std::optional<InputError> JobRunner::loadTemplate()
{
    if (!job_.reportTemplate) {
        return std::nullopt;
    }
    const QString path = templatePath(job_);
    const QFileInfo info(path);
    if (!info.isFile()) {
        JsonNode(source_)["template"]["file"].fail(Xlate("there is no template file \"%1\"").arg(path));
        return source_.error();
    }
    if (auto wrong = wrongTemplateSource(path)) {
        return wrong;
    }
    setLibraryDir(info.absolutePath());
    setStartPathName(info.absolutePath());
    const bool loaded = report_->LoadTemplateXml(info.fileName(), job_.reportTemplate->name, QString(), QString());
    setLibraryDir(QString());
    setStartPathName(job_.folder);
    if (loaded) {
        return std::nullopt;
    }
    const auto file = readTemplateSource(path);
    const InputError *error = errorOf(file);
    return error != nullptr ? *error : whyNotLoaded(path, std::get<TemplateFile>(file), job_.reportTemplate->name);
}

void JobRunner::applyOptions()
{
    report_->SetZeroBlank(job_.options.zeroBlank);
    report_->WriteTableName(job_.options.writeTableName);
    if (job_.options.chainageLabel) {
        report_->SetChainageLabel(*job_.options.chainageLabel);
    }
    if (job_.options.excel) {
        report_->SetExcelFormat();
    }
    if (job_.options.separator) {
        report_->SetDataColumnSeparator(*job_.options.separator, false);
    }
}

} // namespace kareport
