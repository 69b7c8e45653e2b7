#pragma once

#include "Steps.h"

#include <QObject>
#include <QPointer>
#include <QString>
#include <QStringList>
#include <QTimer>

#include <functional>
#include <vector>

class QDialog;
class QFileDialog;
class QMessageBox;

namespace monkey
{

/// A question that a message box asked, and the text of the button that answered it.
struct Answer
{
    QString question;
    int button = 0; ///< QMessageBox::StandardButton
};

/// Answers every window that keeps the user from the others, at random, from within the loop that the window runs.
class DialogAnswers : public QObject
{
public:
    DialogAnswers();

    /// What the answers of the next step are taken from.
    void begin(Chance chance) { chance_ = chance; }
    /// What was asked since the last call.
    std::vector<Answer> take();
    /// How many were asked since then.
    std::size_t count() const { return answers_.size(); }
    /// The last question that was asked since then; empty without one.
    QString last() const { return answers_.empty() ? QString() : answers_.back().question; }
    /// Answers what an open dialog asks for a file to read, or a name to save under.
    std::function<QString(Chance &, bool saves)> file;
    /// The file that the next dialog for one is answered with, whatever chance says; empty for none.
    QString nextFile;
    /// Whether each question is to be agreed to, as when reports come back after a crash.
    bool agrees = false;
    /// Windows that could not be closed, by their class and title.
    QStringList stuck;

private:
    void look();
    void answer(QDialog &dialog);
    void answerBox(QMessageBox &box);
    void answerFile(QFileDialog &dialog);
    void answerOther(QDialog &dialog);

    QTimer timer_;
    Chance chance_{0};
    QPointer<QWidget> last_;
    int looks_ = 0;
    std::vector<Answer> answers_;
};

} // namespace monkey
