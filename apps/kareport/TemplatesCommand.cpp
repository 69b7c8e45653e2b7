#include "Commands.h"
#include "VariableKeywords.h"

#include "TemplateNames.h"
#include "TemplateSource.h"
#include "UXmlReportTpl.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace kareport
{

namespace
{

QJsonArray fieldsToJson(const sXmlReportFields &fields)
{
    QJsonArray list;
    for (const sXmlReportField &field : fields) {
        list.append(QJsonObject{{QStringLiteral("variable"), field.VariableName},
                                {QStringLiteral("label"), field.Label},
                                {QStringLiteral("width"), field.Width},
                                {QStringLiteral("decimals"), field.Decimals},
                                {QStringLiteral("align"), field.Align},
                                {QStringLiteral("id"), field.ID},
                                {QStringLiteral("type"), keywordOf(field.Type).toString()}});
    }
    return list;
}

template <typename Record>
QJsonObject outputToJson(const Record &record)
{
    return {{QStringLiteral("name"), record.Name},
            {QStringLiteral("dictionary"), record.Use},
            {QStringLiteral("fields"), fieldsToJson(record.Fields)}};
}

QJsonObject templateToJson(const UXmlReportTpl &tpl)
{
    QStringList names;
    QJsonArray tables;
    tpl.GetAllTables(names);
    for (const QString &name : names) {
        if (const sXmlReportTable *table = tpl.GetTable(name)) {
            QJsonObject object = outputToJson(*table);
            QJsonArray sort;
            if (const sXmlSortTableReport *list = tpl.GetSortList(name)) {
                for (const sXmlSortVariable &entry : list->Entries) {
                    sort.append(entry.VariableName);
                }
            }
            object.insert(QStringLiteral("sort"), sort);
            tables.append(object);
        }
    }
    QJsonArray blocks;
    tpl.GetAllBlocks(names);
    for (const QString &name : names) {
        if (const sXmlReportBlock *block = tpl.GetBlock(name)) {
            blocks.append(outputToJson(*block));
        }
    }
    QJsonArray dictionaries;
    tpl.GetAllDictionaries(names);
    for (const QString &name : names) {
        if (const sXmlReportDictionary *dictionary = tpl.GetDictionary(name)) {
            QJsonArray variables;
            for (const sXmlReportVariable &variable : dictionary->Variables) {
                variables.append(QJsonObject{{QStringLiteral("name"), variable.VariableName},
                                             {QStringLiteral("id"), variable.ID},
                                             {QStringLiteral("type"), keywordOf(variable.Type).toString()}});
            }
            dictionaries.append(QJsonObject{{QStringLiteral("name"), name}, {QStringLiteral("variables"), variables}});
        }
    }
    return {{QStringLiteral("title"), tpl.GetTemplateTitle()},
            {QStringLiteral("tables"), tables},
            {QStringLiteral("blocks"), blocks},
            {QStringLiteral("dictionaries"), dictionaries},
            {QStringLiteral("separator"), int(static_cast<unsigned char>(tpl.GetSeparatorXmlOption()))},
            {QStringLiteral("pageBreaks"), tpl.GetPageBreakXmlOption()}};
}

/// The same for a person: a line for each thing, what belongs to it indented below.
void printOutputs(const QString &what, const QJsonArray &outputs)
{
    for (const auto &output : outputs) {
        printLine(QStringLiteral("%1 %2 (dictionary %3)")
                      .arg(what, output[u"name"].toString(), output[u"dictionary"].toString()));
        for (const auto &field : output[u"fields"].toArray()) {
            printLine(QStringLiteral("    %1 %2 %3.%4 %5  \"%6\"")
                          .arg(field[u"variable"].toString().leftJustified(20),
                               field[u"type"].toString().leftJustified(10),
                               QString::number(field[u"width"].toInt()).rightJustified(4),
                               QString::number(field[u"decimals"].toInt()), field[u"align"].toString(),
                               field[u"label"].toString()));
        }
        QStringList keys;
        for (const auto &key : output[u"sort"].toArray()) {
            keys.append(key.toString());
        }
        if (!keys.isEmpty()) {
            printLine(QStringLiteral("    sorted by %1").arg(keys.join(QStringLiteral(", "))));
        }
    }
}

void printTemplate(const QJsonObject &description)
{
    printLine(QStringLiteral("title %1").arg(description[u"title"].toString()));
    printOutputs(QStringLiteral("table"), description[u"tables"].toArray());
    printOutputs(QStringLiteral("block"), description[u"blocks"].toArray());
    for (const auto &dictionary : description[u"dictionaries"].toArray()) {
        printLine(QStringLiteral("dictionary %1").arg(dictionary[u"name"].toString()));
        for (const auto &variable : dictionary[u"variables"].toArray()) {
            printLine(QStringLiteral("    %1 %2 %3")
                          .arg(QString::number(variable[u"id"].toInt()).rightJustified(6),
                               variable[u"name"].toString().leftJustified(20), variable[u"type"].toString()));
        }
    }
    printLine(QStringLiteral("separator %1 (character code)").arg(description[u"separator"].toInt()));
    printLine(QStringLiteral("page breaks %1")
                  .arg(description[u"pageBreaks"].toBool() ? QStringLiteral("yes") : QStringLiteral("no")));
}

void printJson(const QJsonDocument &document)
{
    const QString text = QString::fromUtf8(document.toJson(QJsonDocument::Indented)).trimmed();
    for (const QString &line : text.split(u'\n')) {
        printLine(line);
    }
}

} // namespace

ExitStatus TemplatesCommand::run() const
{
    const auto source = readTemplateSource(file);
    if (const InputError *error = errorOf(source)) {
        printError(error->message());
        return exitInput;
    }
    const auto &templateFile = std::get<TemplateFile>(source);
    if (!name.isEmpty()) {
        UXmlReportTpl tpl;
        if (!tpl.LoadTemplate(file, name)) {
            printError(whyNotLoaded(file, templateFile, name).message());
            return exitInput;
        }
        const QJsonObject description = templateToJson(tpl);
        if (json) {
            printJson(QJsonDocument(description));
        } else {
            printTemplate(description);
        }
        return exitDone;
    }
    QJsonArray list;
    for (const sXmlReportTemplateInfo &info : templateInfos(templateFile)) {
        list.append(QJsonObject{{QStringLiteral("name"), info.Name}, {QStringLiteral("title"), info.Title}});
        if (!json) {
            printLine(info.Name + u'\t' + info.Title);
        }
    }
    if (json) {
        printJson(QJsonDocument(list));
    }
    if (list.isEmpty()) {
        printError(whyNotLoaded(file, templateFile, QString()).message());
        return exitInput;
    }
    return exitDone;
}

} // namespace kareport
