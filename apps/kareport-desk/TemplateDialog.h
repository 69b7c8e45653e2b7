#pragma once

#include "Job.h"
#include "LandXmlChoice.h"

#include <QDialog>

#include <functional>
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

class ImportDatabase;
class ImportPanel;
struct ServerTables;

/// Asks for a template file, one of its templates, a table or block of it, and the data file to write through it: a text file
/// with how it is read, a database with one of its tables, or LandXML with what is listed of it. In the place of a data file there
/// may be a database server. What was chosen last time is offered again, for a text file what
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

    /// Asks for a database server, beginning with a connection that may be empty; a test answers instead.
    std::function<std::optional<ServerTables>(const QString &connection)> askServer;

private:
    QLayout *makeForm();
    void followFields();
    void chooseAsLastTime();
    void browse(QLineEdit &field, const QString &title, const QString &filter);
    void readTemplates();
    void readOutputs();
    void useOutput();
    void readData();
    /// Shows what is in the file that the data field names.
    void readFile(const QString &path);
    void chooseServer();
    bool isServer() const;
    bool readContents(const std::shared_ptr<const FileBytes> &file);
    void check();

    QLineEdit *file_;
    QComboBox *template_;
    QComboBox *output_; ///< data: true for a block
    QLineEdit *data_;
    std::optional<LandXmlChoice> landXml_;
    ImportPanel *import_;
    std::shared_ptr<ImportDatabase> server_; ///< whose tables were listed last; null for none
    QString connection_;                     ///< to it
    std::unique_ptr<UXmlReportTpl> tpl_;     ///< that is chosen; null for none
    bool isLandXml_ = false;                 ///< the data file is
    QLabel *message_;
    QString wrong_;     ///< with the template file
    QString wrongData_; ///< with the data file
    QDialogButtonBox *buttons_;
    QPushButton *edit_ = nullptr; ///< opens the template in its editor
};

} // namespace kareport
