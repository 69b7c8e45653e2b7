#include "JsonObjectList.h"

#include "EntryOrder.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <QJsonObject>
#include <QVariant>

#include <algorithm>
#include <compare>
#include <memory>
#include <utility>

namespace kareport
{

namespace
{

/// Stores a number of JSON. A whole one keeps all its digits, which a text shows.
bool storeNumber(const ValueParser &parser, const QJsonValue &value, UDataObject &object)
{
    const QVariant number = value.toVariant();
    return number.typeId() == QMetaType::LongLong ? parser.storeInteger(number.toLongLong(), object)
                                                  : parser.storeNumber(number.toDouble(), object);
}

} // namespace

void storeJsonObject(const JsonNode &node, const FindVariable &findVariable, UDataObject &object,
                     const SeeMember &seeMember, const SeeReplacing &seeReplacing)
{
    if (!node.expectObject()) {
        return;
    }
    QSet<QString> names;
    for (const QString &name : node.keys()) {
        const auto parser = findVariable(name);
        if (seeMember) {
            seeMember(node[name], name, parser ? &*parser : nullptr);
        }
        if (!parser) {
            continue;
        }
        const JsonNode member = node[name];
        if (names.contains(foldedKey(name))) {
            member.fail(Xlate("the variable \"%1\" occurs twice: each variable was expected once").arg(name));
            return;
        }
        names.insert(foldedKey(name));
        const QJsonValue &value = member.value();
        const UDictEntry *held = seeReplacing ? object.Find(parser->id()) : nullptr;
        const auto before = held != nullptr ? std::make_unique<UDictEntry>(*held) : nullptr;
        bool fits = false;
        switch (value.type()) {
        case QJsonValue::Null: fits = true; break;
        case QJsonValue::Bool: fits = parser->storeBoolean(value.toBool(), object); break;
        case QJsonValue::Double: fits = storeNumber(*parser, value, object); break;
        case QJsonValue::String: fits = parser->store(value.toString().toStdString(), object); break;
        default: break;
        }
        // What was set on the command line is a text where the variable wants one.
        if (const auto given = member.givenText(); given && !value.isString()) {
            fits = parser->store(given->toStdString(), object);
        }
        if (!fits) {
            member.fail(Xlate("the value of \"%1\" does not fit: %2 was expected").arg(name, parser->expected()));
            return;
        }
        if (before && std::is_neq(compareEntries(&*before, object.Find(parser->id())))) {
            seeReplacing(member, name, parser->id());
        }
    }
}

JsonObjectList::JsonObjectList(const JsonSource &source, const JsonPath &path, const FindVariable &findVariable,
                               bool firstOnly, ReadProgress progress)
    : source_(source), path_(path), progress_(std::move(progress))
{
    columns_.source = source.path();
    const SeeMember seeMember = [&](const JsonNode &member, const QString &name, const ValueParser *parser) {
        noteMember(source, member, name, parser);
    };
    const SeeReplacing seeReplacing = [&](const JsonNode &member, const QString &name, unsigned id) {
        noteReplaced(source, member, name, id);
    };
    JsonNode values(source, error_);
    for (const auto &step : path) {
        const auto *name = std::get_if<QString>(&step);
        values = name != nullptr ? values[*name] : values[std::get<qsizetype>(step)];
    }
    isObject_ = values.isObject();
    hasRow_ = isObject_ || values.size() > 0;
    if (isObject_) {
        storeJsonObject(values, findVariable, Add(), seeMember, seeReplacing);
        return;
    }
    const qsizetype count = firstOnly ? std::min<qsizetype>(values.size(), 1) : values.size();
    for (qsizetype i = 0; i < count && !error_; ++i) {
        storeJsonObject(values[i], findVariable, Add(), seeMember, seeReplacing);
    }
}

/// Says once for an identifier that one value of a row takes the place of another.
void JsonObjectList::noteReplaced(const JsonSource &source, const JsonNode &member, const QString &name, unsigned id)
{
    if (std::find(replacedIds_.begin(), replacedIds_.end(), id) != replacedIds_.end()) {
        return;
    }
    replacedIds_.push_back(id);
    const QString text = Xlate("a row has values of several variables that have one ID: that of \"%1\" is shown");
    differences_.push_back(source.errorAt(member.path(), text.arg(name), true));
}

/// Keeps the name of a member, once, where it is first met.
void JsonObjectList::noteMember(const JsonSource &source, const JsonNode &member, const QString &name,
                                const ValueParser *parser)
{
    if (names_.contains(name)) {
        return;
    }
    names_.insert(name);
    if (parser != nullptr) {
        columns_.variables.append(foldedKey(name));
    }
    // Finding a place reads the job from its beginning: it is done for as many as a person may read.
    constexpr qsizetype mostPlaces = 100;
    const bool needsPlace = parser == nullptr && names_.size() <= mostPlaces;
    const auto place = needsPlace ? source.errorAt(member.path(), QString(), true).place : std::nullopt;
    columns_.columns.push_back({name, place, parser != nullptr});
}

std::optional<SourceColumns> JsonObjectList::columns() const
{
    // Without a row the keys are not known.
    return hasRow_ ? std::optional(columns_) : std::nullopt;
}

void JsonObjectList::Sort(const std::vector<unsigned> &ids)
{
    isSorted_ = !ids.empty();
    UDataObjectList::Sort(ids);
}

ValuePlace JsonObjectList::placeOf(std::size_t index, const QString &variable)
{
    if (isSorted_) {
        return {source_.path()};
    }
    JsonPath row = path_;
    if (!isObject_) {
        row.emplace_back(static_cast<qsizetype>(index));
    }
    QJsonValue object = source_.root();
    for (const auto &step : row) {
        const auto *name = std::get_if<QString>(&step);
        object = name != nullptr ? object[*name] : object[std::get<qsizetype>(step)];
    }
    for (const QString &key : object.toObject().keys()) {
        if (equalFolded(key, variable)) {
            row.emplace_back(key);
            break;
        }
    }
    const InputError found = source_.errorAt(row, QString());
    return {found.file, found.place};
}

UDataObject *JsonObjectList::GetAt(std::size_t index)
{
    constexpr std::size_t rowsBetween = 256;
    const bool isEnd = index % rowsBetween == 0 && progress_ && !progress_(index);
    return isEnd ? nullptr : UDataObjectList::GetAt(index);
}

} // namespace kareport
