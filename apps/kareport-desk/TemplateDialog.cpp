#include "TemplateDialog.h"

#include "Folders.h"
#include "PlainWidgets.h"
#include "Profile.h"
#include "TemplateNames.h"
#include "TemplateSource.h"
#include "UXmlReportTpl.h"
#include "WorkAside.h"
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

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

const QString fileEntry = QStringLiteral("Last Template File");
const QString nameEntry = QStringLiteral("Last Template");
const QString outputEntry = QStringLiteral("Last Template Output");
const QString dataEntry = QStringLiteral("Last Template Data");
const QString landXmlEntry = QStringLiteral("Last Template List"); // as in a job

QHBoxLayout *withButton(QLineEdit *field, QPushButton *button)
{
    auto *row = new QHBoxLayout;
    row->addWidget(field, 1);
    row->addWidget(button);
    return row;
}

} // namespace

TemplateDialog::TemplateDialog(QWidget *parent)
    : QDialog(parent),
      file_(new QLineEdit),
      template_(new QComboBox),
      output_(new QComboBox),
      data_(new QLineEdit),
      message_(plainLabel()),
      buttons_(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel))
{
    setWindowTitle(Xlate("Report from Template"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    auto *browseFile = new QPushButton(Xlate("Bro&wse..."));
    browseFile->setAccessibleName(Xlate("Choose a template file"));
    auto *browseData = new QPushButton(Xlate("Brow&se..."));
    browseData->setAccessibleName(Xlate("Choose a data file"));
    file_->setAccessibleName(Xlate("Template file"));
    template_->setAccessibleName(Xlate("Template"));
    output_->setAccessibleName(Xlate("Table or block"));
    data_->setAccessibleName(Xlate("Data file"));
    message_->setWordWrap(true);
    message_->setObjectName(QStringLiteral("message"));

    auto *form = new QFormLayout;
    const auto addRow = [form](const QString &text, QWidget *buddy, auto *row) {
        auto *label = plainLabel(text);
        label->setBuddy(buddy);
        form->addRow(label, row);
    };
    addRow(Xlate("&File:"), file_, withButton(file_, browseFile));
    addRow(Xlate("&Template:"), template_, template_);
    addRow(Xlate("Table or &block:"), output_, output_);
    addRow(Xlate("&Data:"), data_, withButton(data_, browseData));
    landXml_.emplace(*form);
    auto *layout = new QVBoxLayout(this);
    layout->addLayout(form);
    layout->addWidget(message_);
    layout->addStretch();
    layout->addWidget(buttons_);
    constexpr int usualWidth = 560;
    resize(usualWidth, sizeHint().height());

    connect(browseFile, &QPushButton::clicked, this,
            [this] { browse(*file_, Xlate("Choose a template file"), Xlate("Templates (*.xml);;All files (*)")); });
    connect(browseData, &QPushButton::clicked, this, [this] {
        browse(*data_, Xlate("Choose a data file"), Xlate("Data (*.csv *.txt *.xml *.landxml);;All files (*)"));
    });
    connect(file_, &QLineEdit::textChanged, this, &TemplateDialog::readTemplates);
    connect(template_, &QComboBox::currentIndexChanged, this, &TemplateDialog::readOutputs);
    connect(data_, &QLineEdit::textChanged, this, &TemplateDialog::readData);
    connect(buttons_, &QDialogButtonBox::accepted, this, &TemplateDialog::accept);
    connect(buttons_, &QDialogButtonBox::rejected, this, &TemplateDialog::reject);

    file_->setText(GetProfileString(QString(), fileEntry));
    template_->setCurrentIndex(qMax(0, template_->findData(GetProfileString(QString(), nameEntry))));
    output_->setCurrentIndex(qMax(0, output_->findText(GetProfileString(QString(), outputEntry))));
    data_->setText(GetProfileString(QString(), dataEntry));
    landXml_->choose(QJsonDocument::fromJson(GetProfileString(QString(), landXmlEntry).toUtf8()).object());
    check();
}

TemplateJob TemplateDialog::job() const
{
    TemplateJob job;
    job.templateFile = QFileInfo(file_->text()).absoluteFilePath();
    job.templateName = template_->currentData().toString();
    (output_->currentData().toBool() ? job.block : job.table) = output_->currentText();
    job.data = QFileInfo(data_->text()).absoluteFilePath();
    if (isLandXml_) {
        job.dataKind = QStringLiteral("landxml");
        job.dataOptions = landXml_->keys();
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

void TemplateDialog::readTemplates()
{
    const QString chosen = template_->currentData().toString();
    template_->clear();
    wrong_.clear();
    if (!file_->text().isEmpty()) {
        const auto file = readTemplateSource(file_->text());
        if (const InputError *error = errorOf(file)) {
            wrong_ = error->text;
        } else {
            for (const sXmlReportTemplateInfo &info : templateInfos(std::get<TemplateFile>(file))) {
                template_->addItem(info.Title.isEmpty() ? info.Name : info.Name + QStringLiteral(" – ") + info.Title,
                                   info.Name);
            }
            if (template_->count() == 0) {
                wrong_ = whyNotLoaded(file_->text(), std::get<TemplateFile>(file), QString()).text;
            }
        }
    }
    template_->setCurrentIndex(qMax(template_->count() > 0 ? 0 : -1, template_->findData(chosen)));
    readOutputs();
}

void TemplateDialog::readOutputs()
{
    const QString chosen = output_->currentText();
    output_->clear();
    UXmlReportTpl tpl;
    if (template_->currentIndex() >= 0 && tpl.LoadTemplate(file_->text(), template_->currentData().toString())) {
        QStringList names;
        tpl.GetAllTables(names);
        for (const QString &name : names) {
            output_->addItem(name, false);
        }
        tpl.GetAllBlocks(names);
        for (const QString &name : names) {
            output_->addItem(name, true);
        }
    }
    output_->setCurrentIndex(qMax(output_->count() > 0 ? 0 : -1, output_->findText(chosen)));
    check();
}

/// Looks what the data file is.
void TemplateDialog::readData()
{
    isLandXml_ = false;
    wrongData_.clear();
    const QString path = data_->text();
    if (QFileInfo(path).isFile()) { // a pipe or a device might never end
        const auto file = FileBytes::open(path);
        if (const auto *opened = std::get_if<std::shared_ptr<const FileBytes>>(&file)) {
            isLandXml_ = isLandXml(*opened) && readContents(*opened);
        }
    }
    if (!isLandXml_) {
        landXml_->clear();
    }
    check();
    layout()->activate();
    resize(width(), qMax(height(), sizeHint().height()));
}

/// Reads the names in a LandXML file. @return whether there is something to choose
bool TemplateDialog::readContents(const std::shared_ptr<const FileBytes> &file)
{
    const auto read = std::make_shared<Expected<LandXmlContents>>();
    const bool isDone = doAside(
        Xlate("Reading %1").arg(QFileInfo(file->path()).fileName()), UserInput::Kept, [file, read](AsideState &state) {
            const std::size_t size = std::max<std::size_t>(1, file->view().size());
            try {
                *read = readLandXmlContents(file, [&](std::size_t done) {
                    state.setPercent(static_cast<int>(done * 100 / size));
                    return !state.isStopped();
                });
            } catch (const std::bad_alloc &) {
                *read = InputError{file->path(), std::nullopt, Xlate("there is not enough memory for it")};
            }
        });
    if (!isDone) {
        wrongData_ = Xlate("The data file was not read to its end.");
        return false;
    }
    if (const InputError *error = errorOf(*read)) {
        wrongData_ = error->message();
        return false;
    }
    landXml_->offer(std::get<LandXmlContents>(*read));
    if (!landXml_->hasList()) {
        wrongData_ = Xlate("The data file holds nothing that is listed.");
    }
    return landXml_->hasList();
}

void TemplateDialog::check()
{
    QString message = wrong_;
    if (message.isEmpty() && template_->currentIndex() >= 0 && output_->count() == 0) {
        message = Xlate("This template has neither a table nor a block.");
    }
    if (message.isEmpty() && !data_->text().isEmpty() && !QFileInfo(data_->text()).isFile()) {
        message = Xlate("There is no data file \"%1\".").arg(data_->text());
    }
    if (message.isEmpty()) {
        message = wrongData_;
    }
    if (!message.isEmpty()) {
        message[0] = message[0].toUpper(); // the error of a file is the end of a sentence
    }
    message_->setText(message);
    buttons_->button(QDialogButtonBox::Ok)
        ->setEnabled(message.isEmpty() && output_->currentIndex() >= 0 && !data_->text().isEmpty());
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
    QDialog::accept();
}

} // namespace kareport
