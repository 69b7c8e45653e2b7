#include "JsonSource.h"

#include "NearestName.h"
#include "StandardInput.h"
#include "Xlate.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QStringList>

#include <algorithm>
#include <variant>

namespace kareport
{

namespace
{

/// A larger file is not read as a job.
constexpr qint64 largestJob = qint64(256) << 20;

QString withDots(const JsonPath &path)
{
    QStringList steps;
    for (const auto &step : path) {
        if (const auto *name = std::get_if<QString>(&step)) {
            steps.append(*name);
        } else {
            steps.append(QString::number(std::get<qsizetype>(step)));
        }
    }
    return steps.join(u'.');
}

/// A longer key leads nowhere in a job, and each step costs a call.
constexpr qsizetype mostSteps = 100;
/// What a message shows of a text from the command line.
constexpr qsizetype longestQuote = 100;

QString quoteOf(const QString &text)
{
    return shortened(text, longestQuote);
}

/// A value from the command line: JSON where it is some, else the text itself. @return what is wrong with it
std::variant<QJsonValue, QString> parsedOrText(const QString &text)
{
    QJsonParseError error{};
    const QByteArray json = '[' + text.toUtf8() + ']';
    const auto document = QJsonDocument::fromJson(json, &error);
    if (error.error != QJsonParseError::NoError || document.array().size() != 1) {
        return QJsonValue(text);
    }
    if (const auto repeated = findRepeatedKey(json)) {
        return Xlate("the key \"%1\" occurs twice in \"%2\"").arg(quoteOf(repeated->key), quoteOf(text));
    }
    return document.array().first();
}

/// The value with another one where the steps lead; nothing when they lead nowhere.
std::optional<QJsonValue> withValueAt(const QJsonValue &value, const QStringList &steps, const QJsonValue &inner)
{
    if (steps.isEmpty()) {
        return inner;
    }
    const QString &step = steps.first();
    if (value.isArray()) {
        QJsonArray array = value.toArray();
        bool isIndex = false;
        const int index = step.toInt(&isIndex);
        if (!isIndex || index < 0 || index >= array.size()) {
            return std::nullopt;
        }
        const auto changed = withValueAt(array.at(index), steps.mid(1), inner);
        if (!changed) {
            return std::nullopt;
        }
        array.replace(index, *changed);
        return array;
    }
    if (!value.isObject() && !value.isUndefined()) {
        return std::nullopt;
    }
    QJsonObject object = value.toObject();
    const auto changed = withValueAt(object.value(step), steps.mid(1), inner);
    if (!changed) {
        return std::nullopt;
    }
    object.insert(step, *changed);
    return object;
}

} // namespace

Expected<JsonSource> JsonSource::read(const QString &path)
{
    QFile file(path);
    QByteArray bytes;
    qint64 size = 0; // a pipe has none, and may never end
    if (path == u"-") {
        bytes = StandardInput::read(largestJob + 1).bytes;
    } else if (file.open(QIODevice::ReadOnly)) {
        size = file.size();
        bytes = size > largestJob ? QByteArray() : file.read(size > 0 ? size : largestJob + 1);
    } else {
        return InputError{path, std::nullopt, Xlate("the file cannot be read: %1").arg(file.errorString())};
    }
    if (std::max<qint64>(size, bytes.size()) > largestJob) {
        return InputError{path, TextPlace(),
                          Xlate("the file is larger than %1 MB: a job was expected").arg(largestJob >> 20)};
    }
    return fromBytes(path, bytes);
}

Expected<JsonSource> JsonSource::fromBytes(const QString &path, const QByteArray &bytes)
{
    QJsonParseError parseError{};
    const auto document = QJsonDocument::fromJson(bytes, &parseError);
    if (parseError.error != QJsonParseError::NoError) {
        return InputError{path, placeOfByte(bytes, parseError.offset),
                          Xlate("a JSON object was expected: %1").arg(parseError.errorString())};
    }
    if (!document.isObject()) {
        return InputError{path, TextPlace(), Xlate("a JSON object was expected")};
    }
    if (const auto repeated = findRepeatedKey(bytes)) {
        return InputError{path, repeated->place,
                          Xlate("the key \"%1\" is in line %2 already: each key was expected once")
                              .arg(quoteOf(repeated->key), QString::number(repeated->firstLine))};
    }
    JsonSource source;
    source.path_ = path;
    source.places_ = std::make_shared<JsonPlaces>(bytes);
    source.root_ = document.object();
    return source;
}

JsonSource JsonSource::fromObject(const QJsonObject &object)
{
    JsonSource source;
    source.root_ = object;
    return source;
}

std::optional<QString> JsonSource::set(const QString &key, const QString &text)
{
    const QStringList steps = key.split(u'.');
    if (steps.size() > mostSteps) {
        return Xlate("the key \"%1\" has %2 steps: at most %3 were expected")
            .arg(quoteOf(key), QString::number(steps.size()), QString::number(mostSteps));
    }
    const auto value = parsedOrText(text);
    if (const auto *wrong = std::get_if<QString>(&value)) {
        return *wrong;
    }
    const auto changed =
        steps.contains(QString()) ? std::nullopt : withValueAt(root_, steps, std::get<QJsonValue>(value));
    if (!changed) {
        return Xlate(
                   "the key \"%1\" cannot be set in the job: names of keys, and numbers of existing elements of a list, were expected between the dots")
            .arg(quoteOf(key));
    }
    root_ = *changed;
    setTexts_.removeIf([inside = key + u'.'](const auto &given) { return given.key().startsWith(inside); });
    setTexts_.insert(key, text);
    return std::nullopt;
}

std::optional<QString> JsonSource::setText(const JsonPath &path) const
{
    const auto found = setTexts_.constFind(withDots(path));
    return found == setTexts_.constEnd() ? std::nullopt : std::optional(*found);
}

InputError JsonSource::errorAt(const JsonPath &path, const QString &text, bool atKey) const
{
    // An error in a value from the command line has no place in the file.
    for (JsonPath given = path; !given.empty(); given.pop_back()) {
        if (const auto option = options_.constFind(withDots(given)); option != options_.constEnd()) {
            return {*option, std::nullopt, text};
        }
        if (const auto set = setText(given)) {
            return {QStringLiteral("--set %1=%2").arg(withDots(given), *set), std::nullopt, text};
        }
    }
    if (!places_) {
        return {path_, std::nullopt, text};
    }
    // What is missing is reported at the place of its parent.
    JsonPath known = path;
    auto place = places_->of(known, atKey);
    while (!place && !known.empty()) {
        known.pop_back();
        place = places_->of(known);
    }
    return {path_, place, text};
}

} // namespace kareport
