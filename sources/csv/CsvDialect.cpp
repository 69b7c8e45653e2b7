#include "CsvDialect.h"

namespace kareport
{

std::optional<QStringList> namesOfOrder(QStringView order)
{
    QStringList names;
    for (const QChar letter : order) {
        QString name;
        switch (letter.toUpper().unicode()) {
        case u'P': name = QStringLiteral("Number"); break;
        case u'N': name = QStringLiteral("Northing"); break;
        case u'E': name = QStringLiteral("Easting"); break;
        case u'Z': name = QStringLiteral("Elevation"); break;
        case u'D': name = QStringLiteral("Description"); break;
        case u'-': break;
        default: return std::nullopt;
        }
        if (!name.isEmpty() && names.contains(name)) {
            return std::nullopt;
        }
        names.append(name);
    }
    return names.isEmpty() ? std::nullopt : std::optional(names);
}

} // namespace kareport
