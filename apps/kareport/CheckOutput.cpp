#include "CheckOutput.h"

#include "Printing.h"
#include "VariableKeywords.h"
#include "Xlate.h"

#include <QJsonArray>
#include <QStringList>

#include <algorithm>
#include <array>

namespace kareport
{

namespace
{

constexpr qsizetype longestShown = 40; ///< of a value

QString wordOf(const CheckRemark &remark)
{
    return remark.isError ? QStringLiteral("error") : QStringLiteral("warning");
}

/// The columns of the list of fields.
constexpr std::size_t fieldColumns = 7;
using FieldLine = std::array<QString, fieldColumns>;
constexpr std::array<bool, fieldColumns> isNumberColumn = {false, false, true, true, true, false, false};

QString fitOf(const FieldFit &field)
{
    QStringList parts;
    if (field.tooWide > 0) {
        parts.append(Xlate("%1 too wide").arg(field.tooWide));
    }
    if (field.isLabelWide) {
        parts.append(Xlate("label too wide"));
    }
    return parts.isEmpty() ? Xlate("fits") : parts.join(QStringLiteral(", "));
}

FieldLine lineOf(const FieldFit &field)
{
    if (field.row == 0) {
        return {field.variable, field.label, QString::number(field.width), QStringLiteral("-"), QStringLiteral("-"),
                fitOf(field),   QString()};
    }
    QString value = visibleText(field.widest.text.left(longestShown));
    value += field.widest.width > longestShown ? QStringLiteral("…") : QString();
    return {field.variable,
            field.label,
            QString::number(field.width),
            QString::number(field.widest.width),
            QString::number(field.row),
            fitOf(field),
            u'"' + value + u'"'};
}

/// The lines as columns, two blanks apart.
QStringList aligned(const std::vector<FieldLine> &lines)
{
    std::array<qsizetype, fieldColumns> widths{};
    for (const FieldLine &line : lines) {
        for (std::size_t i = 0; i < fieldColumns; ++i) {
            widths[i] = std::max(widths[i], line[i].size());
        }
    }
    QStringList all;
    for (const FieldLine &line : lines) {
        QString text;
        for (std::size_t i = 0; i < fieldColumns; ++i) {
            text += QStringLiteral("  ");
            text += isNumberColumn[i] ? line[i].rightJustified(widths[i]) : line[i].leftJustified(widths[i]);
        }
        while (text.endsWith(u' ')) {
            text.chop(1);
        }
        all.append(text);
    }
    return all;
}

void printStep(const CheckedFile &checked, const StepFit &step)
{
    const QString sentence = step.isTable ? Xlate("%1: table \"%2\", %3 rows of the data \"%4\"")
                                          : Xlate("%1: block \"%2\", %3 row of the data \"%4\"");
    printLine(sentence.arg(checked.file, step.name, QString::number(step.rows), step.data));
    std::vector<FieldLine> lines;
    lines.push_back({Xlate("field"), Xlate("label@@Text over a column"), Xlate("width"), Xlate("widest"), Xlate("row"),
                     QString(), Xlate("value")});
    std::transform(step.fields.begin(), step.fields.end(), std::back_inserter(lines), lineOf);
    for (const QString &line : aligned(lines)) {
        printLine(line);
    }
}

QJsonObject remarkToJson(const CheckRemark &remark)
{
    QJsonObject object = {{QStringLiteral("severity"), wordOf(remark)},
                          {QStringLiteral("file"), remark.about.file},
                          {QStringLiteral("text"), remark.about.text}};
    if (remark.about.place) {
        object.insert(QStringLiteral("line"), remark.about.place->line);
        object.insert(QStringLiteral("column"), remark.about.place->column);
    }
    return object;
}

QJsonObject fieldToJson(const FieldFit &field)
{
    QJsonObject object = {{QStringLiteral("variable"), field.variable},
                          {QStringLiteral("label"), field.label},
                          {QStringLiteral("type"), keywordOf(field.type).toString()},
                          {QStringLiteral("width"), field.width},
                          {QStringLiteral("labelFits"), !field.isLabelWide},
                          {QStringLiteral("fits"), field.fits()},
                          {QStringLiteral("tooWide"), static_cast<qint64>(field.tooWide)}};
    if (field.row > 0) {
        object.insert(QStringLiteral("widest"), QJsonObject{{QStringLiteral("width"), field.widest.width},
                                                            {QStringLiteral("text"), field.widest.text},
                                                            {QStringLiteral("row"), static_cast<qint64>(field.row)},
                                                            {QStringLiteral("reportLine"), field.line}});
    }
    return object;
}

QJsonObject stepToJson(const StepFit &step)
{
    QJsonArray fields;
    for (const FieldFit &field : step.fields) {
        fields.append(fieldToJson(field));
    }
    QJsonObject object = {{step.isTable ? QStringLiteral("table") : QStringLiteral("block"), step.name},
                          {QStringLiteral("data"), step.data},
                          {QStringLiteral("rows"), static_cast<qint64>(step.rows)},
                          {QStringLiteral("fields"), fields}};
    if (step.place.place) {
        object.insert(QStringLiteral("line"), step.place.place->line);
        object.insert(QStringLiteral("column"), step.place.place->column);
    }
    return object;
}

} // namespace

void printChecked(const CheckedFile &checked, bool quiet)
{
    for (const CheckRemark &remark : checked.remarks) {
        if (remark.isError || !quiet) {
            printLine(remark.about.messageAs(wordOf(remark)));
        }
    }
    for (const StepFit &step : checked.steps) {
        if (!quiet) {
            printStep(checked, step);
        }
    }
}

QJsonObject checkedToJson(const CheckedFile &checked)
{
    QJsonArray remarks;
    for (const CheckRemark &remark : checked.remarks) {
        remarks.append(remarkToJson(remark));
    }
    QJsonObject object = {{QStringLiteral("file"), checked.file},
                          {QStringLiteral("kind"), checked.isJob ? QStringLiteral("job") : QStringLiteral("template")},
                          {QStringLiteral("remarks"), remarks}};
    if (checked.isJob) {
        QJsonArray steps;
        for (const StepFit &step : checked.steps) {
            steps.append(stepToJson(step));
        }
        object.insert(QStringLiteral("steps"), steps);
    }
    return object;
}

} // namespace kareport
