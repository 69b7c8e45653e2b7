#pragma once

#include <QList>
#include <QString>

#include <functional>

class QAction;
class QMenu;
class UDocument;

namespace kareport
{

/// The open reports at the end of a menu, with a mark at the one in front, and the templates that are open in their editors. It
/// is filled again whenever the menu opens.
class WindowList
{
public:
    /// @param menu      outlives this
    /// @param activate  brings a report to the front
    WindowList(QMenu &menu, std::function<void(UDocument *report)> activate);

    /// @param inFront  null for none
    void fill(const UDocument *inFront);

private:
    QAction *add(const QString &name, bool isModified);

    QMenu &menu_;
    std::function<void(UDocument *report)> activate_;
    QList<QAction *> entries_; ///< with the lines between them
    qsizetype count_ = 0;      ///< of reports and templates
};

} // namespace kareport
