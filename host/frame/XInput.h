#pragma once

/// An input operation that a view is in the middle of, such as drawing a line by its points.
class XInput
{
public:
    /// Why an operation ends.
    static constexpr int givenUp = 2; ///< by the user, with the Escape key

    virtual ~XInput() = default;
    /// Ends the operation. It is then no longer its view's current one.
    virtual void Terminate(int reason) = 0;
};
