#pragma once

#include "SheetColumn.h"

#include <QWidget>

class QSplitter;

namespace kareport
{

class SheetThumbnails;
class SheetView;

/// The sheets of a report, and small pictures of them beside.
class SheetPane : public QWidget
{
public:
    explicit SheetPane(const SheetColumn::Source &source, QWidget *parent = nullptr);

    SheetView &view() const { return *view_; }
    SheetThumbnails &thumbnails() const { return *thumbnails_; }

    void setShowsThumbnails(bool on);
    bool showsThumbnails() const;
    void sheetsChanged();
    /// Shown where there are no sheets.
    void setMessage(const QString &message);
    /// Takes the sheets away from both.
    void leave();

private:
    QSplitter *splitter_;
    SheetThumbnails *thumbnails_;
    SheetView *view_;
};

} // namespace kareport
