#pragma once

#include "KaReportExport.h"

#include <QString>

#include <functional>

/// The buttons of a message.
enum class MessageButtons
{
    Ok,
    YesNoCancel,
    YesNo
};
/// The button that the user has pressed; `Cancel` as well when there was no answer.
enum class MessageAnswer
{
    Ok,
    Yes,
    No,
    Cancel
};

/// Shows a message to the user through the host and waits for the answer. A program that has installed no handler shows
/// nothing and gets `Cancel`, the answer that loses nothing.
KAREPORT_EXPORT MessageAnswer AppMessageBox(const QString &text, MessageButtons buttons = MessageButtons::Ok);
/// Shows one of the host's standard texts by its number: 61701 says that a file is too large to be opened. @param type, help  kind of the message and its help topic; this
/// host has one kind and no topics
KAREPORT_EXPORT MessageAnswer AppMessageBox(unsigned number, unsigned type, unsigned help);

namespace kareport
{

/// The sign beside a message's text.
enum class MessageIcon
{
    None,
    Information,
    Question
};

/// A message with all settings of its box.
struct Message
{
    QString text;                                ///< what the message says
    QString caption;                             ///< empty for the application's name
    MessageButtons buttons = MessageButtons::Ok; ///< what it asks for
    MessageIcon icon = MessageIcon::None;        ///< what it shows beside the text
};

/// Shows a message through what `setMessageBox` installed, else through the host's message handler.
KAREPORT_EXPORT MessageAnswer showMessage(const Message &message);

/// Shows a message with caption and icon, and gives the answer.
using MessageBox = std::function<MessageAnswer(const Message &message)>;

/// Installs what shows messages with captions and icons; an empty one takes it away again.
KAREPORT_EXPORT void setMessageBox(MessageBox box);

/// Shows the text of a message, and gives the answer.
using MessageHandler = std::function<MessageAnswer(const QString &text, MessageButtons buttons)>;

/// Installs what shows messages; an empty handler shows nothing again.
KAREPORT_EXPORT void setMessageHandler(MessageHandler handler);

} // namespace kareport
