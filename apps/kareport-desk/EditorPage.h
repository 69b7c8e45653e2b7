#pragma once

#include <QWidget>

class QCheckBox;
class QComboBox;
class QLabel;
class QPushButton;

namespace kareport
{

/// Asks whether reports are shown in a program of the user's choice, and which.
class EditorPage : public QWidget
{
public:
    EditorPage(bool usesEditor, const QString &editor, bool keepsReports, QWidget *parent = nullptr);

    bool usesEditor() const;
    /// The program's full path.
    QString editor() const;
    /// Whether a report cannot be closed while the program is open.
    bool keepsReports() const;
    /// Whether the choice can be used. Where it cannot, the page says so and leads to it.
    bool confirm();

private:
    void browse();
    void showKind();

    QCheckBox *uses_;
    QComboBox *editor_;
    QPushButton *browse_;
    QCheckBox *keeps_;
    QLabel *kind_;
};

} // namespace kareport
