#pragma once

#include "TemplateOutline.h"

#include <QPlainTextEdit>
#include <QStringListModel>

#include <functional>
#include <vector>

class QCompleter;

namespace kareport
{

class TemplateHighlighter;

/// A remark on a template's text, where the text has it.
struct RemarkMark
{
    TextRange range;
    bool isError = false;
    QString text;
};

/// The text of a template: coloured, with line numbers, remarks in the margin and under the words, and completion.
class TemplateTextEdit : public QPlainTextEdit
{
public:
    explicit TemplateTextEdit(QWidget *parent = nullptr);

    /// The text, its lines ended by LF, unlike `toPlainText` with all its characters.
    QString wholeText() const;
    /// Replaces the piece that another text differs in, in one step that can be undone, and selects a piece of it.
    void replaceBy(const QString &text, const TextRange &selection);
    /// Puts the cursor to a place and shows it.
    void select(const TextRange &range);

    void setRemarks(std::vector<RemarkMark> remarks);
    const std::vector<RemarkMark> &remarks() const { return remarks_; }
    /// The remark that a position is in; null where there is none.
    const RemarkMark *remarkAt(qsizetype position) const;
    /// Marks the field that the cursor is in.
    void setField(const TextRange &field);
    /// Marks what is found.
    void setFound(const std::vector<TextRange> &found);
    /// Offers what can be written at the cursor. @param always  also where nothing has been written of it yet
    void complete(bool always);
    QCompleter &completer() const { return *completer_; }

protected:
    void keyPressEvent(QKeyEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;
    void changeEvent(QEvent *event) override;
    bool event(QEvent *event) override;
    bool viewportEvent(QEvent *event) override;

private:
    class Margin;

    int marginWidth() const;
    void placeMargin();
    void paintMargin(QPaintEvent &event);
    void showMarks();
    void insertCompletion(const QString &word);
    void breakLine();

    Margin *margin_;
    QCompleter *completer_;
    QStringListModel words_;
    TemplateHighlighter *highlighter_ = nullptr;
    std::vector<RemarkMark> remarks_;
    std::vector<TextRange> found_;
    TextRange field_;
};

} // namespace kareport
