#include "CommandList.h"

#include "PlainWidgets.h"
#include "Readable.h"
#include "Xlate.h"

#include <QAction>
#include <QCoreApplication>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

constexpr int numberRole = Qt::UserRole;

/// The text of a menu entry as it is read: without the marks of its key and the dots at its end.
QString readText(const QAction &action)
{
    QString text = action.text();
    text.replace(QStringLiteral("&&"), QStringLiteral("\u0001"));
    text.remove(u'&');
    text.replace(u'\u0001', u'&');
    while (text.endsWith(u'.') || text.endsWith(u'…')) {
        text.chop(1);
    }
    return text;
}

void collect(const QMenu &menu, const QString &way, std::vector<ListedCommand> &commands)
{
    for (QAction *action : menu.actions()) {
        const QString name = way + QStringLiteral(" › ") + readText(*action);
        if (action->menu() != nullptr && action->data().toUInt() == 0) {
            collect(*action->menu(), name, commands);
        } else if (action->menu() == nullptr && action->data().toUInt() != 0) {
            commands.push_back({action, name});
        }
    }
}

QString keysOf(const QAction &action)
{
    return action.shortcut().toString(QKeySequence::NativeText);
}

} // namespace

std::vector<ListedCommand> listedCommands(const QMenuBar &bar)
{
    std::vector<ListedCommand> commands;
    for (const QAction *action : bar.actions()) {
        if (action->menu() != nullptr) {
            collect(*action->menu(), readText(*action), commands);
        }
    }
    return commands;
}

CommandList::CommandList(const std::vector<ListedCommand> &commands, QWidget *parent)
    : QDialog(parent), field_(new QLineEdit), list_(new QTreeWidget), reason_(plainLabel()), commands_(commands)
{
    setWindowTitle(Xlate("Commands"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    field_->setPlaceholderText(Xlate("Type a part of a command or of its keys"));
    field_->setAccessibleName(Xlate("Find a command"));
    field_->setClearButtonEnabled(true);
    field_->installEventFilter(this);
    list_->setAccessibleName(Xlate("Commands"));
    list_->setColumnCount(2);
    QStringList titles;
    titles.append(Xlate("Command"));
    titles.append(Xlate("Keys"));
    list_->setHeaderLabels(titles);
    list_->setRootIsDecorated(false);
    list_->setUniformRowHeights(true);
    list_->setAllColumnsShowFocus(true);
    list_->header()->setStretchLastSection(false);
    list_->header()->setSectionResizeMode(0, QHeaderView::Stretch);
    list_->header()->setSectionResizeMode(1, QHeaderView::ResizeToContents);
    reason_->setAccessibleName(Xlate("Why the command cannot be chosen"));
    reason_->setWordWrap(true);
    makeQuiet(*reason_);
    // As high as two lines from the beginning, so that nothing moves when one comes.
    reason_->setMinimumHeight(2 * reason_->fontMetrics().lineSpacing());
    reason_->setAlignment(Qt::AlignLeft | Qt::AlignTop);

    auto *layout = new QVBoxLayout(this);
    layout->addWidget(field_);
    layout->addWidget(list_, 1);
    layout->addWidget(reason_);
    const QFontMetrics metrics(fontMetrics());
    resize(metrics.averageCharWidth() * 72, metrics.lineSpacing() * 26);

    for (std::size_t number = 0; number < commands_.size(); ++number) {
        const QAction &action = *commands_[number].action;
        auto *item = new QTreeWidgetItem(list_);
        item->setText(0, commands_[number].name);
        item->setText(1, keysOf(action));
        item->setIcon(0, action.icon());
        item->setData(0, numberRole, QVariant::fromValue(number));
        if (!action.isEnabled()) {
            for (const int column : {0, 1}) {
                item->setForeground(column, quietColor(palette(), QPalette::Base));
            }
            QFont slanted = font();
            slanted.setItalic(true); // not everyone sees the gray
            item->setFont(0, slanted);
            item->setData(0, Qt::AccessibleDescriptionRole, action.statusTip());
            item->setToolTip(0, plainToolTip(action.statusTip()));
        }
    }
    connect(field_, &QLineEdit::textChanged, this, &CommandList::narrow);
    connect(list_, &QTreeWidget::currentItemChanged, this, [this] { showReason(); });
    connect(list_, &QTreeWidget::itemActivated, this, [this] { accept(); });
    connect(list_, &QTreeWidget::itemClicked, this, [this] { accept(); });
    narrow(QString());
    field_->setFocus();
}

void CommandList::narrow(const QString &text)
{
    const QStringList words = text.simplified().split(u' ', Qt::SkipEmptyParts);
    QTreeWidgetItem *first = nullptr;
    for (int row = 0; row < list_->topLevelItemCount(); ++row) {
        QTreeWidgetItem *item = list_->topLevelItem(row);
        const QString line = item->text(0) + u' ' + item->text(1);
        bool isFound = true;
        for (const QString &word : words) {
            isFound = isFound && line.contains(word, Qt::CaseInsensitive);
        }
        item->setHidden(!isFound);
        first = isFound && first == nullptr ? item : first;
    }
    list_->setCurrentItem(first);
    showReason();
}

void CommandList::showReason()
{
    const QTreeWidgetItem *item = list_->currentItem();
    if (item == nullptr) {
        reason_->setText(Xlate("No command has this name."));
        return;
    }
    const QAction &action = *commands_[item->data(0, numberRole).toULongLong()].action;
    reason_->setText(action.isEnabled() ? QString() : action.statusTip());
}

void CommandList::accept()
{
    const QTreeWidgetItem *item = list_->currentItem();
    QAction *action = item != nullptr ? commands_[item->data(0, numberRole).toULongLong()].action : nullptr;
    if (action != nullptr && action->isEnabled()) {
        chosen_ = action;
        QDialog::accept();
    }
}

bool CommandList::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == field_ && event->type() == QEvent::KeyPress) {
        const int key = static_cast<QKeyEvent *>(event)->key();
        if (key == Qt::Key_Up || key == Qt::Key_Down || key == Qt::Key_PageUp || key == Qt::Key_PageDown) {
            QCoreApplication::sendEvent(list_, event);
            return true;
        }
        if (key == Qt::Key_Return || key == Qt::Key_Enter) {
            accept();
            return true;
        }
    }
    return QDialog::eventFilter(watched, event);
}

} // namespace kareport
