#pragma once

#include <QObject>
#include <QSize>

class QWidget;

namespace kareport
{

/// A size that a window wants, not larger than the room on its screen.
QSize fittingSize(const QWidget &window, const QSize &wanted);

/// Makes dialogs that would be larger than the screen as large as the screen when they are shown.
class ScreenFit : public QObject
{
public:
    explicit ScreenFit(QObject &owner);

    bool eventFilter(QObject *watched, QEvent *event) override;
};

} // namespace kareport
