#pragma once

#include "PieceLoader.h"
#include "ReportChange.h"
#include "RichTextReader.h"

#include <QElapsedTimer>
#include <QImage>
#include <QPlainTextEdit>
#include <QString>
#include <QTextBlock>

#include <functional>
#include <memory>
#include <optional>

namespace kareport
{

/// The text of a report in a control, plain or rich: shown, edited, zoomed.
///
/// It is a plain text control, which alone keeps up with reports of hundreds of thousands of lines. Formats of characters
/// are drawn; formats of paragraphs stay in its document, from which they are saved again.
class ReportEdit : public QPlainTextEdit
{
public:
    explicit ReportEdit(QWidget *parent = nullptr);
    ~ReportEdit() override;

    /// The font of what names none.
    void setReportFont(const QFont &font);

    /// Replaces the content, without an edit and without undo steps. The place of the cursor and of the window are kept as
    /// far as there is text.
    void loadPlainText(const QString &text);
    /// The same in pieces: its beginning at once, the rest from the event loop. Until all of it is there nothing can be
    /// edited, and a place beyond what has been loaded is kept for the end.
    /// @param loaded  called when all of it is there, or as much as the text still had; not when another text is loaded
    ///                first. It may load the text again
    void loadPlainTextInPieces(PiecedText text, std::function<void(bool isWhole)> loaded);
    bool isLoading() const { return loader_ != nullptr; }
    /// How much of the text has been loaded.
    int loadedPercent() const { return loader_ ? loader_->percent() : 100; }
    /// Sets how often the window follows a text that is being loaded, in milliseconds; at the end it always does.
    void setFollowInterval(qint64 milliseconds) { followInterval_ = milliseconds; }
    /// Loads at once what is missing.
    void finishLoading();
    /// Leaves the missing part out.
    void stopLoading();

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
    /// Called when more of the text has been loaded.
    void setLoadHandler(std::function<void()> handler) { loading_ = std::move(handler); }
    /// Draws a line before each line of the text that begins a page. @param pageOf  the page that a line, from 0, begins; 0
    /// where it begins none. Empty for no lines
    void setPageBeginnings(std::function<int(int line)> pageOf);
    /// Makes an edit that was made elsewhere. The handler of edits is not called.
    /// @return false, changing nothing, when the control does not hold the text that the edit was made in
    bool applyChange(const ReportChange &change);

    /// The whole text, its lines ended by CR LF. The missing part is loaded first.
    QString windowText();
    /// As the control's own, after all of the text has been loaded.
    void selectAll();
    /// As the control's own. Where there is no memory for a copy, the clipboard and the text stay as they are, and this is
    /// said.
    void copy();
    void cut();
    /// The line at the top of the window, from 0.
    int firstVisibleLine() const { return firstVisibleBlock().blockNumber(); }
    qint64 windowTextLength() const { return qint64(length_) + lineEnds_; }

    /// Where the cursor and the window are in lines and columns, from 0: another text of the same lines has the same places.
    struct LinePlace
    {
        int anchorLine = 0; ///< the other end of the selection
        int anchorColumn = 0;
        int line = 0;
        int column = 0;
        int top = 0; ///< of the scroll bars
        int left = 0;
    };
    LinePlace linePlace();
    /// Goes to such a place, as far as there is text: lines and columns beyond it become the last ones. What is missing of a
    /// text that is loaded in pieces is loaded at once up to there.
    void goToLinePlace(const LinePlace &place);
    /// Puts the cursor at the beginning of a line and shows it in the middle of the window.
    /// @param line  from 0; one beyond the text becomes the last one
    void goToLine(int line);

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
    void paintEvent(QPaintEvent *event) override;
    void insertFromMimeData(const QMimeData *source) override;
    /// Empty when there is no memory for it.
    QMimeData *createMimeDataFromSelection() const override;
    void contextMenuEvent(QContextMenuEvent *event) override;
    /// The selected text for other programs. @throws std::bad_alloc
    virtual std::unique_ptr<QMimeData> selection() const;

private:
    bool copySelection() const;

    /// Where the cursor and the window are.
    struct Place
    {
        int position;
        int top;
        int left;
    };

    Place place() const;
    /// Whether they wait for a place that has not been loaded yet.
    bool isWaiting() const;
    void goTo(const Place &place);
    void take(QTextDocument *loaded);
    void loadPiece();
    void loadToLine(int line);
    int positionOf(int line, int column) const;
    void endLoading();
    void watch();
    void noteEdit(int position, int removed, int added);
    void noteLength();
    void applyZoom();
    void drawPageLines(QPaintEvent &event);
    void keepGlyphs(int line, bool on);

    std::function<void(const ReportChange &)> edited_;
    std::function<void()> focused_;
    std::function<void()> zoomed_;
    std::function<void()> loading_;
    std::function<int(int)> pageBegunBy_;
    QMetaObject::Connection watching_;
    std::unique_ptr<PieceLoader> loader_;
    std::function<void(bool)> loaded_; ///< called when `loader_` has done
    Place wanted_ = {};                ///< where the window was before, which may not have been loaded yet
    int waiting_ = 0;                  ///< the cursor's position until then
    bool isScrolled_ = false;          ///< by the user, since loading began
    qint64 followInterval_ = 200;      ///< a few times a second: painting takes longer than loading a piece
    QElapsedTimer sinceShown_;         ///< since the window was last notified of a piece
    bool isFollowing_ = false;
    int length_ = 0;
    int lineEnds_ = 0;
    int keptLine_ = -1; ///< whose glyphs are kept, and those of the neighbouring lines
    int zoom_ = 100;
    int wheel_ = 0; ///< eighths of a degree turned since the last step
    QImage zoomDevice_;
};

/// Reports that there was no memory for a copy.
void sayNotCopied();

} // namespace kareport
