#pragma once

#include "FileBytes.h"
#include "InputError.h"

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace kareport
{

/// The notes of a reader on a file whose rows are sound: differences, and what is not read. Their number is bounded,
/// whatever the file holds.
class LandXmlNotes
{
public:
    static constexpr std::size_t most = 100; ///< notes with a place, and kinds of elements

    explicit LandXmlNotes(std::shared_ptr<const FileBytes> file) : file_(std::move(file)) {}

    void add(std::size_t byte, const QString &text);
    /// Adds what is said of the file as a whole, and is not a difference.
    void addOfFile(const QString &text);
    /// Counts elements that no list reads, or that are in one.
    void leaveOut(std::string_view element, std::size_t count = 1);
    void clear();

    /// All notes: first those with a place, in the order of the file, then the elements that were skipped, by their
    /// names.
    std::vector<InputError> all() const;

private:
    static constexpr std::size_t longestName = 100;

    struct Note
    {
        std::size_t byte;
        QString text;
    };

    std::shared_ptr<const FileBytes> file_;
    std::vector<Note> placed_;
    std::size_t more_ = 0;
    std::vector<QString> ofFile_;
    std::map<std::string, std::size_t, std::less<>> passedOver_;
    std::size_t otherKinds_ = 0;
};

} // namespace kareport
