#include "TemplateDialog.h"

#include "FileKind.h"
#include "Folders.h"
#include "ImportPanel.h"
#include "OpenTemplate.h"
#include "PlainWidgets.h"
#include "Profile.h"
#include "ServerDialog.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QFileInfo>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QJsonDocument>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

#include <initializer_list>

namespace kareport
{

namespace
{

const QString fileEntry = QStringLiteral("Last Template File");
const QString nameEntry = QStringLiteral("Last Template");
const QString outputEntry = QStringLiteral("Last Template Output");
const QString dataEntry = QStringLiteral("Last Template Data");
const QString landXmlEntry = QStringLiteral("Last Template List"); // as in a job

QHBoxLayout *withButtons(QLineEdit *field, std::initializer_list<QPushButton *> buttons)
{
    auto *row = new QHBoxLayout;
    row->addWidget(field, 1);
    for (QPushButton *button : buttons) {
        row->addWidget(button);
    }
    return row;
}

} // namespace

TemplateDialog::TemplateDialog(QWidget *parent)
    : QDialog(parent),
      file_(new QLineEdit),
      template_(new QComboBox),
      output_(new QComboBox),
      data_(new QLineEdit),
      import_(new ImportPanel),
      message_(plainLabel()),
      buttons_(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel))
{
    setWindowTitle(Xlate("Report from Template"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    file_->setAccessibleName(Xlate("Template file"));
    template_->setAccessibleName(Xlate("Template"));
    output_->setAccessibleName(Xlate("Table or block"));
    data_->setAccessibleName(Xlate("Data file"));
    message_->setWordWrap(true);
    message_->setObjectName(QStringLiteral("message"));
    edit_ = buttons_->addButton(Xlate("&Edit Template"), QDialogButtonBox::ActionRole);

    auto *layout = new QVBoxLayout(this);
    layout->addLayout(makeForm());
    layout->addWidget(import_, 1);
    layout->addWidget(message_);
    layout->addStretch();
    layout->addWidget(buttons_);
    import_->setFile(nullptr);
    constexpr int usualWidth = 560;
    resize(usualWidth, sizeHint().height());
    followFields();
    chooseAsLastTime();
    check();
}

QLayout *TemplateDialog::makeForm()
{
    auto *browseFile = new QPushButton(Xlate("Bro&wse..."));
    browseFile->setAccessibleName(Xlate("Choose a template file"));
    auto *browseData = new QPushButton(Xlate("Brow&se..."));
    browseData->setAccessibleName(Xlate("Choose a data file"));
    auto *browseServer = new QPushButton(Xlate("Ser&ver..."));
    browseServer->setAccessibleName(Xlate("Choose a table of a database server"));
    browseServer->setToolTip(Xlate("Tables of a PostgreSQL server"));
    auto *form = new QFormLayout;
    const auto addRow = [form](const QString &text, QWidget *buddy, auto *row) {
        auto *label = plainLabel(text);
        label->setBuddy(buddy);
        form->addRow(label, row);
    };
    addRow(Xlate("&File:"), file_, withButtons(file_, {browseFile}));
    addRow(Xlate("&Template:"), template_, template_);
    addRow(Xlate("Table or &block:"), output_, output_);
    addRow(Xlate("&Data:"), data_, withButtons(data_, {browseData, browseServer}));
    landXml_.emplace(*form);
    connect(browseFile, &QPushButton::clicked, this,
            [this] { browse(*file_, Xlate("Choose a template file"), Xlate("Templates (*.xml);;All files (*)")); });
    connect(browseData, &QPushButton::clicked, this, [this] {
        browse(*data_, Xlate("Choose a data file"),
               Xlate("Data (*.csv *.txt *.xml *.landxml *.gpkg *.sqlite *.db);;All files (*)"));
    });
    connect(browseServer, &QPushButton::clicked, this, [this] { chooseServer(); });
    return form;
}

void TemplateDialog::followFields()
{
    import_->setChangedHandler([this] { check(); });
    askServer = [this](const QString &connection) -> std::optional<ServerTables> {
        ServerDialog dialog(connection, this);
        return dialog.exec() == QDialog::Accepted ? std::optional(dialog.tables()) : std::nullopt;
    };
    connect(file_, &QLineEdit::textChanged, this, &TemplateDialog::readTemplates);
    connect(template_, &QComboBox::currentIndexChanged, this, &TemplateDialog::readOutputs);
    connect(output_, &QComboBox::currentIndexChanged, this, &TemplateDialog::useOutput);
    connect(data_, &QLineEdit::textChanged, this, &TemplateDialog::readData);
    connect(edit_, &QPushButton::clicked, this, [this] {
        const QString path = file_->text();
        reject();
        openTemplateAt(path);
    });
    connect(buttons_, &QDialogButtonBox::accepted, this, &TemplateDialog::accept);
    connect(buttons_, &QDialogButtonBox::rejected, this, &TemplateDialog::reject);
}

void TemplateDialog::chooseAsLastTime()
{
    file_->setText(GetProfileString(QString(), fileEntry));
    template_->setCurrentIndex(qMax(0, template_->findData(GetProfileString(QString(), nameEntry))));
    output_->setCurrentIndex(qMax(0, output_->findText(GetProfileString(QString(), outputEntry))));
    data_->setText(GetProfileString(QString(), dataEntry));
    landXml_->choose(QJsonDocument::fromJson(GetProfileString(QString(), landXmlEntry).toUtf8()).object());
}

TemplateDialog::~TemplateDialog() = default;

TemplateJob TemplateDialog::job() const
{
    TemplateJob job;
    job.templateFile = QFileInfo(file_->text()).absoluteFilePath();
    job.templateName = template_->currentData().toString();
    (output_->currentData().toBool() ? job.block : job.table) = output_->currentText();
    job.data = isServer() ? connection_ : QFileInfo(data_->text()).absoluteFilePath();
    if (isLandXml_) {
        job.dataKind = QStringLiteral("landxml");
        job.dataOptions = landXml_->keys();
    } else {
        job.dataKind = import_->dataKind();
        job.dataOptions = import_->options();
    }
    return job;
}

void TemplateDialog::setTemplateFile(const QString &path)
{
    file_->setText(path);
}

void TemplateDialog::setData(const QString &path)
{
    data_->setText(path);
}

void TemplateDialog::setFile(const QString &path)
{
    if (isDataName(path)) {
        data_->setText(path);
        return;
    }
    const auto file = FileBytes::open(path);
    const auto *opened = std::get_if<std::shared_ptr<const FileBytes>>(&file);
    (opened != nullptr && isLandXml(*opened) ? data_ : file_)->setText(path);
}

void TemplateDialog::browse(QLineEdit &field, const QString &title, const QString &filter)
{
    const QString path = QFileDialog::getOpenFileName(this, title, field.text(), filter);
    if (!path.isEmpty()) {
        field.setText(path);
    }
}

void TemplateDialog::accept()
{
    WriteProfileString(QString(), fileEntry, file_->text());
    WriteProfileString(QString(), nameEntry, template_->currentData().toString());
    WriteProfileString(QString(), outputEntry, output_->currentText());
    WriteProfileString(QString(), dataEntry, data_->text());
    if (isLandXml_) {
        WriteProfileString(QString(), landXmlEntry,
                           QString::fromUtf8(QJsonDocument(landXml_->keys()).toJson(QJsonDocument::Compact)));
    }
    import_->remember();
    QDialog::accept();
}

} // namespace kareport
