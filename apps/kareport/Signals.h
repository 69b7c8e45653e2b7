#pragma once

namespace kareport
{

/// Lets a signal that asks the program to end (from the keyboard, from another program, from a terminal that closes) stop
/// the work at the next safe point. Work that does not come to one within a fraction of a second, and a second signal, end
/// the program where it is: a file that is half written is taken away. Signals that the caller has switched off stay so.
void catchInterrupts();

/// A descriptor that can be read as soon as a signal asks the program to end, for a program that waits in an event loop. It
/// stays open. @return -1 when the system gives none
int interruptDescriptor();

/// Ends the program by the signal that interrupted it, so that a shell knows why, and ends its loop as well. Returns when
/// there was none.
void endByInterrupt();
/// Ends the program as writing to a pipe without a reader does. Returns where that is switched off.
void endByClosedReader();

} // namespace kareport
