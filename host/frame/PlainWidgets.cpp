#include "PlainWidgets.h"

#include <QCoreApplication>
#include <QLabel>
#include <QMessageBox>
#include <QPushButton>

#include <algorithm>

namespace kareport
{

namespace
{

QMessageBox::StandardButtons boxButtons(MessageButtons buttons)
{
    switch (buttons) {
    case MessageButtons::YesNo: return QMessageBox::Yes | QMessageBox::No;
    case MessageButtons::YesNoCancel: return QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel;
    default: return QMessageBox::Ok;
    }
}

QMessageBox::Icon boxIcon(const Message &message)
{
    if (message.icon == MessageIcon::Information) {
        return QMessageBox::Information;
    }
    const bool isQuestion = message.icon == MessageIcon::Question || message.buttons != MessageButtons::Ok;
    return isQuestion ? QMessageBox::Question : QMessageBox::Warning;
}

} // namespace

MessageAnswer showMessageBox(QWidget *parent, const Message &message)
{
    QMessageBox box(parent);
    box.setTextFormat(Qt::PlainText); // before the text: a box that has once seen HTML has opened its pictures
    box.setWindowTitle(message.caption.isEmpty() ? QCoreApplication::applicationName() : message.caption);
    box.setText(message.text);
    box.setIcon(boxIcon(message));
    box.setStandardButtons(boxButtons(message.buttons));
    if (message.buttons == MessageButtons::YesNo) {
        // The Escape key is not an answer, least of all one that discards something.
        QPushButton *none = box.addButton(QMessageBox::Cancel);
        none->hide();
        box.setEscapeButton(none);
    }
    switch (box.exec()) {
    case QMessageBox::Ok: return MessageAnswer::Ok;
    case QMessageBox::Yes: return MessageAnswer::Yes;
    case QMessageBox::No: return MessageAnswer::No;
    default: return MessageAnswer::Cancel;
    }
}

QLabel *plainLabel(const QString &text, QWidget *parent)
{
    auto *label = new QLabel(parent);
    label->setTextFormat(Qt::PlainText);
    label->setText(text);
    return label;
}

void keepLabelsPlain(const QWidget &window)
{
    for (QLabel *label : window.findChildren<QLabel *>()) {
        label->setTextFormat(Qt::PlainText);
    }
}

QString plainToolTip(const QString &text)
{
    // A text that does not look like HTML is shown unchanged, and a single line is not broken.
    return Qt::mightBeRichText(text) ? QStringLiteral("<qt>%1</qt>").arg(text.toHtmlEscaped()) : text;
}

QString plainMenuText(const QString &text)
{
    QString shown = text;
    std::replace_if(
        shown.begin(), shown.end(), [](QChar character) { return character.category() == QChar::Other_Control; }, u' ');
    return shown.replace(u'&', QStringLiteral("&&"));
}

} // namespace kareport
