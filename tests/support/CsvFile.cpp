#include "CsvFile.h"

namespace csv
{

std::optional<kareport::ValueParser> findVariable(const QString &name)
{
    struct Variable
    {
        QStringView name;
        int type;
        unsigned id;
    };
    constexpr Variable variables[] = {{u"Number", VARIABLE_NUMBER, numberId},
                                      {u"Northing", VARIABLE_COORDINATE, northingId},
                                      {u"Note", VARIABLE_TEXT, noteId},
                                      {u"Count", VARIABLE_INTEGER, countId}};
    for (const Variable &variable : variables) {
        if (variable.name == name) {
            return kareport::ValueParser(variable.type, variable.id, kareport::DataUnits());
        }
    }
    return std::nullopt;
}

CsvFile::CsvFile(const QByteArray &content, kareport::ReadProgress progress)
{
    folder_.put("points.csv", content);
    auto opened = kareport::FileBytes::open(folder_.path("points.csv"));
    list = std::make_unique<kareport::CsvObjectList>(std::get<std::shared_ptr<const kareport::FileBytes>>(opened), ',',
                                                     findVariable, std::move(progress));
}

QString textOf(const UDataObject *object)
{
    if (object == nullptr) {
        return QStringLiteral("null");
    }
    QStringList values;
    for (const unsigned id : {numberId, northingId, noteId, countId}) {
        const UDictEntry *entry = object->Find(id);
        switch (entry == nullptr ? 0 : entry->GetKind()) {
        case 0: values.append(QStringLiteral("-")); break;
        case 4: values.append(QString::number(*static_cast<const qint32 *>(entry->GetData()))); break;
        case 8: values.append(QString::number(*static_cast<const double *>(entry->GetData()))); break;
        case 16: values.append(*static_cast<const QString *>(entry->GetData())); break;
        case 32: values.append(static_cast<const UPointNumber *>(entry->GetData())->Convert()); break;
        default: values.append(QStringLiteral("?")); break;
        }
    }
    return values.join(u'|');
}

} // namespace csv
