#include "DeskDialogs.h"

#include "AppMessageBox.h"
#include "SaveDialog.h"
#include "Xlate.h"

#include <QCoreApplication>
#include <QFileDialog>
#include <QMessageBox>
#include <QPushButton>

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

MessageAnswer showBox(QWidget *parent, const Message &message)
{
    QMessageBox box(parent);
    box.setWindowTitle(message.caption.isEmpty() ? QCoreApplication::applicationName() : message.caption);
    box.setText(message.text);
    const bool isQuestion = message.icon == MessageIcon::Question || message.buttons != MessageButtons::Ok;
    box.setIcon(message.icon == MessageIcon::Information ? QMessageBox::Information
                : isQuestion                             ? QMessageBox::Question
                                                         : QMessageBox::Warning);
    box.setStandardButtons(boxButtons(message.buttons));
    if (message.buttons == MessageButtons::YesNo) {
        // The Escape key is no answer, least of all one that throws something away.
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

/// The filter of a save request in the form of Qt: titles that end with their pattern, with ";;" between.
QString qtFilter(const QString &filter)
{
    const QStringList parts = filter.split(u'|', Qt::SkipEmptyParts);
    QStringList kinds;
    for (qsizetype i = 0; i + 1 < parts.size(); i += 2) {
        // The pattern after the title counts, not the one that the title shows. On this platform "*.*" would leave out
        // names without a dot.
        const QString pattern = parts[i + 1] == u"*.*" ? QStringLiteral("*") : parts[i + 1];
        kinds += parts[i].section(QStringLiteral(" ("), 0, 0) + QStringLiteral(" (") + pattern + u')';
    }
    return kinds.join(QStringLiteral(";;"));
}

std::optional<QString> askName(QWidget *parent, const SaveRequest &request)
{
    QFileDialog dialog(parent, Xlate("Save As"), request.initialFolder, qtFilter(request.filter));
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setDefaultSuffix(request.defaultExtension);
    dialog.setOption(QFileDialog::DontConfirmOverwrite, (request.flags & SaveRequest::overwritePrompt) == 0);
    if (!request.fileName.isEmpty()) {
        dialog.selectFile(request.fileName);
    }
    // A name without ending gets that of the kind that is chosen.
    QObject::connect(&dialog, &QFileDialog::filterSelected, &dialog, [&dialog](const QString &kind) {
        const QString pattern = kind.section(u'(', -1).chopped(1);
        dialog.setDefaultSuffix(pattern.startsWith(u"*.") ? pattern.mid(2) : QString());
    });
    return dialog.exec() == QDialog::Accepted ? std::optional(dialog.selectedFiles().value(0)) : std::nullopt;
}

} // namespace

void installDialogs(QWidget *parent)
{
    setMessageBox([parent](const Message &message) { return showBox(parent, message); });
    setSaveDialog([parent](const SaveRequest &request) { return askName(parent, request); });
}

} // namespace kareport
