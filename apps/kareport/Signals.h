#pragma once

#include <functional>

class QObject;

namespace kareport
{

/// Lets a signal that asks the program to end (from the keyboard, from another program, from a terminal that closes) stop
/// the work at the next safe point. Work that does not come to one within a fraction of a second, and a second signal, end
/// the program where it is: a file that is half written is taken away. Signals that the caller has switched off stay so.
void catchInterrupts();

/// Calls something in the event loop as soon as a signal asks the program to end, for a program that waits there; at once when
/// one has come already.
/// @param context  it is called as long as this lives
/// @return false when the system has no descriptor left for it
bool callOnInterrupt(QObject *context, std::function<void()> called);

/// Ends the program by the signal that interrupted it, so that a shell knows why, and ends its loop as well. Returns when
/// there was none.
void endByInterrupt();
/// Ends the program as writing to a pipe without a reader does. Returns where that is switched off.
void endByClosedReader();

} // namespace kareport
