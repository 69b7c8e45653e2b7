#include "UXmlReportTpl.h"

#include <QFile>
#include <QTemporaryFile>

#include "ProcessorTime.h"

#include <benchmark/benchmark.h>
#include <libxml/parser.h>
#include <pugixml.hpp>

#include <memory>

namespace
{

/// Templates of about 5 KB each.
QByteArray makeTemplates(qint64 count)
{
    QByteArray text;
    for (qint64 i = 0; i < count; ++i) {
        text += "<ReportTemplate>\n\t<Name>T" + QByteArray::number(i) +
                "</Name><Title>Template</Title>\n\t<Tables><Table>"
                "<Name>Points</Name><Use>Dic</Use><OutputList>\n";
        for (int field = 0; field < 24; ++field) {
            text += "\t\t<Field><VariableName>Variable" + QByteArray::number(field) +
                    "</VariableName><Label>Label</Label><Format>12.3</Format><Align>RIGHT</Align></Field>\n";
        }
        text +=
            "\t</OutputList></Table></Tables>\n\t<Dictionaries><Dictionary><DictionaryName>Dic</DictionaryName><VariableList>\n";
        for (int variable = 0; variable < 24; ++variable) {
            const QByteArray number = QByteArray::number(variable);
            text += "\t\t<Variable><ID>" + number + "</ID><VariableName>Variable" + number +
                    "</VariableName><Type>COORDINATE</Type></Variable>\n";
        }
        text +=
            "\t</VariableList></Dictionary></Dictionaries>\n\t<Options><Separator>32</Separator></Options>\n</ReportTemplate>\n";
    }
    return text;
}

/// A file of templates in one root, as an XML parser needs it.
class TemplatesFile
{
public:
    explicit TemplatesFile(qint64 count) : text_("<Templates>" + makeTemplates(count) + "</Templates>\n")
    {
        file_.open();
        file_.write(text_);
        file_.flush();
    }
    QString name() const { return file_.fileName(); }
    qint64 size() const { return text_.size(); }

private:
    QByteArray text_;
    QTemporaryFile file_;
};

/// Reads a file of 200 templates, about 1 MB, and another of ten times as many; compare the bytes a second.
template <typename Read>
void readTemplates(benchmark::State &state, Read read)
{
    const TemplatesFile file(state.range(0));
    const ProcessorTime time;
    for (auto _ : state) {
        if (!read(file.name())) {
            state.SkipWithError("the file was not read");
        }
    }
    state.SetBytesProcessed(state.iterations() * file.size());
    time.report(state, static_cast<double>(file.size()));
}

/// The last template, after all others.
void loadTemplate(benchmark::State &state)
{
    readTemplates(state, [name = QStringLiteral("t%1").arg(state.range(0) - 1)](const QString &path) {
        UXmlReportTpl reportTemplate;
        return reportTemplate.LoadTemplate(path, name);
    });
}
BENCHMARK(loadTemplate)->Arg(200)->Arg(2000)->Unit(benchmark::kMillisecond);

/// The same file read by parsers of XML, which keep all of it and compare no names.
void parsePugixml(benchmark::State &state)
{
    readTemplates(state, [](const QString &path) {
        pugi::xml_document document;
        return bool(document.load_file(QFile::encodeName(path).constData()));
    });
}
BENCHMARK(parsePugixml)->Arg(200)->Arg(2000)->Unit(benchmark::kMillisecond);

void parseLibxml2(benchmark::State &state)
{
    readTemplates(state, [](const QString &path) {
        const std::unique_ptr<xmlDoc, decltype(&xmlFreeDoc)> document(
            xmlReadFile(QFile::encodeName(path).constData(), nullptr, 0), &xmlFreeDoc);
        return document != nullptr;
    });
}
BENCHMARK(parseLibxml2)->Arg(200)->Arg(2000)->Unit(benchmark::kMillisecond);

/// One table whose fields end with the short closing tag; compare the rates at N and 10 N.
void loadManyFields(benchmark::State &state)
{
    QByteArray text = "<ReportTemplate><Name>A</Name><Tables><Table><Name>T</Name><Use>D</Use><OutputList>";
    for (qint64 i = 0; i < state.range(0); ++i) {
        text += "<Field><Label>L" + QByteArray::number(i) + "</Label></>     ";
    }
    text += "</OutputList></Table></Tables></ReportTemplate>";
    QTemporaryFile file;
    file.open();
    file.write(text);
    file.flush();
    const ProcessorTime time;
    for (auto _ : state) {
        UXmlReportTpl reportTemplate;
        reportTemplate.LoadTemplate(file.fileName(), QStringLiteral("A"));
        const sXmlReportTable *table = reportTemplate.GetTable(QStringLiteral("T"));
        if (table == nullptr || qint64(table->Fields.size()) != state.range(0)) {
            state.SkipWithError("fields were lost");
        }
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    time.report(state, static_cast<double>(state.range(0)));
}
BENCHMARK(loadManyFields)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);

/// Opening tags without closing ones; compare the bytes a second at N and 10 N.
void scanUnclosedTags(benchmark::State &state)
{
    const QByteArray text = "<ReportTemplate><Name>A</Name><Tables><Table><Name>T</Name>" +
                            QByteArray("<OutputList><Field><Label>").repeated(state.range(0)) + "</ReportTemplate>";
    QTemporaryFile file;
    file.open();
    file.write(text);
    file.flush();
    const ProcessorTime time;
    for (auto _ : state) {
        UXmlReportTpl reportTemplate;
        benchmark::DoNotOptimize(reportTemplate.LoadTemplate(file.fileName(), QStringLiteral("A")));
    }
    state.SetBytesProcessed(state.iterations() * text.size());
    time.report(state, static_cast<double>(text.size()));
}
BENCHMARK(scanUnclosedTags)->Arg(10'000)->Arg(100'000)->Unit(benchmark::kMillisecond);

} // namespace
