#pragma once

#include <QWidget>

#include <functional>

class QComboBox;
class QLabel;
class QSpinBox;
class QToolButton;

namespace kareport
{

/// The page or sheet that is shown, of how many, and the one before and after it: to go there.
class PageField : public QWidget
{
public:
    /// @param go  called with the page, from 1, that was chosen
    explicit PageField(std::function<void(int page)> go, QWidget *parent = nullptr);

    /// @param name  what is counted, such as "Page"
    void setPlace(const QString &name, int page, int pages);
    /// Nothing is called from now on.
    void leave() { go_ = {}; }
    QSpinBox &page() const { return *page_; }
    QToolButton &previous() const { return *previous_; }
    QToolButton &next() const { return *next_; }
    QLabel &pages() const { return *pages_; }

private:
    void choose(int page) const;

    std::function<void(int)> go_;
    QLabel *name_;
    QToolButton *previous_;
    QSpinBox *page_;
    QLabel *pages_;
    QToolButton *next_;
};

/// The zoom, to be chosen or typed.
class ZoomField : public QWidget
{
public:
    /// What is chosen instead of a percentage.
    enum Fit
    {
        FitWidth = -1,
        FitPage = -2
    };

    /// @param zoom  called with a percentage, or a `Fit`
    /// @param step  called with 1 for larger, -1 for smaller
    ZoomField(std::function<void(int percent)> zoom, std::function<void(int direction)> step,
              QWidget *parent = nullptr);

    /// @param offersFit  whether a sheet can be fitted to the window
    void setZoom(int percent, bool offersFit);
    /// Nothing is called from now on.
    void leave() { zoomed_ = stepped_ = {}; }
    QComboBox &zoom() const { return *zoom_; }
    QToolButton &smaller() const { return *smaller_; }
    QToolButton &larger() const { return *larger_; }

private:
    void choose(int index);
    void takeTyped();

    std::function<void(int)> zoomed_;
    std::function<void(int)> stepped_;
    QToolButton *smaller_;
    QComboBox *zoom_;
    QToolButton *larger_;
    int percent_ = 100;
};

} // namespace kareport
