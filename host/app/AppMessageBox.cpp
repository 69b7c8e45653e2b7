#include "AppMessageBox.h"

#include "StandardText.h"

namespace
{

kareport::MessageHandler &messageHandler()
{
    static kareport::MessageHandler handler;
    return handler;
}

kareport::MessageBox &messageBox()
{
    static kareport::MessageBox box;
    return box;
}

} // namespace

MessageAnswer AppMessageBox(const QString &text, MessageButtons buttons)
{
    return kareport::showMessage({text, QString(), buttons, kareport::MessageIcon::None});
}

MessageAnswer AppMessageBox(unsigned number, unsigned /*type*/, unsigned /*help*/)
{
    return AppMessageBox(kareport::standardText(number));
}

void kareport::setMessageHandler(MessageHandler handler)
{
    messageHandler() = std::move(handler);
}

MessageAnswer kareport::showMessage(const Message &message)
{
    if (messageBox()) {
        return messageBox()(message);
    }
    return messageHandler() ? messageHandler()(message.text, message.buttons) : MessageAnswer::Cancel;
}

void kareport::setMessageBox(MessageBox box)
{
    messageBox() = std::move(box);
}
