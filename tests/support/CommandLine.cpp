#include "CommandLine.h"

ProgramRun endOf(QProcess &process)
{
    ProgramRun run;
    const bool ended = process.waitForFinished(60'000);
    const bool isWhole = ended && process.exitStatus() == QProcess::NormalExit;
    run.status = isWhole ? process.exitCode() : -1;
    run.signal = ended && !isWhole ? process.exitCode() : 0;
    run.out = process.readAllStandardOutput();
    run.err = process.readAllStandardError();
    return run;
}

ProgramRun runProgram(const QString &folder, const QStringList &arguments,
                      const std::initializer_list<std::pair<const char *, const char *>> &variables)
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.remove(QStringLiteral("SOURCE_DATE_EPOCH"));
    environment.remove(QStringLiteral("QT_QPA_PLATFORM"));
    for (const auto &[name, value] : variables) {
        environment.insert(QString::fromUtf8(name), QString::fromUtf8(value));
    }
    process.setProcessEnvironment(environment);
    process.setWorkingDirectory(folder);
    process.start(QStringLiteral(KAREPORT_PROGRAM), arguments, QIODevice::ReadOnly);
    return endOf(process);
}

ProgramRun runWithInput(const QString &folder, const QStringList &arguments, const QByteArray &input)
{
    QProcess process;
    process.setWorkingDirectory(folder);
    process.start(QStringLiteral(KAREPORT_PROGRAM), arguments);
    process.write(input);
    process.closeWriteChannel();
    return endOf(process);
}

QStringList words(const char *line)
{
    return QString::fromUtf8(line).split(u' ', Qt::SkipEmptyParts);
}

QByteArray controlTemplates()
{
    return "<!-- control points -->\n"
           "<ReportTemplate>\n"
           "<Name>CONTROL</Name><Title>Control points</Title>\n"
           "<Tables><Table><Name>Points</Name><Use>Survey</Use><Sort></Sort><OutputList>\n"
           "<Field><VariableName>Number</VariableName><Label>Pt</Label><Format>5</Format><Align>LEFT</Align></Field>\n"
           "<Field><VariableName>Northing</VariableName><Label>North</Label><Format>9.3</Format><Align>RIGHT</Align>"
           "</Field>\n"
           "</OutputList></Table></Tables>\n"
           "<Dictionaries><Dictionary><DictionaryName>Survey</DictionaryName><VariableList>\n"
           "<Variable><ID>1</ID><VariableName>Number</VariableName><Type>NUMBER</Type></Variable>\n"
           "<Variable><ID>2</ID><VariableName>Northing</VariableName><Type>COORDINATE</Type></Variable>\n"
           "</VariableList></Dictionary></Dictionaries>\n"
           "<Blocks><Block><Name>Point</Name><Use>Survey</Use><OutputList>\n"
           "<Field><VariableName>Number</VariableName><Label>Pt</Label><Format>0</Format><Align>LEFT</Align></Field>\n"
           "</OutputList></Block></Blocks>\n"
           "<Options><Separator>124</Separator></Options>\n"
           "</ReportTemplate>\n"
           "<ReportTemplate><Name>SITE</Name><Title>Site \xC3\xA4</Title><Options><Separator>32</Separator></Options>"
           "</ReportTemplate>\n";
}

CommandLineFolder::CommandLineFolder()
{
    put("t.xml", controlTemplates());
    put("points.csv", "Number,Northing\n1,12.5\n2A,0\n");
    put("job.json", "{\"header\": false, \"page\": {\"linesPerPage\": 72, \"charsPerRow\": 80},\n"
                    " \"template\": {\"file\": \"t.xml\", \"name\": \"CONTROL\"},\n"
                    " \"data\": {\"p\": {\"csv\": \"points.csv\"}},\n"
                    " \"report\": [{\"line\": \"\xC3\xA4\"}, {\"table\": \"Points\", \"data\": \"p\"}]}\n");
}

QByteArray jobText()
{
    return "\xC3\xA4\nPt   |    North\n\n1    |   12.500\n2A   |    0.000\n";
}

QByteArray jobReport()
{
    return "\xEF\xBB\xBF" + jobText().replace("\n", "\r\r\n");
}
