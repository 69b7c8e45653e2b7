#pragma once

#include "KaReportExport.h"
#include "ReportChange.h"
#include "RichTextReader.h"

#include <QImage>
#include <QPlainTextEdit>
#include <QString>
#include <QTextBlock>

#include <functional>
#include <optional>

namespace kareport
{

/// The text of a report in a control, plain or rich: shown, edited, zoomed.
///
/// It is a plain text control, which alone keeps up with reports of hundreds of thousands of lines. Formats of characters
/// are drawn; formats of paragraphs stay in its document, from which they are saved again.
class KAREPORT_EXPORT ReportEdit : public QPlainTextEdit
{
public:
    explicit ReportEdit(QWidget *parent = nullptr);
    ~ReportEdit() override;

    /// The font of what names none.
    void setReportFont(const QFont &font);

    /// Replaces the content, without an edit and without undo steps. The place of the cursor and of the window are kept as
    /// far as there is text.
    void loadPlainText(const QString &text);
    /// @return what is wrong with the rich text; what was read up to there is shown
    std::optional<RichTextError> loadRichText(QStringView text);
    /// The same with a reader, which fills the document that it is given.
    std::optional<RichTextError>
    loadRichText(const std::function<std::optional<RichTextError>(QTextDocument &loaded)> &read);

    /// Called after every edit by the user.
    void setEditHandler(std::function<void(const ReportChange &change)> handler) { edited_ = std::move(handler); }
    /// Called when the control has got the keyboard.
    void setFocusHandler(std::function<void()> handler) { focused_ = std::move(handler); }
    /// Called when the zoom has changed.
    void setZoomHandler(std::function<void()> handler) { zoomed_ = std::move(handler); }
    /// Makes an edit that was made elsewhere. The handler of edits is not called.
    /// @return false, changing nothing, when the control does not hold the text that the edit was made in
    bool applyChange(const ReportChange &change);

    /// The whole text, its lines ended by CR LF.
    QString windowText() const;
    /// The line at the top of the window, from 0.
    int firstVisibleLine() const { return firstVisibleBlock().blockNumber(); }
    qint64 windowTextLength() const { return qint64(length_) + lineEnds_; }

    /// Percent of the size that the fonts name; printing and saving do not depend on it.
    int zoomPercent() const { return zoom_; }
    /// @param percent  brought into 25 to 500
    void setZoomPercent(int percent);
    /// The next larger or smaller of the usual steps.
    void zoomStep(int direction);

protected:
    bool event(QEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void insertFromMimeData(const QMimeData *source) override;

private:
    void take(QTextDocument *loaded);
    void watch();
    void noteEdit(int position, int removed, int added);
    void noteLength();
    void applyZoom();

    std::function<void(const ReportChange &)> edited_;
    std::function<void()> focused_;
    std::function<void()> zoomed_;
    QMetaObject::Connection watching_;
    bool isFollowing_ = false;
    int length_ = 0;
    int lineEnds_ = 0;
    int zoom_ = 100;
    int wheel_ = 0; ///< eighths of a degree turned since the last step
    QImage zoomDevice_;
};

} // namespace kareport
