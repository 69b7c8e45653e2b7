#pragma once

#include "JsonNode.h"
#include "RowList.h"
#include "ValueParser.h"

#include <optional>

namespace kareport
{

/// Stores the members of a JSON object that the dictionary knows; null stores no value. What does not fit fails the node.
void storeJsonObject(const JsonNode &node, const FindVariable &findVariable, UDataObject &object);

/// Rows that stand in a job: an object for a single row, or a list of objects. All of them are made at once.
class JsonObjectList : public RowList
{
public:
    /// @param path       leads to the values
    /// @param firstOnly  whether one row is enough, and those after it are not looked at
    /// @param progress   is told now and then how many rows have been handed out. May be empty
    JsonObjectList(const JsonSource &source, const JsonPath &path, const FindVariable &findVariable, bool firstOnly,
                   ReadProgress progress);

    UDataObject *GetAt(std::size_t index) override;
    std::optional<InputError> error() const override { return error_; }

private:
    std::optional<InputError> error_;
    ReadProgress progress_;
};

} // namespace kareport
