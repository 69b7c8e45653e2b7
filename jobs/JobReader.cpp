#include "JobReader.h"

#include "ApplicationTitle.h"
#include "Xlate.h"

#include <QDir>
#include <QFileInfo>
#include <QStringList>

#include <limits>

namespace kareport
{

namespace
{

constexpr int mostLines = 1'000'000; ///< of a page, and blank lines of a step
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
                known = true;
            }
        }
        if (!known) {
            paper.fail(Xlate("one of %1 was expected").arg(keys.join(QStringLiteral(", "))));
        }
    }
    if (const JsonNode orientation = node["orientation"]; orientation.exists()) {
        page.portrait = orientation.text() == u"portrait";
        if (!page.portrait && orientation.text() != u"landscape") {
            orientation.fail(Xlate("one of %1 was expected").arg(QStringLiteral("portrait, landscape")));
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
    node.allowOnly({"zeroBlank", "writeTableName", "printHash", "chainageLabel", "separator", "excel"});
    options.zeroBlank = node["zeroBlank"].boolean(false);
    options.writeTableName = node["writeTableName"].boolean(false);
    options.printHash = node["printHash"].boolean(false);
    options.excel = node["excel"].boolean(false);
    if (const JsonNode label = node["chainageLabel"]; label.exists()) {
        options.chainageLabel = label.text();
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

/// The system takes a file name for ended at a character 0, and would open another file.
QString readFileName(const JsonNode &node)
{
    const QString name = node.text();
    if (name.contains(QChar::Null)) {
        node.fail(Xlate("a file name without a character 0 was expected"));
    }
    return name;
}

QHash<QString, Job::DataSet> readData(const JsonNode &node, const QDir &folder)
{
    QHash<QString, Job::DataSet> sets;
    if (!node.expectObject()) {
        return sets;
    }
    for (const QString &name : node.keys()) {
        const JsonNode set = node[name];
        if (!set.expectObject()) {
            break;
        }
        set.allowOnly({"csv", "delimiter", "values", "units"});
        Job::DataSet read;
        read.units = readDataUnits(set["units"]);
        const JsonNode csv = set["csv"];
        const JsonNode values = set["values"];
        if (csv.exists() == values.exists()) {
            set.fail(Xlate("either \"csv\" or \"values\" was expected"));
        } else if (csv.exists()) {
            read.csv = folder.filePath(readFileName(csv));
        } else if (!values.value().isArray() && !values.value().isObject()) {
            values.fail(Xlate("an object or a list of objects was expected"));
        }
        if (const JsonNode delimiter = set["delimiter"]; delimiter.exists()) {
            const QString text = delimiter.text();
            if (text.size() != 1 || text[0].unicode() > 127 || QStringLiteral("\"\r\n").contains(text[0]) ||
                text[0].isNull()) {
                delimiter.fail(
                    Xlate("a text of one ASCII character that is neither a quote nor a line end was expected"));
            } else {
                read.delimiter = text[0].toLatin1();
            }
        }
        sets.insert(name, read);
    }
    return sets;
}

int readLines(const JsonNode &node, int fallback)
{
    return node.whole(fallback, -mostLines, mostLines);
}

/// A line takes any style: one that rich text does not know stands in the plain text alone.
int readStyle(const JsonNode &node)
{
    return node.whole(0, std::numeric_limits<int>::min(), std::numeric_limits<int>::max());
}

std::optional<Job::Step> readStep(const JsonNode &node)
{
    if (!node.expectObject()) {
        return std::nullopt;
    }
    const auto step = [&](const char *key, auto action) -> std::optional<Job::Step> {
        return Job::Step{action, node[QString::fromLatin1(key)].path()};
    };
    const int before = readLines(node["before"], 0);
    if (node["heading"].exists()) {
        node.allowOnly({"heading", "before", "after"});
        return step("heading", Job::Heading{node["heading"].text(), before, readLines(node["after"], 0)});
    }
    if (node["line"].exists()) {
        node.allowOnly({"line", "before", "after", "style"});
        return step("line",
                    Job::Line{node["line"].text(), before, readLines(node["after"], 1), readStyle(node["style"])});
    }
    if (node["lineFeed"].exists()) {
        node.allowOnly({"lineFeed"});
        return step("lineFeed", Job::LineFeed{readLines(node["lineFeed"], 0)});
    }
    if (node["newPage"].exists()) {
        node.allowOnly({"newPage"});
        return step("newPage", Job::NewPage{readLines(node["newPage"], 0)});
    }
    if (node["block"].exists()) {
        node.allowOnly({"block", "data", "before", "after"});
        return step("block",
                    Job::Block{node["block"].text(), node["data"].text(), before, readLines(node["after"], 0)});
    }
    if (node["table"].exists()) {
        node.allowOnly({"table", "data", "before", "after", "headingAfter"});
        return step("table", Job::Table{node["table"].text(), node["data"].text(), before, readLines(node["after"], 0),
                                        readLines(node["headingAfter"], -1)});
    }
    if (node["clear"].exists()) {
        node.allowOnly({"clear"});
        if (!node["clear"].boolean(true)) {
            node["clear"].fail(Xlate("true was expected"));
        }
        return step("clear", Job::Clear{});
    }
    node.allowOnly({"heading", "line", "lineFeed", "newPage", "block", "table", "clear"});
    node.fail(Xlate("a step was expected: one of heading, line, lineFeed, newPage, block, table, clear"));
    return std::nullopt;
}

/// The data set that a step shows, and the template that it is shown through, must be there.
void checkStep(const JsonNode &node, const Job &job)
{
    for (const char *key : {"block", "table"}) {
        if (!node[QString::fromLatin1(key)].exists()) {
            continue;
        }
        if (!job.reportTemplate) {
            node.fail(Xlate("a \"%1\" needs a template: the key \"template\" was expected in the job")
                          .arg(QLatin1StringView(key)));
        }
        const JsonNode data = node["data"];
        if (!data.exists()) {
            node.fail(Xlate("the key \"data\" with the name of a data set was expected"));
        } else if (!job.data.contains(data.text())) {
            data.fail(Xlate("there is no data set named \"%1\" in the job").arg(data.text()));
        }
    }
}

std::vector<Job::Step> readSteps(const JsonNode &node, const Job &job)
{
    std::vector<Job::Step> steps;
    if (!node.exists()) {
        node.fail(Xlate("the key \"report\" with a list of steps was expected"));
    }
    if (!node.expectArray()) {
        return steps;
    }
    for (qsizetype i = 0; i < node.size(); ++i) {
        const auto step = readStep(node[i]);
        checkStep(node[i], job);
        if (!step) {
            break;
        }
        steps.push_back(*step);
    }
    return steps;
}

std::optional<Output> readOutput(const JsonNode &node, const QDir &folder, std::optional<OutputKind> otherwise)
{
    if (node.value().isObject()) {
        node.allowOnly({"file", "as"});
    }
    const JsonNode file = node.value().isObject() ? node["file"] : node;
    if (!file.exists()) {
        node.fail(Xlate("the key \"file\" was expected"));
        return std::nullopt;
    }
    const QString name = readFileName(file);
    const JsonNode as = node["as"];
    const auto kind = as.exists() ? outputKindFromName(as.text()) : outputKindOf(name, otherwise);
    if (!kind && as.exists()) {
        as.fail(Xlate("one of %1 was expected").arg(outputKindNames()));
        return std::nullopt;
    }
    if (!kind) {
        file.fail(Xlate("the ending of \"%1\" says no kind: the key \"as\" with one of %2 was expected")
                      .arg(name, outputKindNames()));
        return std::nullopt;
    }
    return Output{name == u"-" ? name : folder.filePath(name), *kind};
}

} // namespace

Job readJob(JsonSource &source, std::optional<OutputKind> kindOtherwise, const JobDefaults &defaults)
{
    const JsonNode root(source);
    const QDir folder = source.path().isEmpty() ? QDir::current() : QFileInfo(source.path()).absoluteDir();
    Job job;
    job.folder = folder.path();
    root.allowOnly({"title", "application", "header", "now", "page", "settings", "template", "options", "data",
                    "report", "output"});
    if (const JsonNode title = root["title"]; title.exists()) {
        job.title = title.text();
    }
    if (const JsonNode application = root["application"]; application.exists()) {
        job.application = application.text();
        if (!job.application.startsWith(GetApplicationTitle())) {
            application.fail(Xlate("a text that begins with \"%1\" was expected").arg(GetApplicationTitle()));
        }
    }
    job.header = root["header"].boolean(true);
    if (const JsonNode now = root["now"]; now.exists()) {
        // The hands of a clock, without a zone: a time that a zone's summer time leaves out is one all the same.
        job.now = QDateTime::fromString(now.text() + u'Z', Qt::ISODate);
        if (!job.now->isValid()) {
            job.now = QDateTime::fromString(now.text(), Qt::ISODate);
        }
        if (!job.now->isValid()) {
            now.fail(Xlate("a date and time such as 2024-03-05T14:07:00 was expected"));
        }
    }
    job.page = readPage(root["page"], defaults.page);
    job.settings = readSettings(root["settings"], defaults.settings);
    if (const JsonNode node = root["template"]; node.expectObject()) {
        node.allowOnly({"file", "name"});
        for (const char *key : {"file", "name"}) {
            if (node[QString::fromLatin1(key)].text().isEmpty()) {
                node.fail(Xlate("the key \"%1\" with a text was expected").arg(QLatin1StringView(key)));
            }
        }
        job.reportTemplate = Job::Template{readFileName(node["file"]), node["name"].text()};
    }
    job.options = readOptions(root["options"]);
    job.data = readData(root["data"], folder);
    job.steps = readSteps(root["report"], job);
    if (const JsonNode outputs = root["output"]; outputs.expectArray()) {
        for (qsizetype i = 0; i < outputs.size(); ++i) {
            if (const auto output = readOutput(outputs[i], folder, kindOtherwise)) {
                job.outputs.push_back(*output);
            }
        }
    }
    return job;
}

} // namespace kareport
