#pragma once

#include "MatchCounter.h"
#include "TextSearch.h"

#include <QWidget>

#include <functional>

class QCheckBox;
class QLabel;
class QLineEdit;
class QToolButton;

namespace kareport
{

class ReportEdit;

/// The bar that finds a text in a report. It is hidden until it is opened.
class FindBar : public QWidget
{
public:
    /// @param edit  must live as long as the bar
    explicit FindBar(ReportEdit &edit, QWidget *parent = nullptr);

    /// Shows the bar with the keyboard in its field, and what is selected within a line in it.
    void open();
    /// Hides the bar and gives the keyboard back to the text.
    void close();
    /// Goes to the next or the previous match, from the end of the report on to its beginning.
    /// @return whether there is one
    bool findNext();
    bool findPrevious();

    /// What is looked for.
    const TextSearch &search() const { return search_; }
    /// Called when the bar was opened or closed.
    void setShownHandler(std::function<void()> handler) { shown_ = std::move(handler); }
    QLineEdit &field() const { return *field_; }
    QCheckBox &matchCase() const { return *matchCase_; }
    QCheckBox &wholeWord() const { return *wholeWord_; }
    QLabel &count() const { return *count_; }
    QToolButton &nextButton() const { return *next_; }
    QToolButton &previousButton() const { return *previous_; }
    QToolButton &closeButton() const { return *close_; }
    bool isCounting() const { return !counter_.isDone(); }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void hideEvent(QHideEvent *event) override;
    void showEvent(QShowEvent *event) override;

private:
    void searchChanged();
    void recount();
    void watchDocument();
    void showCount();
    bool select(const QTextBlock &block, qsizetype at);
    bool findFrom(int position);

    ReportEdit &edit_;
    QLineEdit *field_;
    QToolButton *previous_;
    QToolButton *next_;
    QCheckBox *matchCase_;
    QCheckBox *wholeWord_;
    QLabel *count_;
    QToolButton *close_;
    TextSearch search_;
    MatchCounter counter_;
    QTimer recountTimer_;
    std::function<void()> shown_;
};

} // namespace kareport
