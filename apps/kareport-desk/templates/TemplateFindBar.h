#pragma once

#include "TemplateOutline.h"

#include <QWidget>

#include <array>
#include <vector>

class QCheckBox;
class QLabel;
class QLineEdit;
class QPushButton;

namespace kareport
{

class TemplateTextEdit;

/// The bar that finds and replaces texts in a template. It is hidden until it is opened.
class TemplateFindBar : public QWidget
{
public:
    /// @param edit  must live as long as the bar
    explicit TemplateFindBar(TemplateTextEdit &edit, QWidget *parent = nullptr);

    /// Shows the bar with the keyboard in its field, and what is selected within a line in it.
    void open();
    /// Hides the bar and gives the keyboard back to the text.
    void close();
    /// Goes to the next or the previous match, beginning again at the other end. @return whether there is one
    bool findNext();
    bool findPrevious();
    /// Replaces the match that is selected, and goes to the next one.
    void replace();
    /// Replaces all matches in one step that can be undone.
    void replaceAll();

    QLineEdit &field() const { return *field_; }
    QLineEdit &replacement() const { return *replacement_; }
    QCheckBox &matchCase() const { return *matchCase_; }
    QLabel &count() const { return *count_; }

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    std::vector<TextRange> matches() const;
    void showMatches();
    bool isSelected(const TextRange &match) const;

    TemplateTextEdit &edit_;
    QLineEdit *field_;
    QLineEdit *replacement_;
    QCheckBox *matchCase_;
    QLabel *count_;
    std::array<QPushButton *, 2> replaces_{}; ///< which need a text that can be edited
};

} // namespace kareport
