#pragma once

#include <QDialog>

#include <vector>

class QAction;
class QLabel;
class QLineEdit;
class QMenuBar;
class QTreeWidget;
class QTreeWidgetItem;

namespace kareport
{

/// A command as the menus have it.
struct ListedCommand
{
    QAction *action = nullptr;
    QString name; ///< with the names of the menus that lead to it: "File › Save As"
};

/// The commands of a menu bar, in its order. Entries for files and windows are not commands.
std::vector<ListedCommand> listedCommands(const QMenuBar &bar);

/// All commands with their keys. What is typed narrows them; Enter runs the one that is selected. What cannot act now is grey
/// and says why.
class CommandList : public QDialog
{
public:
    explicit CommandList(const std::vector<ListedCommand> &commands, QWidget *parent = nullptr);

    /// The command that was chosen; null for none.
    QAction *chosen() const { return chosen_; }
    void accept() override;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void narrow(const QString &text);
    void showReason();

    QLineEdit *field_;
    QTreeWidget *list_;
    QLabel *reason_;
    std::vector<ListedCommand> commands_;
    QAction *chosen_ = nullptr;
};

} // namespace kareport
