#pragma once

#include <QTimer>
#include <QWidget>

class CReportToolBar;
class UReportList;
class UReportWindowDlg;

namespace kareport
{

/// The content of a report window: its bar above its list.
class ReportWindowBody : public QWidget
{
public:
    explicit ReportWindowBody(UReportWindowDlg *window);

    /// The window is destroyed, or closed, before its body.
    void leaveWindow();

    CReportToolBar &toolBar() const { return *toolBar_; }
    UReportList &list() const { return *list_; }
    /// Puts bar and list to their places in an inside of this size.
    void arrange(int width, int height);
    /// Brings the buttons, and the mark on the window's caption, up to date.
    void updateCommands();

    QSize sizeHint() const override;
    bool eventFilter(QObject *watched, QEvent *event) override;

protected:
    void resizeEvent(QResizeEvent *event) override;
    void changeEvent(QEvent *event) override;
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    UReportWindowDlg *window_; ///< null once it has been destroyed
    CReportToolBar *toolBar_;
    UReportList *list_;
    QTimer updateTimer_;
};

} // namespace kareport
