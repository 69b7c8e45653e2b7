#include "JobStepsReader.h"

#include "NearestName.h"
#include "Placeholders.h"
#include "TableShapeReader.h"
#include "Xlate.h"

#include <limits>

namespace kareport
{

namespace
{

constexpr int mostLines = 1'000'000; ///< blank lines of a step

int readLines(const JsonNode &node, int fallback)
{
    return node.whole(fallback, -mostLines, mostLines);
}

/// A line takes any style: one that rich text does not know is only in the plain text.
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
        QStringList keys;
        for (const char *key : {"table", "data", "before", "after", "headingAfter"}) {
            keys.append(QLatin1StringView(key));
        }
        node.allowOnly(keys + tableShapeKeys());
        return step("table", Job::Table{node["table"].text(), node["data"].text(), before, readLines(node["after"], 0),
                                        readLines(node["headingAfter"], -1), readTableShape(node)});
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

QStringList namesOfDataSets(const Job &job)
{
    QStringList names = job.data.keys();
    names.sort();
    return names;
}

/// The data set that a step shows, and the template that it is shown through, must be there, and placeholders be known.
void checkStep(const JsonNode &node, const Job &job)
{
    for (const char *key : {"heading", "line"}) {
        const JsonNode text = node[QString::fromLatin1(key)];
        if (job.options.placeholders && text.isText()) {
            if (const auto wrong = Placeholders::wrongIn(text.text())) {
                text.fail(*wrong);
            }
        }
    }
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
            data.fail(Xlate("there is no data set named \"%1\" in the job: %2")
                          .arg(data.text(), oneOfExpected(data.text(), namesOfDataSets(job))));
        }
    }
}

} // namespace

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

} // namespace kareport
