#pragma once

#include "Job.h"
#include "LandXmlChoice.h"

#include <QDialog>

#include <memory>
#include <optional>

class UXmlReportTpl;
class QComboBox;
class QDialogButtonBox;
class QLabel;
class QLineEdit;
class QPushButton;

namespace kareport
{

class ImportPanel;

/// Asks for a template file, one of its templates, a table or block of it, and the data file to write through it: a text file
/// with how it is read, or LandXML with what is listed of it. What was chosen last time is offered again, for a text file what
/// was chosen for one of the same shape.
class TemplateDialog : public QDialog
{
public:
    explicit TemplateDialog(QWidget *parent = nullptr);
    ~TemplateDialog() override;

    TemplateJob job() const;
    void setTemplateFile(const QString &path);
    void setData(const QString &path);
    /// Takes a file for the data where its name or its content says that it is, and otherwise for the template file.
    void setFile(const QString &path);
    void accept() override;

private:
    QLayout *makeForm();
    void followFields();
    void chooseAsLastTime();
    void browse(QLineEdit &field, const QString &title, const QString &filter);
    void readTemplates();
    void readOutputs();
    void useOutput();
    void readData();
    bool readContents(const std::shared_ptr<const FileBytes> &file);
    void check();

    QLineEdit *file_;
    QComboBox *template_;
    QComboBox *output_; ///< data: true for a block
    QLineEdit *data_;
    std::optional<LandXmlChoice> landXml_;
    ImportPanel *import_;
    std::unique_ptr<UXmlReportTpl> tpl_; ///< that is chosen; null for none
    bool isLandXml_ = false;             ///< the data file is
    QLabel *message_;
    QString wrong_;     ///< with the template file
    QString wrongData_; ///< with the data file
    QDialogButtonBox *buttons_;
    QPushButton *edit_ = nullptr; ///< opens the template in its editor
};

} // namespace kareport
