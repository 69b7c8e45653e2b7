#include "AppMessageBox.h"

#include "StandardText.h"

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

MessageAnswer AppMessageBox(unsigned number, unsigned /*type*/, unsigned /*help*/)
{
    return AppMessageBox(kareport::standardText(number));
}

void kareport::setMessageHandler(MessageHandler handler)
{
    messageHandler() = std::move(handler);
}
