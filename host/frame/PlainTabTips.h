#pragma once

#include <QObject>

class QMainWindow;

namespace kareport
{

/// Shows the titles of docked windows literally in the tool tips of their tabs, which Qt makes of the titles and would
/// show as HTML.
class PlainTabTips : public QObject
{
public:
    /// @param frame  owns this object
    explicit PlainTabTips(QMainWindow &frame);

    bool eventFilter(QObject *watched, QEvent *event) override;
};

} // namespace kareport
