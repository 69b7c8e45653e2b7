#pragma once

#include "JsonNode.h"
#include "RowList.h"
#include "ValueParser.h"

#include <QSet>
#include <QString>

#include <functional>
#include <optional>

namespace kareport
{

/// Is told of every member of an object. @param parser  null when the dictionary does not know its name
using SeeMember = std::function<void(const JsonNode &member, const QString &name, const ValueParser *parser)>;

/// Is told of a member that takes the place of another value of its object, of a variable with the same identifier.
using SeeReplacing = std::function<void(const JsonNode &member, const QString &name, unsigned id)>;

/// Stores the members of a JSON object that the dictionary knows; null stores no value. What does not fit fails the node.
/// @param object  holds nothing before
void storeJsonObject(const JsonNode &node, const FindVariable &findVariable, UDataObject &object,
                     const SeeMember &seeMember = {}, const SeeReplacing &seeReplacing = {});

/// Rows that are in a job: an object for a single row, or a list of objects. All of them are made at once.
class JsonObjectList : public RowList
{
public:
    /// @param source     must live longer
    /// @param path       leads to the values
    /// @param firstOnly  whether one row is enough, and those after it are not looked at
    /// @param progress   receives now and then the number of rows handed out. May be empty
    JsonObjectList(const JsonSource &source, const JsonPath &path, const FindVariable &findVariable, bool firstOnly,
                   ReadProgress progress);

    UDataObject *GetAt(std::size_t index) override;
    std::optional<InputError> error() const override { return error_; }
    std::optional<SourceColumns> columns() const override;
    ValuePlace placeOf(std::size_t index, const QString &variable) override;
    std::vector<InputError> differences() const override { return differences_; }
    void Sort(const std::vector<unsigned> &ids) override;

private:
    void noteReplaced(const JsonSource &source, const JsonNode &member, const QString &name, unsigned id);
    void noteMember(const JsonSource &source, const JsonNode &member, const QString &name, const ValueParser *parser);

    const JsonSource &source_;
    JsonPath path_;
    bool isObject_ = false;
    bool hasRow_ = false;
    bool isSorted_ = false;
    std::optional<InputError> error_;
    std::vector<InputError> differences_;
    std::vector<unsigned> replacedIds_; ///< that `differences_` is about
    SourceColumns columns_;
    QSet<QString> names_; ///< of the columns
    ReadProgress progress_;
};

} // namespace kareport
