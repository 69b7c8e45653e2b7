#pragma once

#include <QString>

#include <cstddef>
#include <string_view>

namespace kareport
{

/// Is told what an object of a JSON text holds. The functions answer whether to go on.
class JsonRowHandler
{
public:
    virtual ~JsonRowHandler() = default;

    /// A key of the object itself. @param end  where it ends, after its closing quote
    virtual bool onKey(std::string_view key, std::size_t end) = 0;
    // Its value.
    virtual bool onNull() = 0;
    virtual bool onBoolean(bool value) = 0;
    virtual bool onInteger(qint64 value) = 0;
    virtual bool onUnsigned(quint64 value) = 0; ///< one that is too large for `onInteger`
    virtual bool onNumber(double value) = 0;
    virtual bool onText(std::string_view text) = 0;
    /// A list or an object, which is skipped.
    virtual bool onNested() = 0;
    /// What is wrong with the text, and where.
    virtual void onMistake(const QString &text, std::size_t at) = 0;
};

/// Parses an object of a JSON text.
/// @param position  where it begins; then where it ends, or where parsing came to
/// @param limit     where it must have ended
/// @return whether it was parsed to its end
bool parseJsonRow(std::string_view text, std::size_t &position, std::size_t limit, JsonRowHandler &handler);

} // namespace kareport
