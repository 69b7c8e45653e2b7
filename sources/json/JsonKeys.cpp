#include "JsonKeys.h"

#include "NearestName.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

JsonKeys::JsonKeys(const std::vector<ColumnChoice> &choices, const Variables &variables)
    : choices_(choices), variables_(variables), isChoiceFound_(choices.size())
{
    findWrongChoice();
}

void JsonKeys::findWrongChoice()
{
    // A binding to columns of the names that are chosen finds what is wrong with the variables.
    std::vector<SourceColumn> named;
    for (const ColumnChoice &choice : choices_) {
        const QString *name = std::get_if<QString>(&choice.column);
        if (name == nullptr) {
            wrongChoice_ = ColumnFault{std::nullopt, choice.variable,
                                       Xlate("the columns of JSON have no numbers: the name of a key was expected")};
            return;
        }
        if (std::none_of(named.begin(), named.end(),
                         [name](const SourceColumn &other) { return equalFolded(other.name, *name); }))
        {
            named.push_back({*name, std::nullopt});
        }
    }
    wrongChoice_ = ColumnBinding().bind(named, choices_, variables_);
}

JsonKeys::Found JsonKeys::take(std::string_view key, std::size_t row)
{
    auto found = keys_.find(std::string(key));
    const bool isNew = found == keys_.end();
    Key *taken = isNew ? &unkept_ : &found->second;
    if (isNew) {
        unkept_ = bind(QString::fromUtf8(key.data(), static_cast<qsizetype>(key.size())));
        if (keys_.size() < most || !unkept_.fields.empty()) {
            taken = &keys_.emplace(std::string(key), std::move(unkept_)).first->second;
        }
    }
    const bool isRepeated = taken->lastRow == row;
    taken->lastRow = row;
    bool isVariableRepeated = false;
    for (const Field &field : taken->fields) {
        isVariableRepeated = isVariableRepeated || lastRows_[field.variable] == row;
        lastRows_[field.variable] = row;
    }
    return {&taken->fields, isNew, isRepeated, isVariableRepeated};
}

/// Finds the variables that are read from a key: those that chose it, or else the one of its name, unless that has chosen
/// another key.
JsonKeys::Key JsonKeys::bind(const QString &name)
{
    Key key;
    bool isVariableChosen = false;
    for (std::size_t i = 0; i < choices_.size(); ++i) {
        isVariableChosen = isVariableChosen || equalFolded(choices_[i].variable, name);
        if (equalFolded(std::get<QString>(choices_[i].column), name)) {
            isChoiceFound_[i] = true;
            addField(key, name, choices_[i].variable, *variables_.find(choices_[i].variable));
        }
    }
    const auto parser = key.fields.empty() && !isVariableChosen ? variables_.find(name) : std::nullopt;
    if (parser) {
        addField(key, name, name, *parser);
    }
    return key;
}

void JsonKeys::addField(Key &key, const QString &name, const QString &variable, const ValueParser &parser)
{
    qsizetype index = names_.indexOf(foldedKey(variable));
    const bool isNew = index < 0;
    if (isNew) {
        index = names_.size();
        names_.append(foldedKey(variable));
        lastRows_.push_back(0);
    }
    if (std::find(ids_.begin(), ids_.end(), parser.id()) == ids_.end()) {
        ids_.push_back(parser.id());
    } else {
        hasSharedIds_ = hasSharedIds_ || isNew; // a variable may have several spellings of its key
    }
    key.fields.push_back({name, parser, static_cast<std::size_t>(index)});
}

std::optional<QString> JsonKeys::whatIsMissing(const std::vector<SourceColumn> &columns) const
{
    const QStringList names = namesOf(columns);
    for (std::size_t i = 0; i < choices_.size(); ++i) {
        if (!isChoiceFound_[i]) {
            const QString &name = std::get<QString>(choices_[i].column);
            return withQuestion(Xlate("no object has the key \"%1\"").arg(name), name, names);
        }
    }
    if (!names_.isEmpty()) {
        return std::nullopt;
    }
    constexpr qsizetype mostNames = 40;
    return Xlate("no key of the objects is a variable of the dictionary; the keys are: %1")
        .arg(names.isEmpty() ? Xlate("none") : names.mid(0, mostNames).join(QStringLiteral(", ")));
}

} // namespace kareport
