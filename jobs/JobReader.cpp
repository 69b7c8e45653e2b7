#include "JobReader.h"

#include "ApplicationTitle.h"
#include "JobDataReader.h"
#include "JobFileName.h"
#include "JobPdfReader.h"
#include "JobSettings.h"
#include "JobStepsReader.h"
#include "JsonNode.h"
#include "NearestName.h"
#include "Placeholders.h"
#include "ResultOptionsReader.h"
#include "Xlate.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QLocale>
#include <QStringList>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

constexpr int mostLines = 1'000'000; ///< of a page
constexpr int mostMargin = 1'000'000;
constexpr int mostFontSize = 1000;
constexpr int mostResolution = 10'000;

constexpr struct
{
    QStringView key;
    PaperSize paper;
} papers[] = {
    {u"A4", PaperSize::A4}, {u"A3", PaperSize::A3}, {u"Letter", PaperSize::Letter}, {u"Legal", PaperSize::Legal}};

Job::Page readPage(const JsonNode &node, Job::Page page)
{
    if (!node.expectObject()) {
        return page;
    }
    node.allowOnly({"paper", "orientation", "resolution", "margins", "fontName", "fontSize", "linesPerPage",
                    "charsPerRow", "printer"});
    if (const JsonNode paper = node["paper"]; paper.exists()) {
        QStringList keys;
        bool known = false;
        for (const auto &row : papers) {
            keys.append(row.key.toString());
            if (paper.text() == row.key) {
                page.printer.paper = row.paper;
                page.printer.sheet = QSize();
                known = true;
            }
        }
        if (!known) {
            paper.fail(oneOfExpected(paper.text(), keys));
        }
    }
    if (const JsonNode orientation = node["orientation"]; orientation.exists()) {
        page.portrait = orientation.text() == u"portrait";
        if (!page.portrait && orientation.text() != u"landscape") {
            orientation.fail(
                oneOfExpected(orientation.text(), QStringLiteral("portrait, landscape").split(QStringLiteral(", "))));
        }
    }
    if (const JsonNode printer = node["printer"]; printer.exists()) {
        page.printer.source = PrinterSource::SystemOrBuiltIn;
        if (printer.text() != u"default") {
            printer.fail(Xlate("one of %1 was expected").arg(QStringLiteral("default")));
        }
    }
    page.printer.resolution = node["resolution"].whole(page.printer.resolution, 1, mostResolution);
    if (const JsonNode margins = node["margins"]; margins.exists()) {
        if (!margins.value().isArray() || margins.size() != 4) {
            margins.fail(Xlate("a list of four margins (left, top, right, bottom) was expected"));
        }
        const auto margin = [&](qsizetype side) { return margins[side].whole(0, 0, mostMargin); };
        page.margins = QMargins(margin(0), margin(1), margin(2), margin(3));
    }
    if (const JsonNode fontName = node["fontName"]; fontName.exists()) {
        page.fontName = fontName.text();
    }
    if (const JsonNode fontSize = node["fontSize"]; fontSize.exists()) {
        page.fontSize = fontSize.whole(8, 1, mostFontSize);
    }
    if (const JsonNode lines = node["linesPerPage"]; lines.exists()) {
        page.linesPerPage = lines.whole(1, 1, mostLines);
    }
    if (const JsonNode characters = node["charsPerRow"]; characters.exists()) {
        page.charsPerRow = characters.whole(1, 1, mostLines);
    }
    return page;
}

Job::Options readOptions(const JsonNode &node)
{
    Job::Options options;
    if (!node.expectObject()) {
        return options;
    }
    node.allowOnly({"zeroBlank", "writeTableName", "printHash", "chainageLabel", "separator", "excel", "placeholders"});
    options.zeroBlank = node["zeroBlank"].boolean(false);
    options.writeTableName = node["writeTableName"].boolean(false);
    options.printHash = node["printHash"].boolean(false);
    options.excel = node["excel"].boolean(false);
    options.placeholders = node["placeholders"].boolean(false);
    if (const JsonNode label = node["chainageLabel"]; label.exists()) {
        options.chainageLabel = label.text();
        if (const auto wrong = options.placeholders ? Placeholders::wrongIn(label.text()) : std::nullopt) {
            label.fail(*wrong);
        }
    }
    if (const JsonNode separator = node["separator"]; separator.exists()) {
        if (separator.value().isString() && separator.text().size() == 1) {
            options.separator = separator.text().front().unicode();
        } else if (separator.value().isString()) {
            separator.fail(Xlate("a character code or a text of one character was expected"));
        } else {
            options.separator = static_cast<char16_t>(separator.whole(0, 0, 0xFFFF));
        }
    }
    return options;
}

/// Adds the files that say what the columns of others are.
void addSchemas(std::vector<Output> &outputs)
{
    const std::size_t count = outputs.size();
    for (std::size_t i = 0; i < count; ++i) {
        const ResultOptions results = outputs[i].results;
        if (!results.schema.isEmpty()) {
            Output schema{results.schema, OutputKind::Schema};
            schema.results = results;
            schema.sideOf = i;
            outputs.push_back(schema);
        }
    }
}

std::optional<Output> readOutput(const JsonNode &node, const QDir &folder, std::optional<OutputKind> otherwise)
{
    const bool isObject = node.value().isObject();
    const JsonNode file = isObject ? node["file"] : node;
    const JsonNode as = node["as"];
    const QString name = file.isText() ? readFileName(file) : QString();
    const auto kind = as.exists() ? outputKindFromName(as.text()) : outputKindOf(name, otherwise);
    if (isObject) {
        node.allowOnly(kind ? outputKeys(*kind) : allOutputKeys());
    }
    if (!file.exists()) {
        node.fail(Xlate("the key \"file\" was expected"));
        return std::nullopt;
    }
    if (!file.isText()) {
        readFileName(file); // which says what was expected
        return std::nullopt;
    }
    if (!kind && as.exists()) {
        as.fail(oneOfExpected(as.text(), outputKindNames().split(QStringLiteral(", "))));
        return std::nullopt;
    }
    if (!kind) {
        file.fail(Xlate("the ending of \"%1\" does not say the kind: the key \"as\" with one of %2 was expected")
                      .arg(name, outputKindNames()));
        return std::nullopt;
    }
    Output output{name == u"-" ? name : folder.filePath(name), *kind};
    if (isObject) {
        output.results = readResultOptions(node, *kind, folder);
    }
    return output;
}

std::vector<Output> readOutputs(const JsonNode &nodes, const QDir &folder, std::optional<OutputKind> otherwise)
{
    std::vector<Output> outputs;
    if (!nodes.expectArray()) {
        return outputs;
    }
    for (qsizetype i = 0; i < nodes.size(); ++i) {
        if (const auto output = readOutput(nodes[i], folder, otherwise)) {
            outputs.push_back(*output);
        }
    }
    addSchemas(outputs);
    return outputs;
}

/// The time on the clock that a job fixes.
std::optional<QDateTime> readTime(const JsonNode &node)
{
    if (!node.exists()) {
        return std::nullopt;
    }
    // The hands of a clock, without a zone: a time that a zone's summer time leaves out is one all the same.
    QDateTime time = QDateTime::fromString(node.text() + u'Z', Qt::ISODate);
    if (!time.isValid()) {
        time = QDateTime::fromString(node.text(), Qt::ISODate);
    }
    if (!time.isValid()) {
        node.fail(Xlate("a date and time such as 2024-03-05T14:07:00 was expected"));
    }
    return time;
}

/// The job's own template file wins over an installed one of the same name.
QString templatePath(const QString &name, const QDir &folder, const QDir &installed)
{
    const QString own = folder.filePath(name);
    const QString other = installed.filePath(name);
    return QFileInfo::exists(own) || !QFileInfo::exists(other) ? own : other;
}

std::optional<Job::Template> readTemplate(const JsonNode &node, const QDir &folder, const QDir &installed)
{
    if (!node.expectObject()) {
        return std::nullopt;
    }
    node.allowOnly({"file", "name"});
    for (const char *key : {"file", "name"}) {
        if (node[QString::fromLatin1(key)].text().isEmpty()) {
            node.fail(Xlate("the key \"%1\" with a text was expected").arg(QLatin1StringView(key)));
        }
    }
    return Job::Template{templatePath(readFileName(node["file"]), folder, installed), node["name"].text()};
}

Job readRoot(const JsonNode &root, const QDir &folder, bool isOnInput, const JobDefaults &defaults)
{
    Job job;
    root.allowOnly({"title", "application", "strict", "header", "now", "page", "settings", "template", "options",
                    "data", "report", "output", "pdf"});
    if (const JsonNode title = root["title"]; title.exists()) {
        job.title = title.text();
    }
    if (const JsonNode application = root["application"]; application.exists()) {
        job.application = application.text();
        if (!job.application.startsWith(GetApplicationTitle())) {
            application.fail(Xlate("a text that begins with \"%1\" was expected").arg(GetApplicationTitle()));
        }
    }
    job.strict = root["strict"].boolean(false);
    job.header = root["header"].boolean(true);
    job.now = readTime(root["now"]);
    job.page = readPage(root["page"], defaults.page);
    job.settings = readSettings(root["settings"], defaults.settings);
    job.reportTemplate = readTemplate(root["template"], folder, QDir(defaults.templateFolder));
    job.options = readOptions(root["options"]);
    job.pdf = readPdf(root["pdf"]);
    job.data = readDataSets(root["data"], folder, isOnInput);
    job.steps = readSteps(root["report"], job);
    job.outputs = readOutputs(root["output"], folder, defaults.outputKind);
    return job;
}

} // namespace

QString paperKey(PaperSize paper)
{
    if (paper == PaperSize::ByLocale) {
        paper = QLocale::system().measurementSystem() == QLocale::ImperialUSSystem ? PaperSize::Letter : PaperSize::A4;
    }
    const auto *row =
        std::find_if(std::begin(papers), std::end(papers), [paper](const auto &other) { return other.paper == paper; });
    return row->key.toString();
}

Expected<Job> readJob(const JsonSource &source, const JobDefaults &defaults)
{
    std::optional<InputError> error;
    const QDir folder = source.path().isEmpty() ? QDir::current() : QFileInfo(source.path()).absoluteDir();
    Job job = readRoot(JsonNode(source, error), folder, source.path() == u"-", defaults);
    if (error) {
        return *std::move(error);
    }
    return job;
}

QJsonObject TemplateJob::toJson() const
{
    const QString set = QStringLiteral("data");
    const bool isTable = !table.isEmpty();
    const QJsonObject step = {{isTable ? QStringLiteral("table") : QStringLiteral("block"), isTable ? table : block},
                              {set, set}};
    QJsonObject dataSet = dataOptions;
    dataSet.insert(dataKind, data);
    return {
        {QStringLiteral("template"),
         QJsonObject{{QStringLiteral("file"), templateFile}, {QStringLiteral("name"), templateName}}},
        {set, QJsonObject{{set, dataSet}}},
        {QStringLiteral("report"), QJsonArray{step}},
    };
}

} // namespace kareport
