#pragma once

#include "EditSpy.h"
#include "ModelledTemplate.h"
#include "ReportModel.h"
#include "ReportSteps.h"
#include "SavedReports.h"
#include "ViewComparison.h"

#include <QTemporaryDir>

/// A report with its views, together with its model.
class ModelledReport
{
public:
    /// @param clipboard  what was cut last, in any report
    explicit ModelledReport(QString &clipboard);
    ModelledReport(const ModelledReport &) = delete;
    ModelledReport &operator=(const ModelledReport &) = delete;

    /// @return what is wrong afterwards; empty when nothing is
    QString carryOut(const ReportStep &step);

    /// @return what is wrong with it, as after a step with another report; empty when nothing is
    QString compare();

    /// A text without its line ends and blanks: an image of it has fewer of the first, and more of the others.
    static QString inkOf(QString text);

private:
    UReportDoc &report() { return shown_.report; }

    /// A view of it. What it shows is another text than the report's while it was not notified of a change.
    struct Shown
    {
        UReportView *view;
        bool isHidden = false;
        bool isStale = false;
        bool isEdited = false; ///< in rich-text mode: it shows the report's text, others the image of what was written
    };

    void openView(bool inPieces) { views_.push_back({&shown_.open(inPieces)}); }

    /// The view that a user works in; null when all are hidden.
    Shown *visibleView(int number);

    void tellViews();

    static QString line(int seed);

    static QString data(int seed);

    bool setUpAsHost(const ReportStep &step);
    bool actUnseen(const ReportStep &step);
    void actAsHost(const ReportStep &step);

    /// What has nothing to do with a text: panes, and what happens by itself.
    void actOnPanes(const ReportStep &step);

    /// A host that does not tell the views.
    void writeUnseen(const ReportStep &step);

    /// Whatever needs the whole text does not wait for the pieces.
    void needAll(Shown &shown, int seed);

    /// Long enough to be loaded in pieces.
    static QString longText(int seed);

    void reload();

    /// A host loads a file at the end of the report.
    void load(const ReportStep &step);

    /// Saves that change nothing, but that the report is then as its file.
    void saveAlone();
    void saveRichText();

    /// A host opens the file that the report was saved in, which comes after what the report holds.
    void openSaved();
    /// Saves as rich text, loads that in place of the report, and looks at its pages. Then a user goes on with it, or the
    /// report's text is brought back.
    void reloadRichText(const ReportStep &step);
    /// A key in a view of rich text that was loaded, which may be undone.
    void typeIntoReloaded(Shown &shown, const ReportStep &step);
    /// @return what is wrong with rich text that was loaded in place of a text; empty when nothing is
    QString wrongWithRichText(const QString &before, const QStringList &pagesBefore);

    bool isAllCrLf() const;

    /// Writes lines and data. @return false for any other step
    bool writeAsHost(const ReportStep &step);
    /// Rich-text mode on, something written and typed, and off again: what was typed is then the report's text.
    void actInRichText(const ReportStep &step);
    void switchOn();
    void switchOff();

    /// A key in a view that shows the image of what was written: the report's text is then what the view shows.
    void typeIntoImage(Shown &shown, const ReportStep &step);

    void actAsUser(const ReportStep &step);

    /// A place in a text, all over it also where that is long.
    static int placeIn(int length, int number);

    void editInView(UReportView &view, const ReportStep &step);
    void actInView(Shown &shown, const ReportStep &step);

    static void putWholeLines(kareport::ReportEdit &edit, int from, int to, bool isWhole);

    QString compareReport(const QString &text);

    QString compareViews(const QString &text);

    ShownReport shown_;
    ModelledTemplate template_;
    ReportModel model_;
    std::vector<Shown> views_;
    QTemporaryDir folder_;
    QString &clip_;
    bool isRich_ = false; ///< rich-text mode is on
    QString image_;       ///< what was written since
    QString wrongSave_;
    bool isModified_ = false;
    bool wrongAnswer_ = false;
    bool canUndoExactly_ = false;
    std::size_t editsSeen_ = 0;
    QString beforeEdit_;
    std::vector<qint64> startsBeforeEdit_;
};
