#pragma once

#include "ColumnBinding.h"
#include "ValueParser.h"

#include <QString>
#include <QStringList>

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace kareport
{

/// The keys of the objects of a JSON file, and the variables that are read from them. They show while objects are read.
class JsonKeys
{
public:
    /// Keys that are not read are kept up to this number: objects may have a key of their own each.
    static constexpr std::size_t most = 10000;

    /// A variable that is read from a key.
    struct Field
    {
        QString name; ///< the key
        ValueParser parser;
        std::size_t variable; ///< the same number for all keys of a variable
    };
    /// What is known of a key.
    struct Found
    {
        const std::vector<Field> *fields; ///< valid until the next key is taken
        bool isNew;
        bool isRepeated;         ///< the row has had the key before
        bool isVariableRepeated; ///< the row has had a key of the same variable
    };

    JsonKeys(const std::vector<ColumnChoice> &choices, const Variables &variables);

    /// What is wrong with the choices.
    const std::optional<ColumnFault> &wrongChoice() const { return wrongChoice_; }

    /// Takes a key of a row. @param row  its number, which no other row has
    Found take(std::string_view key, std::size_t row);

    /// What was asked for and has not been there, when all rows were read.
    std::optional<QString> whatIsMissing(const std::vector<SourceColumn> &columns) const;

    /// The identifiers of the variables that are read, each once.
    const std::vector<unsigned> &ids() const { return ids_; }
    /// Whether several variables have one identifier.
    bool hasSharedIds() const { return hasSharedIds_; }
    /// The names of these variables, folded.
    const QStringList &variables() const { return names_; }

private:
    struct Key
    {
        std::vector<Field> fields;
        std::size_t lastRow = 0;
    };

    void findWrongChoice();
    Key bind(const QString &name);
    void addField(Key &key, const QString &name, const QString &variable, const ValueParser &parser);

    std::vector<ColumnChoice> choices_;
    Variables variables_;
    std::optional<ColumnFault> wrongChoice_;
    std::vector<bool> isChoiceFound_;
    std::unordered_map<std::string, Key> keys_;
    Key unkept_; ///< the last key that is not kept
    std::vector<unsigned> ids_;
    bool hasSharedIds_ = false;
    QStringList names_;                 ///< of the variables that are read, folded
    std::vector<std::size_t> lastRows_; ///< that had them
};

} // namespace kareport
