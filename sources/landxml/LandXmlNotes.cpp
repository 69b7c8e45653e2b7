#include "LandXmlNotes.h"

#include "Xlate.h"
#include "XmlStream.h"

#include <algorithm>

namespace kareport
{

void LandXmlNotes::add(std::size_t byte, const QString &text)
{
    if (placed_.size() == most) {
        ++more_;
        return;
    }
    placed_.push_back({byte, text});
}

void LandXmlNotes::addOfFile(const QString &text)
{
    if (ofFile_.size() < most) {
        ofFile_.push_back(text);
    }
}

void LandXmlNotes::leaveOut(std::string_view element, std::size_t count)
{
    element = element.substr(0, longestName);
    const auto known = passedOver_.find(element);
    if (known != passedOver_.end()) {
        known->second += count;
    } else if (passedOver_.size() < most) {
        passedOver_.emplace(element, count);
    } else {
        otherKinds_ += count;
    }
}

void LandXmlNotes::clear()
{
    placed_.clear();
    more_ = 0;
    ofFile_.clear();
    passedOver_.clear();
    otherKinds_ = 0;
}

std::vector<InputError> LandXmlNotes::all() const
{
    std::vector<Note> placed = placed_;
    std::stable_sort(placed.begin(), placed.end(),
                     [](const Note &left, const Note &right) { return left.byte < right.byte; });
    std::vector<InputError> notes;
    FilePlaces places(*file_);
    for (const Note &note : placed) {
        notes.push_back({file_->path(), places.of(note.byte), note.text});
    }
    const auto add = [&](const QString &text) { notes.push_back({file_->path(), std::nullopt, text}); };
    if (more_ > 0) {
        add((more_ == 1 ? Xlate("and %1 more such difference") : Xlate("and %1 more such differences")).arg(more_));
    }
    for (const QString &text : ofFile_) {
        add(text);
    }
    for (const auto &[element, count] : passedOver_) {
        add(Xlate("%1: %2 in the file, which no list reads")
                .arg(QString::fromStdString(element), QString::number(count)));
    }
    if (otherKinds_ > 0) {
        add(Xlate("elements of other kinds: %1 in the file, which no list reads").arg(otherKinds_));
    }
    return notes;
}

} // namespace kareport
