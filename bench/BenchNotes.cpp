#include "JobReader.h"
#include "JobRunner.h"
#include "Progress.h"
#include "UReportDoc.h"

#include "ProcessorTime.h"

#include <QFile>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

namespace
{

using kareport::errorOf;

bool put(const QTemporaryDir &folder, const char *name, const QByteArray &content)
{
    QFile file(folder.filePath(QString::fromLatin1(name)));
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

QByteArray element(const char *name, const QByteArray &content)
{
    return QByteArray("<") + name + '>' + content + "</" + name + '>';
}

QByteArray field(const QByteArray &variable)
{
    return element("Field", element("VariableName", variable) + element("Label", "x") + element("Format", "5"));
}

QByteArray variable(int id, const QByteArray &name, const char *type)
{
    return element("Variable",
                   element("ID", QByteArray::number(id)) + element("VariableName", name) + element("Type", type));
}

QByteArray templateOf(const QByteArray &fields, const QByteArray &variables)
{
    const QByteArray table =
        element("Table", element("Name", "Points") + element("Use", "D") + element("OutputList", fields));
    const QByteArray dictionary =
        element("Dictionary", element("DictionaryName", "D") + element("VariableList", variables));
    return element("ReportTemplate", element("Name", "T") + element("Title", "t") + element("Tables", table) +
                                         element("Dictionaries", dictionary));
}

QByteArray jobOf(const QByteArray &sets, const QByteArray &steps)
{
    return R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80}, "header": false,
               "template": {"file": "t.xml", "name": "T"}, "data": {)" +
           sets + R"(}, "report": [)" + steps + "]}";
}

/// Runs the job of a folder. @param least  the fewest notes that there must be
void runJob(benchmark::State &state, const QTemporaryDir &folder, std::size_t least)
{
    const ProcessorTime time;
    for (auto _ : state) {
        const auto source = kareport::JsonSource::read(folder.filePath(QStringLiteral("job.json")));
        const auto job = kareport::readJob(std::get<kareport::JsonSource>(source));
        if (errorOf(job) != nullptr) {
            state.SkipWithError("the job cannot be read");
            break;
        }
        UReportDoc report(kareport::surroundingsOf(std::get<kareport::Job>(job)));
        kareport::Progress progress(false);
        kareport::JobRunner runner(std::get<kareport::Job>(job), std::get<kareport::JsonSource>(source), progress);
        if (runner.run(report) || runner.notes().said().size() < least) {
            state.SkipWithError("notes are missing");
        }
    }
    time.report(state, static_cast<double>(state.range(0)));
}

/// A job whose template has many variables and fields that no column fills: two notes each.
void notesOnFields(benchmark::State &state)
{
    QByteArray fields;
    QByteArray variables = variable(1, "Number", "TEXT");
    QByteArray header = "Number";
    QByteArray steps = R"({"table": "Points", "data": "p"})";
    for (int i = 0; i < state.range(0); ++i) {
        const QByteArray number = QByteArray::number(i);
        fields += field("Field" + number) + field("Lost" + number);
        variables += variable(i + 2, "Field" + number, "LENGTH");
        header += ",Column" + number;
        steps += R"(, {"line": "x"})";
    }
    const QTemporaryDir folder;
    if (!put(folder, "t.xml", templateOf(fields, variables)) || !put(folder, "p.csv", header + '\n') ||
        !put(folder, "job.json", jobOf(R"("p": {"csv": "p.csv"})", steps)))
    {
        state.SkipWithError("the job could not be written");
        return;
    }
    runJob(state, folder, static_cast<std::size_t>(2 * state.range(0)));
}
BENCHMARK(notesOnFields)->Arg(400)->Arg(4000)->Unit(benchmark::kMillisecond);

/// A job of many steps, each of which has something to note.
void notesOnSteps(benchmark::State &state)
{
    QByteArray sets;
    QByteArray steps;
    for (int i = 0; i < state.range(0); ++i) {
        const QByteArray name = "\"p" + QByteArray::number(i) + '"';
        const QByteArray comma = i > 0 ? ", " : "";
        sets += comma + name + R"(: {"csv": "p.csv"})";
        steps += comma + R"({"table": "Points", "data": )" + name + '}';
    }
    const QTemporaryDir folder;
    const QByteArray all = templateOf(field("Number") + field("Northing"),
                                      variable(1, "Number", "TEXT") + variable(2, "Northing", "COORDINATE"));
    if (!put(folder, "t.xml", all) || !put(folder, "p.csv", "Number,Northing\n1,\n") ||
        !put(folder, "job.json", jobOf(sets, steps)))
    {
        state.SkipWithError("the job could not be written");
        return;
    }
    runJob(state, folder, static_cast<std::size_t>(state.range(0)));
}
BENCHMARK(notesOnSteps)->Arg(300)->Arg(3000)->Unit(benchmark::kMillisecond);

} // namespace
