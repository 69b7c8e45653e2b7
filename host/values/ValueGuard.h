#pragma once

namespace kareport
{

/// Gives a setting another value for as long as the guard lives, and then the one that it had before.
///
///     const ValueGuard guard(object.isOn(), false, [&object](bool on) { object.setOn(on); });
///
/// If the object may be destroyed meanwhile, the function that sets checks that it still exists.
template <typename Value, typename Set>
class [[nodiscard]] ValueGuard
{
public:
    /// @param set  is called with `now` at once and with `before` at the end; it must not throw then
    ValueGuard(Value before, Value now, Set set) : before_(before), set_(set) { set_(now); }
    ~ValueGuard() { set_(before_); }
    ValueGuard(const ValueGuard &) = delete;
    ValueGuard &operator=(const ValueGuard &) = delete;

private:
    Value before_;
    Set set_;
};

} // namespace kareport
