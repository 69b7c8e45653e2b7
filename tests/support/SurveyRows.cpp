#include "SurveyRows.h"

#include "TextFolding.h"

#include <numbers>

namespace survey
{

namespace
{

struct Variable
{
    const char *name;
    int type;
    unsigned id;
};

constexpr Variable all[] = {{"Number", VARIABLE_NUMBER, numberId},
                            {"Northing", VARIABLE_COORDINATE, northingId},
                            {"Easting", VARIABLE_COORDINATE, eastingId},
                            {"Elevation", VARIABLE_ELEVATION, elevationId},
                            {"Description", VARIABLE_TEXT, descriptionId},
                            {"Station", VARIABLE_STATION, stationId},
                            {"Offset", VARIABLE_OFFSET, offsetId},
                            {"Bearing", VARIABLE_BEARING, bearingId},
                            {"Angle", VARIABLE_ANGLE, angleId},
                            {"Count", VARIABLE_INTEGER, countId},
                            {"Flag", VARIABLE_FLAG, flagId}};

QString valueText(const UDictEntry &entry, bool isAngle)
{
    switch (entry.GetKind()) {
    case 1: return *static_cast<const bool *>(entry.GetData()) ? QStringLiteral("yes") : QStringLiteral("no");
    case 4: return QString::number(*static_cast<const qint32 *>(entry.GetData()));
    case 8: {
        const double value = *static_cast<const double *>(entry.GetData());
        return isAngle ? QString::number(value * 180 / std::numbers::pi, 'g', 12) : QString::number(value, 'g', 15);
    }
    case 16: return *static_cast<const QString *>(entry.GetData());
    case 32: return static_cast<const UPointNumber *>(entry.GetData())->Convert();
    default: return QStringLiteral("?");
    }
}

} // namespace

kareport::Variables variables(const kareport::DataUnits &units)
{
    kareport::Variables result;
    for (const Variable &variable : all) {
        result.names.append(QString::fromUtf8(variable.name));
    }
    result.find = [units](const QString &name) -> std::optional<kareport::ValueParser> {
        for (const Variable &variable : all) {
            if (kareport::equalFolded(name, QString::fromUtf8(variable.name))) {
                return kareport::ValueParser(variable.type, variable.id, units);
            }
        }
        return std::nullopt;
    };
    return result;
}

QString textOf(const UDataObject *object)
{
    if (object == nullptr) {
        return QStringLiteral("null");
    }
    QStringList values;
    for (const Variable &variable : all) {
        if (const UDictEntry *entry = object->Find(variable.id)) {
            values.append(QString::fromUtf8(variable.name).toLower() + u'=' +
                          valueText(*entry, variable.id == bearingId || variable.id == angleId));
        }
    }
    return values.join(u' ');
}

QStringList rowsOf(kareport::RowList &list)
{
    QStringList rows;
    for (std::size_t i = 0;; ++i) {
        const UDataObject *object = list.GetAt(i);
        if (object == nullptr) {
            break;
        }
        rows.append(textOf(object));
    }
    if (const auto error = list.error()) {
        rows.append(QStringLiteral("error ") + (error->place ? placeText(error) + u' ' : QString()) + error->text);
    }
    return rows;
}

QStringList rowsOf(const QByteArray &text, const kareport::CsvDialect &dialect)
{
    const JobFolder folder;
    folder.put("points.txt", text);
    const auto file = kareport::FileBytes::open(folder.path("points.txt"));
    kareport::CsvObjectList list(std::get<std::shared_ptr<const kareport::FileBytes>>(file), dialect, variables(), {});
    return rowsOf(list);
}

} // namespace survey
