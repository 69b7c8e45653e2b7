#pragma once

#include "EditableText.h"
#include "FileWatch.h"
#include "PreviewWorker.h"
#include "TemplateData.h"
#include "TemplateEdits.h"
#include "TemplateOutline.h"

#include <QDateTime>
#include <QMainWindow>
#include <QString>
#include <QTimer>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

class QAction;
class QComboBox;
class QLabel;
class QMenu;
class QPlainTextEdit;
class QToolBar;
class QTreeWidget;

namespace kareport
{

class TemplateFindBar;
class TemplatePage;
class TemplateTextEdit;

/// Edits a template file beside the first pages of its report.
class TemplateWindow : public QMainWindow
{
public:
    TemplateWindow();
    ~TemplateWindow() override;

    /// Reads a file. @return why it cannot be read, as the end of a sentence; empty when it was
    QString load(const QString &path);
    const QString &path() const { return path_; }
    /// Puts the cursor to a place of the text. @param line, column  from 1
    void goTo(qsizetype line, qsizetype column);
    /// Writes the file. @return whether it was written
    bool save();
    /// Sets what the pages are made with, and keeps that for the template.
    void setData(const TemplateData &data);
    const TemplateData &data() const { return data_; }
    /// Whether the pages are those of the text as it is, or the text is known to be broken.
    bool arePagesUpToDate() const { return shown_ == requested_; }
    /// The same of the remarks as well.
    bool isUpToDate() const { return arePagesUpToDate() && checked_ == requested_; }
    /// Brings the states of all commands up to date, and the reasons of those that cannot act.
    void updateCommands();

    TemplateTextEdit &edit() const { return *edit_; }
    TemplatePage &page() const { return *page_; }
    QTreeWidget &remarks() const { return *remarkList_; }
    QLabel &message() const { return *message_; }
    TemplateFindBar &findBar() const { return *findBar_; }
    QComboBox &dataChoice() const { return *dataChoice_; }

    // What asks the user; a test answers instead.
    std::function<std::optional<QString>()> askData;
    std::function<std::optional<QString>()> askOpen;
    std::function<std::optional<QString>()> askSaveName;
    std::function<std::optional<QString>(const QString &name)> askNewName; ///< of a variable

protected:
    void closeEvent(QCloseEvent *event) override;

private:
    struct WindowCommand
    {
        QAction *action;
        std::function<QString()> whyNot; ///< what keeps it from acting, as a sentence; null for what can always act
    };

    // TemplateWindowLayout.cpp
    void makeDialogs();
    void makeBody();
    QWidget *makeTextHalf();
    QWidget *makePageHalf();

    // TemplateWindowMenus.cpp
    void makeMenus();
    void addHelpMenu();
    void addFindCommands(QMenu &menu);
    void addCommand(QMenu &menu, const QString &text, std::function<void()> act, std::function<QString()> whyNot = {},
                    unsigned likeCommand = 0);
    void chooseCommand();
    QPlainTextEdit &readPart() const;
    QString whyNoEdit() const;
    void addFileMenu();
    void addEditMenu();
    void addInsertMenu();
    void addViewMenu();
    void turnFocus();

    // TemplateWindowFile.cpp
    QString read(const QString &path);
    bool saveAs();
    bool writeTo(const QString &path);
    bool mayDiscard();
    void fileChanged(const QString &path);
    void showTitle();
    void fillDataChoice();
    void chooseData(int index);
    void browseData();
    void takeDropped(const QStringList &files);
    TemplateData dataOfFile(const QString &file) const;

    void textChanged();
    void requestPages();
    void takeAnswer(PreviewWorker::Answer &answer);
    void showRemarks(const std::vector<TemplateRemark> &remarks);
    void showMessage(const QString &text);
    void cursorMoved();
    void showPlace();
    void stepRemark(int step);
    void carryOut(const EditedTemplate &edited);
    void renameVariable();
    TextRange shifted(const TextRange &range, const QString &from, const QString &to) const;

    QString path_;
    EditableText file_;
    QDateTime now_; ///< of reports that do not say theirs: the same as long as the window is open
    TemplateData data_;
    std::shared_ptr<const TemplateOutline> outline_ = std::make_shared<TemplateOutline>(); ///< of the text
    QString outlined_;                                                                     ///< the text that it is of
    QString pagesText_; ///< the text that the pages are of
    quint64 requested_ = 0;
    quint64 shown_ = 0;   ///< the request that the pages are of
    quint64 checked_ = 0; ///< the request that the remarks are of
    bool isLoading_ = false;

    TemplateTextEdit *edit_ = nullptr;
    TemplatePage *page_ = nullptr;
    TemplateFindBar *findBar_ = nullptr;
    QTreeWidget *remarkList_ = nullptr;
    QLabel *message_ = nullptr;
    QLabel *place_ = nullptr;
    QLabel *templateName_ = nullptr;
    QComboBox *dataChoice_ = nullptr;
    QToolBar *toolBar_ = nullptr;
    QTimer workingTimer_;
    FileWatch watch_;
    FileWatch dataWatch_;
    QString messageText_;
    std::unique_ptr<PreviewWorker> worker_;
    std::vector<WindowCommand> commands_;
};

} // namespace kareport
