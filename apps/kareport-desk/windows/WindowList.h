#pragma once

#include <QList>

#include <functional>

class QAction;
class QMenu;
class UDocument;

namespace kareport
{

/// The open reports at the end of a menu, with a mark at the one in front. It is filled again whenever the menu opens.
class WindowList
{
public:
    /// @param menu      outlives this
    /// @param activate  brings a report to the front
    WindowList(QMenu &menu, std::function<void(UDocument *report)> activate);

    /// @param inFront  null for none
    void fill(const UDocument *inFront);

private:
    QMenu &menu_;
    std::function<void(UDocument *report)> activate_;
    QList<QAction *> entries_;
};

} // namespace kareport
