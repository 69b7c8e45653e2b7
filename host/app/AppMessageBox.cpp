#include "AppMessageBox.h"

namespace
{

kareport::MessageHandler &messageHandler()
{
    static kareport::MessageHandler handler;
    return handler;
}

} // namespace

MessageAnswer AppMessageBox(const QString &text, MessageButtons buttons)
{
    return messageHandler() ? messageHandler()(text, buttons) : MessageAnswer::Cancel;
}

void kareport::setMessageHandler(MessageHandler handler)
{
    messageHandler() = std::move(handler);
}
