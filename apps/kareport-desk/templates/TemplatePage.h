#pragma once

#include "TemplatePreview.h"

#include <QPlainTextEdit>

#include <functional>
#include <vector>

namespace kareport
{

/// The first pages of a report as it is printed, to be looked at: a value or a label leads to its field in the template.
class TemplatePage : public QPlainTextEdit
{
public:
    explicit TemplatePage(QWidget *parent = nullptr);

    /// Called when the user chooses what shows a field.
    std::function<void(const PreviewCell &cell)> chosen;

    void setPages(PreviewPages pages);
    const PreviewPages &pages() const { return pages_; }
    /// Marks all that shows a field. @param field  the element as the pages have it; none for nothing
    void mark(const TextRange &field);
    /// How many pieces are marked.
    qsizetype markedCount() const { return extraSelections().size(); }
    /// The piece at a position of the shown text; null where it shows no field.
    const PreviewCell *cellAt(int position) const;
    /// The position in the shown text of a place in the text of the pages.
    int positionOf(qint64 at) const;

protected:
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void paintEvent(QPaintEvent *event) override;
    void changeEvent(QEvent *event) override;

private:
    void showMarks();
    void choose(int position);

    PreviewPages pages_;
    std::vector<qint64> lineStarts_; ///< in the text of the pages
    TextRange field_;
};

} // namespace kareport
