#include "DataOptions.h"

#include "Xlate.h"

#include <QJsonArray>

#include <array>

namespace kareport
{

namespace
{

/// An option whose text is the value of a key.
struct TextOption
{
    const char *key; ///< also the option's name
    std::optional<QString> DataOptions::*value;
};
constexpr std::array<TextOption, 6> textOptions = {{{"delimiter", &DataOptions::delimiter},
                                                    {"order", &DataOptions::order},
                                                    {"decimal", &DataOptions::decimal},
                                                    {"thousands", &DataOptions::thousands},
                                                    {"encoding", &DataOptions::encoding},
                                                    {"comment", &DataOptions::comment}}};

/// The parts of texts with commas between them.
QStringList partsOf(const QStringList &texts)
{
    return texts.isEmpty() ? QStringList() : texts.join(u',').split(u',');
}

QJsonValue columnOf(const QString &text)
{
    bool isNumber = false;
    const int number = text.toInt(&isNumber);
    return isNumber ? QJsonValue(number) : QJsonValue(text);
}

QJsonValue columnsOf(const QStringList &parts)
{
    if (!parts.first().contains(u'=')) {
        return QJsonArray::fromStringList(parts);
    }
    QJsonObject columns;
    for (const QString &part : parts) {
        const qsizetype equals = part.indexOf(u'=');
        columns.insert(part.left(equals), columnOf(part.mid(equals + 1)));
    }
    return columns;
}

/// The first name of NAME=VALUE that was given before; empty for none.
QString repeatedName(const QStringList &parts)
{
    QStringList names;
    for (const QString &part : parts) {
        const QString name = part.left(part.indexOf(u'=')).toCaseFolded();
        if (names.contains(name)) {
            return part.left(part.indexOf(u'='));
        }
        names.append(name);
    }
    return {};
}

QJsonObject unitsOf(const QStringList &parts)
{
    QJsonObject units;
    for (const QString &part : parts) {
        const qsizetype equals = part.indexOf(u'=');
        units.insert(part.left(equals), part.mid(equals + 1));
    }
    return units;
}

} // namespace

std::optional<QString> DataOptions::usageError() const
{
    const QStringList unitParts = partsOf(units);
    for (const QString &part : unitParts) {
        if (part.indexOf(u'=') < 1) {
            return Xlate("--units \"%1\": QUANTITY=UNIT was expected, as in length=usft").arg(part);
        }
    }
    const QString twice = Xlate("%1: \"%2\" was given twice: each was expected once");
    if (const QString name = repeatedName(unitParts); !name.isEmpty()) {
        return twice.arg(QStringLiteral("--units"), name);
    }
    const QStringList parts = partsOf(columns);
    for (const QString &part : parts) {
        if (part.contains(u'=') != parts.first().contains(u'=') || part.startsWith(u'=')) {
            return Xlate("--columns \"%1\": the names of the columns in their order, or VARIABLE=COLUMN for each, were "
                         "expected")
                .arg(part);
        }
    }
    const bool areChosen = !parts.isEmpty() && parts.first().contains(u'=');
    if (const QString name = areChosen ? repeatedName(parts) : QString(); !name.isEmpty()) {
        return twice.arg(QStringLiteral("--columns"), name);
    }
    return std::nullopt;
}

QJsonObject DataOptions::toJson() const
{
    QJsonObject set;
    for (const TextOption &option : textOptions) {
        if (const auto &value = this->*option.value) {
            const bool isTab = option.value == &DataOptions::delimiter && *value == u"tab";
            set.insert(QLatin1StringView(option.key), isTab ? QStringLiteral("\t") : *value);
        }
    }
    if (!columns.isEmpty()) {
        set.insert(QStringLiteral("columns"), columnsOf(partsOf(columns)));
    }
    if (!units.isEmpty()) {
        set.insert(QStringLiteral("units"), unitsOf(partsOf(units)));
    }
    if (skip) {
        set.insert(QStringLiteral("skip"), *skip);
    }
    if (hasNoHeader) {
        set.insert(QStringLiteral("header"), false);
    }
    if (skipsBlankLines) {
        set.insert(QStringLiteral("skipBlankLines"), true);
    }
    return set;
}

void DataOptions::nameIn(JsonSource &source, const QString &set) const
{
    for (const TextOption &option : textOptions) {
        if (const auto &value = this->*option.value) {
            const QString key = QLatin1StringView(option.key);
            source.nameOption(set + u'.' + key, QStringLiteral("--%1 %2").arg(key, *value));
        }
    }
    if (!columns.isEmpty()) {
        source.nameOption(set + QStringLiteral(".columns"), QStringLiteral("--columns ") + columns.join(u','));
    }
    if (!units.isEmpty()) {
        source.nameOption(set + QStringLiteral(".units"), QStringLiteral("--units ") + units.join(u','));
    }
    if (skip) {
        source.nameOption(set + QStringLiteral(".skip"), QStringLiteral("--skip %1").arg(*skip));
    }
}

} // namespace kareport
