#include "StandardText.h"
#include "TemplateDialog.h"

#include "ConnectionWords.h"
#include "DictionaryVariables.h"
#include "ImportGuess.h"
#include "ImportPanel.h"
#include "ServerDialog.h"
#include "SqlitePreview.h"
#include "TemplateNames.h"
#include "TemplateSource.h"
#include "UXmlReportTpl.h"
#include "WorkAside.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFileInfo>
#include <QLabel>
#include <QLayout>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>

#include <algorithm>
#include <new>
#include <utility>

namespace kareport
{

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
    {
        const QSignalBlocker blocker(output_);
        output_->clear();
        tpl_ = std::make_unique<UXmlReportTpl>();
        if (template_->currentIndex() >= 0 && tpl_->LoadTemplate(file_->text(), template_->currentData().toString())) {
            QStringList names;
            tpl_->GetAllTables(names);
            for (const QString &name : names) {
                output_->addItem(name, false);
            }
            tpl_->GetAllBlocks(names);
            for (const QString &name : names) {
                output_->addItem(name, true);
            }
        }
        output_->setCurrentIndex(qMax(output_->count() > 0 ? 0 : -1, output_->findText(chosen)));
    }
    useOutput();
}

/// Tells the import which variables the table or block can show.
void TemplateDialog::useOutput()
{
    const QString name = output_->currentText();
    const bool isBlock = output_->currentData().toBool();
    const sXmlReportTable *table = output_->currentIndex() >= 0 && !isBlock ? tpl_->GetTable(name) : nullptr;
    const sXmlReportBlock *block = output_->currentIndex() >= 0 && isBlock ? tpl_->GetBlock(name) : nullptr;
    const QString dictionary = table != nullptr ? table->Use : block != nullptr ? block->Use : QString();
    if (tpl_->GetDictionary(dictionary) == nullptr) {
        import_->setVariables({});
    } else {
        import_->setVariables(
            [tpl = tpl_.get(), dictionary](const DataUnits &units) { return variablesOf(*tpl, dictionary, units); });
    }
    check();
}

/// Shows what the data field names: a file, or a database server whose tables were listed.
void TemplateDialog::readData()
{
    isLandXml_ = false;
    wrongData_.clear();
    if (isServer()) {
        import_->setDatabase(server_);
    } else if (QFileInfo(data_->text()).isFile()) { // a pipe or a device might never end
        readFile(data_->text());
    } else {
        import_->setFile(nullptr);
        if (isLikeConnection(data_->text())) {
            wrongData_ = Xlate("Press Server to list the tables of this connection.");
        }
    }
    if (!isLandXml_) {
        landXml_->clear();
    }
    check();
    layout()->activate();
    resize(width(), qMax(height(), sizeHint().height()));
}

void TemplateDialog::readFile(const QString &path)
{
    const auto file = FileBytes::open(path);
    const auto *opened = std::get_if<std::shared_ptr<const FileBytes>>(&file);
    if (opened != nullptr && isSqlite((*opened)->view())) {
        import_->setDatabase(sqliteImport(QFileInfo(path).absoluteFilePath()));
        return;
    }
    const bool isXml = opened != nullptr && isLandXml(*opened);
    isLandXml_ = isXml && readContents(*opened);
    import_->setFile(isXml || opened == nullptr ? nullptr : beginOfText(*opened));
}

/// Whether the data is that of a server whose tables are listed.
bool TemplateDialog::isServer() const
{
    return server_ != nullptr && data_->text() == connection_;
}

void TemplateDialog::chooseServer()
{
    auto chosen = askServer(isLikeConnection(data_->text()) ? data_->text() : connection_);
    if (!chosen) {
        return;
    }
    connection_ = chosen->connection;
    server_ = postgresImport(connection_, std::move(chosen->tables));
    if (data_->text() == connection_) {
        readData();
    } else {
        data_->setText(connection_);
    }
}

/// Reads the names in a LandXML file. @return whether there is something to choose
bool TemplateDialog::readContents(const std::shared_ptr<const FileBytes> &file)
{
    const auto read = std::make_shared<Expected<LandXmlContents>>();
    const bool isDone = doAside(Xlate("Reading %1").arg(QFileInfo(file->path()).fileName()), UserInput::Kept,
                                [file, read](AsideState &state) {
                                    const std::size_t size = std::max<std::size_t>(1, file->view().size());
                                    try {
                                        *read = readLandXmlContents(file, [&](std::size_t done) {
                                            state.setPercent(static_cast<int>(done * 100 / size));
                                            return !state.isStopped();
                                        });
                                    } catch (const std::bad_alloc &) {
                                        *read = InputError{file->path(), std::nullopt, noMemoryText()};
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
    if (message.isEmpty()) {
        message = wrongData_;
    }
    if (message.isEmpty() && !isServer() && !data_->text().isEmpty() && !QFileInfo(data_->text()).isFile()) {
        message = Xlate("There is no data file \"%1\".").arg(data_->text());
    }
    const bool canRun = message.isEmpty();
    if (message.isEmpty()) {
        message = import_->problem(); // the run says it as well, should the user want to see it
    }
    if (!message.isEmpty()) {
        message[0] = message[0].toUpper(); // the error of a file is the end of a sentence
    }
    message_->setText(message);
    if (edit_ != nullptr) {
        edit_->setEnabled(QFileInfo(file_->text()).isFile());
    }
    buttons_->button(QDialogButtonBox::Ok)
        ->setEnabled(canRun && output_->currentIndex() >= 0 && !data_->text().isEmpty());
}

} // namespace kareport
