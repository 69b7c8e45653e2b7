#include "JsonRowParser.h"

#include <nlohmann/json.hpp>

#include <iterator>
#include <limits>
#include <string>

namespace kareport
{

namespace
{

/// Goes over bytes and tells others how far it has come.
class Cursor
{
public:
    using iterator_category = std::input_iterator_tag;
    using value_type = char;
    using difference_type = std::ptrdiff_t;
    using pointer = const char *;
    using reference = const char &;

    Cursor(const char *begin, std::size_t at, std::size_t *position) : begin_(begin), at_(at), position_(position) {}

    reference operator*() const { return begin_[at_]; }
    Cursor &operator++()
    {
        *position_ = ++at_;
        return *this;
    }
    bool operator==(const Cursor &other) const { return at_ == other.at_; }
    bool operator!=(const Cursor &other) const { return at_ != other.at_; }

private:
    const char *begin_;
    std::size_t at_;
    std::size_t *position_;
};

/// What the parser says about a mistake, without where it was found.
QString reasonOf(const char *text)
{
    QString reason = QString::fromUtf8(text);
    reason = reason.mid(reason.indexOf(QStringLiteral("] ")) + 2);
    const qsizetype dash = reason.indexOf(QStringLiteral(" - "));
    return dash < 0 ? reason : reason.mid(dash + 3);
}

/// Passes on what the object itself has, and skips what is inside its values.
class Events
{
public:
    Events(JsonRowHandler &handler, const std::size_t &position) : handler_(handler), position_(position) {}

    bool null() { return depth_ > 1 || handler_.onNull(); }
    bool boolean(bool value) { return depth_ > 1 || handler_.onBoolean(value); }
    bool number_integer(std::int64_t value) { return depth_ > 1 || handler_.onInteger(value); }
    bool number_unsigned(std::uint64_t value)
    {
        constexpr auto most = static_cast<std::uint64_t>(std::numeric_limits<qint64>::max());
        return depth_ > 1 ||
               (value <= most ? handler_.onInteger(static_cast<qint64>(value)) : handler_.onUnsigned(value));
    }
    bool number_float(double value, const std::string & /*text*/) { return depth_ > 1 || handler_.onNumber(value); }
    bool string(std::string &text) { return depth_ > 1 || handler_.onText(text); }
    bool binary(nlohmann::json::binary_t & /*bytes*/) { return true; }
    bool key(std::string &name) { return depth_ > 1 || handler_.onKey(name, position_); }
    bool start_object(std::size_t /*elements*/) { return begin(); }
    bool start_array(std::size_t /*elements*/) { return begin(); }
    bool end_object()
    {
        --depth_;
        return true;
    }
    bool end_array() { return end_object(); }
    bool parse_error(std::size_t /*read*/, const std::string & /*token*/, const nlohmann::json::exception &mistake)
    {
        handler_.onMistake(reasonOf(mistake.what()), position_);
        return false;
    }

private:
    bool begin()
    {
        ++depth_;
        return depth_ != 2 || handler_.onNested();
    }

    JsonRowHandler &handler_;
    const std::size_t &position_;
    std::size_t depth_ = 0;
};

} // namespace

bool parseJsonRow(std::string_view text, std::size_t &position, std::size_t limit, JsonRowHandler &handler)
{
    Events events(handler, position);
    std::size_t end = limit;
    return nlohmann::json::sax_parse(Cursor(text.data(), position, &position), Cursor(text.data(), limit, &end),
                                     &events, nlohmann::json::input_format_t::json, false);
}

} // namespace kareport
