#include "LandXmlFile.h"

namespace landxml
{

using namespace kareport;

QByteArray fileOf(const QByteArray &elements, const QByteArray &version)
{
    return "<?xml version=\"1.0\"?>\n<LandXML xmlns=\"http://www.landxml.org/schema/LandXML-" + version +
           "\" version=\"" + version +
           "\">\n<Units><Metric linearUnit=\"meter\" areaUnit=\"squareMeter\" angularUnit=\"decimal degrees\" "
           "directionUnit=\"decimal degrees\"/></Units>\n" +
           elements + "\n</LandXML>\n";
}

LandXmlFile::LandXmlFile(const QByteArray &content, LandXmlQuery query, const QStringList &variables,
                         ReadProgress progress)
    : variables_(variables)
{
    folder_.put("road.xml", content);
    auto opened = FileBytes::open(folder_.path("road.xml"));
    QHash<QString, int> types;
    for (const LandXmlVariable &variable : LandXmlList::variables(query)) {
        types.insert(variable.name, variable.type);
        if (variables.isEmpty()) {
            variables_.append(variable.name);
        }
    }
    const auto find = [&](const QString &name) -> std::optional<ValueParser> {
        const qsizetype index = variables_.indexOf(name);
        return index < 0 ? std::nullopt
                         : std::optional(
                               ValueParser(types.value(name), static_cast<unsigned>(index + 1), LandXmlList::units()));
    };
    list = std::make_unique<LandXmlList>(std::get<std::shared_ptr<const FileBytes>>(opened), std::move(query), find,
                                         std::move(progress));
}

namespace
{

QString textOf(const UDictEntry *entry, int decimals)
{
    switch (entry == nullptr ? 0 : entry->GetKind()) {
    case 0: return QStringLiteral("-");
    case 1: return *static_cast<const bool *>(entry->GetData()) ? QStringLiteral("yes") : QStringLiteral("no");
    case 4: return QString::number(*static_cast<const qint32 *>(entry->GetData()));
    case 8: return QString::number(*static_cast<const double *>(entry->GetData()), 'f', decimals);
    case 16: return *static_cast<const QString *>(entry->GetData());
    case 32: return static_cast<const UPointNumber *>(entry->GetData())->Convert();
    default: return QStringLiteral("?");
    }
}

} // namespace

QString LandXmlFile::row(std::size_t index, int decimals)
{
    const UDataObject *object = list->GetAt(index);
    if (object == nullptr) {
        return QStringLiteral("null");
    }
    QStringList values;
    for (qsizetype i = 0; i < variables_.size(); ++i) {
        values.append(textOf(object->Find(static_cast<unsigned>(i + 1)), decimals));
    }
    return values.join(u'|');
}

QStringList LandXmlFile::rows(int decimals)
{
    QStringList rows;
    for (std::size_t i = 0; list->GetAt(i) != nullptr; ++i) {
        rows.append(row(i, decimals));
    }
    return rows;
}

unsigned LandXmlFile::id(const char *variable) const
{
    return static_cast<unsigned>(variables_.indexOf(QString::fromLatin1(variable)) + 1);
}

double LandXmlFile::number(std::size_t index, const char *variable)
{
    const UDataObject *object = list->GetAt(index);
    const UDictEntry *entry = object != nullptr ? object->Find(id(variable)) : nullptr;
    return entry != nullptr && entry->GetKind() == 8 ? *static_cast<const double *>(entry->GetData()) : notGiven;
}

QStringList LandXmlFile::notes() const
{
    QStringList notes;
    for (const InputError &note : list->notes()) {
        notes.append(
            (note.place ? QStringLiteral("%1:%2: ").arg(note.place->line).arg(note.place->column) : QString()) +
            note.text);
    }
    return notes;
}

LandXmlQuery queryOf(LandXmlListKind kind, const char *name)
{
    LandXmlQuery query;
    query.kind = kind;
    query.name = QString::fromUtf8(name);
    return query;
}

} // namespace landxml
