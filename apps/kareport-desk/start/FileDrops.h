#pragma once

#include <QObject>
#include <QStringList>

#include <functional>

class QMimeData;

namespace kareport
{

/// The files of this machine in what is dragged.
QStringList droppedFiles(const QMimeData &data);

/// Takes files that are dropped anywhere in the windows of a frame: on a report, on the start page or on a pane that floats.
class FileDrops : public QObject
{
public:
    /// @param frame  owns this object
    /// @param drop   called with the files
    FileDrops(QWidget &frame, std::function<void(const QStringList &files)> drop);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool isOne(const QWidget *window) const;

    QWidget &frame_;
    std::function<void(const QStringList &files)> drop_;
};

} // namespace kareport
