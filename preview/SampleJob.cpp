#include "SampleJob.h"

#include "TextFolding.h"
#include "UXmlReportTpl.h"
#include "VariableType.h"

#include <QHash>
#include <QJsonArray>
#include <QSet>

#include <algorithm>
#include <cmath>
#include <iterator>

namespace kareport
{

namespace
{

constexpr int sampleRows = 40;

/// The widths of the columns that show a variable, by its folded name.
QHash<QString, qint32> widthsOf(const sXmlReportFields &fields)
{
    QHash<QString, qint32> widths;
    for (const sXmlReportField &field : fields) {
        qint32 &width = widths[foldedKey(field.VariableName)];
        width = std::max(width, field.Width);
    }
    return widths;
}

/// A text that is as wide as its column in the first row and shorter in others.
QString sampleText(int row, qint32 width)
{
    static const char16_t *const words[] = {
        u"Manhole cover", u"Kerb", u"Edge of road, left", u"Pegged", u"North abutment of the bridge", u"Ø 300 outlet"};
    constexpr qint32 usualWidth = 12;
    constexpr qint32 widestSample = 60;
    const QString word = QString::fromUtf16(words[static_cast<std::size_t>(row) % std::size(words)]);
    const qint32 room = std::clamp(width > 0 ? width : usualWidth, 1, widestSample);
    return row == 0 ? (word + QStringLiteral(" with its frame, set to the level of the road surface")).left(room)
                    : word.left(room);
}

/// A number whose digits show how many there is room for.
double sampleNumber(int row, double largest, double step)
{
    const double value = std::fmod(row * step, largest);
    return row % 3 == 2 ? -value : value;
}

QJsonValue sampleValue(qint32 type, int row, qint32 width)
{
    switch (type) {
    case VARIABLE_INTEGER: return row % 4 == 3 ? -row : row * 37;
    case VARIABLE_NUMBER: return QString::number(row * 5 + 1) + (row % 4 == 1 ? QStringLiteral("A") : QString());
    case VARIABLE_TEXT:
    case VARIABLE_NAME: return sampleText(row, width);
    case VARIABLE_COORDINATE: return 5023.4567 + row * 12.3456;
    case VARIABLE_ELEVATION: return 97.6543 + sampleNumber(row, 40, 1.2345);
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE: return 3.1416 + row * 7.0625;
    case VARIABLE_STATION: return row * 27.125;
    case VARIABLE_OFFSET: return sampleNumber(row, 12, 1.8755);
    case VARIABLE_AREA: return 125.4321 + row * 98.7654;
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE: return sampleNumber(row, 90, 13.5792);
    case VARIABLE_BEARING: return std::fmod(row * 37.2581, 360);
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: return row % 3 == 1;
    case VARIABLE_THICKNESS: return row % 5 == 4 ? -1.0 : 5.0 + row * 10;
    default: return sampleNumber(row + 1, 10000, 123.4567);
    }
}

QJsonObject sampleRow(const sXmlReportDictionary &dictionary, const QHash<QString, qint32> &widths, int row)
{
    QJsonObject values;
    QSet<QString> names; // of variables of one name, the first one: there is one value for them
    for (const sXmlReportVariable &variable : dictionary.Variables) {
        const QString key = foldedKey(variable.VariableName);
        if (!variable.VariableName.isEmpty() && !names.contains(key)) {
            names.insert(key);
            values.insert(variable.VariableName, sampleValue(variable.Type, row, widths.value(key)));
        }
    }
    return values;
}

/// Adds a step and its data to a job.
class SampleSteps
{
public:
    explicit SampleSteps(const UXmlReportTpl &reportTemplate) : template_(reportTemplate) {}

    template <typename Record>
    void add(const QString &key, const Record &record, int rows)
    {
        const sXmlReportDictionary *dictionary = template_.GetDictionary(record.Use);
        QJsonArray values;
        for (int row = 0; dictionary != nullptr && row < rows; ++row) {
            values.append(sampleRow(*dictionary, widthsOf(record.Fields), row));
        }
        const QString set = QStringLiteral("rows%1").arg(steps.size() + 1);
        data.insert(set, QJsonObject{{QStringLiteral("values"), values}});
        steps.append(QJsonObject{{key, record.Name}, {QStringLiteral("data"), set}, {QStringLiteral("after"), 1}});
    }

    QJsonObject data;
    QJsonArray steps;

private:
    const UXmlReportTpl &template_;
};

} // namespace

QJsonObject sampleJob(const UXmlReportTpl &reportTemplate, const QString &file, const QString &name)
{
    SampleSteps samples(reportTemplate);
    QStringList names;
    reportTemplate.GetAllBlocks(names);
    for (const QString &block : names) {
        if (const sXmlReportBlock *record = reportTemplate.GetBlock(block)) {
            samples.add(QStringLiteral("block"), *record, 1);
        }
    }
    reportTemplate.GetAllTables(names);
    for (const QString &table : names) {
        if (const sXmlReportTable *record = reportTemplate.GetTable(table)) {
            samples.add(QStringLiteral("table"), *record, sampleRows);
        }
    }
    return {{QStringLiteral("template"), QJsonObject{{QStringLiteral("file"), file}, {QStringLiteral("name"), name}}},
            {QStringLiteral("data"), samples.data},
            {QStringLiteral("report"), samples.steps}};
}

} // namespace kareport
