#include "UDataObjectList.h"

#include "EntryOrder.h"

#include <algorithm>

UDataObjectList::UDataObjectList() = default;

UDataObjectList::~UDataObjectList() = default;

UDataObject *UDataObjectList::GetAt(std::size_t index)
{
    return index < objects_.size() ? objects_[index].get() : nullptr;
}

void UDataObjectList::Sort(const std::vector<unsigned> &ids)
{
    std::stable_sort(objects_.begin(), objects_.end(), [&ids](const auto &left, const auto &right) {
        return std::is_lt(kareport::compareObjects(*left, *right, ids));
    });
}

UDataObject &UDataObjectList::Add()
{
    return *objects_.emplace_back(std::make_unique<UDataObject>());
}
