#pragma once

#include "KaReportExport.h"
#include "UDataObject.h"

#include <cstddef>
#include <memory>
#include <vector>

/// An indexed list of data objects, the rows of a table. This class owns its objects; a host whose data is too large to
/// be held as objects derives from it and makes each one when it is asked for.
class KAREPORT_EXPORT UDataObjectList
{
public:
    /// An empty list.
    UDataObjectList();
    /// Destroys the objects with the list.
    virtual ~UDataObjectList();
    UDataObjectList(const UDataObjectList &) = delete;
    UDataObjectList &operator=(const UDataObjectList &) = delete;

    /// The object at an index from 0, or null after the last one. The list keeps it; it is valid until the next call of
    /// any function of the list.
    virtual UDataObject *GetAt(std::size_t index);

    /// Orders the list in place, ascending, by the values under the identifiers in turn. Objects that compare equal keep
    /// their order.
    virtual void Sort(const std::vector<unsigned> &ids);

    /// Adds an empty object at the end. Throws std::bad_alloc without memory, with the list as it was.
    UDataObject &Add();

private:
    std::vector<std::unique_ptr<UDataObject>> objects_;
};
