#pragma once

#include <QObject>

class QTabBar;
class QWidget;

namespace kareport
{

/// Closes a report by a click on its tab with the middle button of the mouse, as the button of its window does.
class TabClosing : public QObject
{
public:
    /// @param frame  owns this object
    explicit TabClosing(QWidget &frame);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void closeTab(const QTabBar &tabs, int tab) const;

    QWidget &frame_;
    const QObject *pressed_ = nullptr; ///< the row of tabs in which the button went down
    int tab_ = -1;
};

} // namespace kareport
