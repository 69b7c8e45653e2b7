#pragma once

#include <QIcon>
#include <QListWidget>

#include <functional>
#include <vector>

namespace kareport
{

/// A line of a list of things to open: a name, and below it in a quieter colour what else is known of it.
struct Entry
{
    QString id; ///< that the list says when the entry is chosen
    QString name;
    QString detail; ///< empty for none
    QIcon icon = QIcon();
    bool isMissing = false; ///< shown grey
};

/// A list in which one click or Enter opens an entry. Left and Right lead to the lists beside it.
class EntryList : public QListWidget
{
public:
    /// @param name  for those who do not see it
    explicit EntryList(const QString &name, QWidget *parent = nullptr);

    void setEntries(const std::vector<Entry> &entries);
    /// Called with the id of an entry that is chosen, once the event that chose it has been dealt with: the list may be gone
    /// then.
    std::function<void(const QString &id)> chosen;
    /// The lists that the arrow keys lead to; null for none.
    void setNeighbours(EntryList *left, EntryList *right);
    /// Takes the keyboard, with an entry selected.
    void takeKeyboard();

    QSize sizeHint() const override;

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;

private:
    void choose(const QListWidgetItem *item);

    EntryList *left_ = nullptr;
    EntryList *right_ = nullptr;
};

} // namespace kareport
