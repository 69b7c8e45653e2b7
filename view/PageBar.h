#pragma once

#include <QWidget>

#include <functional>

class QLabel;
class QSpinBox;

namespace kareport
{

/// The bar that asks for a page to go to. It is hidden until it is opened.
class PageBar : public QWidget
{
public:
    /// @param go     called with the page that was chosen
    /// @param leave  called when the bar is closed
    PageBar(std::function<void(int)> go, std::function<void()> leave, QWidget *parent = nullptr);

    void open(int page, int pages);
    void close();
    QSpinBox &page() const { return *page_; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    std::function<void(int)> go_;
    std::function<void()> leave_;
    QSpinBox *page_;
    QLabel *pages_;
};

} // namespace kareport
