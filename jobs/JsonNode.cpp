#include "JsonNode.h"

#include "NearestName.h"
#include "Xlate.h"

#include <QJsonArray>
#include <QJsonObject>
#include <QStringList>

#include <algorithm>
#include <cmath>

namespace kareport
{

JsonNode JsonNode::operator[](const QString &key) const
{
    JsonPath path = path_;
    path.emplace_back(key);
    return {*source_, *error_, value_.toObject().value(key), std::move(path)};
}

JsonNode JsonNode::operator[](qsizetype index) const
{
    JsonPath path = path_;
    path.emplace_back(index);
    return {*source_, *error_, value_.toArray().at(index), std::move(path)};
}

qsizetype JsonNode::size() const
{
    return value_.toArray().size();
}

QStringList JsonNode::keys() const
{
    return value_.toObject().keys();
}

bool JsonNode::isText() const
{
    return value_.isString() || (exists() && source_->setText(path_));
}

QString JsonNode::text(const QString &fallback) const
{
    if (!exists()) {
        return fallback;
    }
    if (const auto given = source_->setText(path_)) {
        return value_.isString() ? value_.toString() : *given;
    }
    if (!value_.isString()) {
        fail(Xlate("a text was expected"));
        return fallback;
    }
    return value_.toString();
}

bool JsonNode::boolean(bool fallback) const
{
    if (exists() && !value_.isBool()) {
        fail(Xlate("true or false was expected"));
    }
    return value_.toBool(fallback);
}

int JsonNode::whole(int fallback, int least, int most) const
{
    if (!exists()) {
        return fallback;
    }
    const double number = value_.toDouble();
    if (!value_.isDouble() || number != std::floor(number) || number < least || number > most) {
        fail(Xlate("a whole number from %1 to %2 was expected").arg(least).arg(most));
        return fallback;
    }
    return static_cast<int>(number);
}

bool JsonNode::expectObject() const
{
    if (exists() && !value_.isObject()) {
        fail(Xlate("an object was expected"));
    }
    return value_.isObject();
}

bool JsonNode::expectArray() const
{
    if (exists() && !value_.isArray()) {
        fail(Xlate("a list was expected"));
    }
    return value_.isArray();
}

void JsonNode::allowOnly(std::initializer_list<const char *> allowed) const
{
    QStringList names;
    std::transform(allowed.begin(), allowed.end(), std::back_inserter(names),
                   [](const char *name) { return QString::fromLatin1(name); });
    allowOnly(names);
}

void JsonNode::allowOnly(const QStringList &allowed) const
{
    for (const QString &key : keys()) {
        if (allowed.contains(key)) {
            continue;
        }
        JsonPath path = path_;
        path.emplace_back(key);
        const QString question = didYouMean(key, allowed);
        const QString unknown = Xlate("unknown key \"%1\": %2 expected").arg(key, allowed.join(QStringLiteral(", ")));
        failAt(path, question.isEmpty() ? unknown : unknown + QStringLiteral("; ") + question, true);
    }
}

} // namespace kareport
