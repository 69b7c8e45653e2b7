#include "SheetNames.h"

#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qsizetype mostCharacters = 31;

/// The beginning of a text of a length at most, which does not end within a pair of surrogates.
QString cut(const QString &text, qsizetype length)
{
    QString beginning = text.left(length);
    if (!beginning.isEmpty() && beginning.back().isHighSurrogate()) {
        beginning.chop(1);
    }
    return beginning;
}

QString validName(QString name)
{
    for (QChar &character : name) {
        const bool isControl = character < u' ' || character == u'\x7F';
        if (isControl || QStringView(u":\\/?*[]").contains(character)) {
            character = u'_';
        }
    }
    name = cut(name, mostCharacters);
    if (name.startsWith(u'\'')) {
        name.front() = u'_';
    }
    if (name.endsWith(u'\'')) {
        name.back() = u'_';
    }
    if (name.trimmed().isEmpty()) {
        name = QStringLiteral("_");
    }
    return equalFolded(name, u"History") ? name + u'_' : name;
}

} // namespace

QString SheetNames::add(const QString &wanted)
{
    const QString valid = validName(wanted);
    QString name = valid;
    for (int number = 2; taken_.contains(foldedKey(name)); ++number) {
        const QString suffix = QStringLiteral(" (%1)").arg(number);
        name = cut(valid, mostCharacters - suffix.size()) + suffix;
    }
    taken_.append(foldedKey(name));
    return name;
}

} // namespace kareport
