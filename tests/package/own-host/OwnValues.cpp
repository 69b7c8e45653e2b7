// A host's own job settings and data objects, in place of those of KaReportHost: it keeps feet.
#include "OwnHost.h"

#include <KaReport/UDataObject.h>
#include <KaReport/UDataObjectList.h>
#include <KaReport/UFormatAngle.h>
#include <KaReport/UFormatBearing.h>
#include <KaReport/UJobSettings.h>

#include <algorithm>

namespace
{
int found = 0;
}

int valuesFound()
{
    return found;
}

double UJobSettings::ConvertToDisplay(double value, int /*unitKind*/, int /*reserved*/) const
{
    return value;
}

void UJobSettings::appendUnitLength(kareport::TextBuffer &out, double value, const kareport::LengthForm &form) const
{
    const std::size_t start = out.size();
    out.append(QString::number(value, 'f', form.decimals < 0 ? lengthDecimals : form.decimals));
    out.append(u'\'');
    out.pad(start, form.width);
}

void UJobSettings::appendStation(kareport::TextBuffer &out, double value, const kareport::StationForm &form) const
{
    const std::size_t start = out.size();
    out.append(u'@');
    out.append(QString::number(value, 'f', form.decimals < 0 ? stationDecimals : form.decimals));
    out.pad(start, form.alignRight ? form.width : -form.width);
}

void UFormatBearing::ConvertToDisplayString(double value, QString &text) const
{
    text = QString::number(value);
}

void UFormatAngle::ConvertToDMSformatString(char, char, char, QString & /*text*/) {}

const UDictEntry *UDictionary::Find(unsigned id) const
{
    ++found;
    const auto entry = lowerBound(id);
    return entry != entries_.end() && entry->GetId() == id ? &*entry : nullptr;
}

void UDictionary::Set(unsigned id, UDictEntry::Value value)
{
    valueOf(id) = std::move(value);
}

UDictionary::Entries::const_iterator UDictionary::lowerBound(unsigned id) const
{
    return std::find_if(entries_.begin(), entries_.end(),
                        [id](const UDictEntry &entry) { return entry.GetId() >= id; });
}

UDictEntry::Value &UDictionary::valueOf(unsigned id)
{
    auto entry = entries_.begin() + (lowerBound(id) - entries_.cbegin());
    if (entry == entries_.end() || entry->GetId() != id) {
        entry = entries_.insert(entry, UDictEntry(id, false));
    }
    return entry->value();
}

UDataObjectList::UDataObjectList() = default;
UDataObjectList::~UDataObjectList() = default;

UDataObject *UDataObjectList::GetAt(std::size_t index)
{
    return index < objects_.size() ? objects_[index].get() : nullptr;
}

void UDataObjectList::Sort(const std::vector<unsigned> & /*ids*/) {}

UDataObject &UDataObjectList::Add()
{
    return *objects_.emplace_back(std::make_unique<UDataObject>());
}
