#pragma once

#include "Job.h"

#include <QDialog>

class QComboBox;
class QDialogButtonBox;
class QLabel;
class QLineEdit;

namespace kareport
{

/// Asks for a template file, one of its templates, a table or block of it, and the data file to write through it. What was
/// chosen last time is there again.
class TemplateDialog : public QDialog
{
public:
    explicit TemplateDialog(QWidget *parent = nullptr);

    TemplateJob job() const;
    void setTemplateFile(const QString &path);
    void setData(const QString &path);
    void accept() override;

private:
    void browse(QLineEdit &field, const QString &title, const QString &filter);
    void readTemplates();
    void readOutputs();
    void check();

    QLineEdit *file_;
    QComboBox *template_;
    QComboBox *output_; ///< data: true for a block
    QLineEdit *data_;
    QLabel *message_;
    QString wrong_; ///< with the template file
    QDialogButtonBox *buttons_;
};

} // namespace kareport
