#include "ServerDialog.h"

#include "ConnectionWords.h"
#include "PlainWidgets.h"
#include "Readable.h"
#include "StandardText.h"
#include "WorkAside.h"
#include "Xlate.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QIntValidator>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

#include <memory>
#include <new>

namespace kareport
{

ServerDialog::ServerDialog(const QString &connection, QWidget *parent)
    : QDialog(parent),
      service_(new QLineEdit),
      host_(new QLineEdit),
      port_(new QLineEdit),
      database_(new QLineEdit),
      user_(new QLineEdit),
      more_(new QLineEdit),
      message_(plainLabel()),
      buttons_(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel))
{
    setWindowTitle(Xlate("Tables of a PostgreSQL Server"));
    setWindowFlag(Qt::WindowContextHelpButtonHint, false);
    setProperty("guidePlace", QStringLiteral("guide-desk.md#databases"));
    auto *form = new QFormLayout;
    const auto addRow = [form](const QString &text, const QString &name, QLineEdit *field, const QString &example) {
        auto *label = plainLabel(text);
        label->setBuddy(field);
        field->setAccessibleName(name);
        field->setPlaceholderText(example);
        form->addRow(label, field);
    };
    addRow(Xlate("&Service:"), Xlate("Service"), service_,
           Xlate("an entry of ~/.pg_service.conf, or the fields below"));
    addRow(Xlate("&Host:"), Xlate("Host"), host_, QStringLiteral("localhost"));
    addRow(Xlate("&Port:"), Xlate("Port"), port_, QStringLiteral("5432"));
    addRow(Xlate("&Database:"), Xlate("Database"), database_, QString());
    addRow(Xlate("&User:"), Xlate("User"), user_, QString());
    addRow(Xlate("&More:"), Xlate("More of the connection"), more_, QStringLiteral("sslmode=require"));
    constexpr int largestPort = 65535;
    port_->setValidator(new QIntValidator(1, largestPort, port_));
    auto *note = plainLabel(Xlate("A password is read from your password file (~/.pgpass) or from PGPASSWORD. It is "
                                  "part of no job."));
    note->setWordWrap(true);
    makeQuiet(*note);
    message_->setObjectName(QStringLiteral("message"));
    message_->setAccessibleName(Xlate("Why there are no tables"));
    message_->setWordWrap(true);
    message_->hide();
    buttons_->button(QDialogButtonBox::Ok)->setText(Xlate("&List Tables"));
    auto *layout = new QVBoxLayout(this);
    layout->addLayout(form);
    layout->addWidget(note);
    layout->addWidget(message_);
    layout->addStretch();
    layout->addWidget(buttons_);
    constexpr int usualWidth = 480;
    resize(usualWidth, sizeHint().height());

    for (QLineEdit *field : {service_, host_, port_, database_, user_, more_}) {
        connect(field, &QLineEdit::textChanged, this, [this] { check(); });
    }
    connect(buttons_, &QDialogButtonBox::accepted, this, &ServerDialog::accept);
    connect(buttons_, &QDialogButtonBox::rejected, this, &ServerDialog::reject);
    fill(connection);
    check();
}

/// Puts the words of a connection into their fields.
void ServerDialog::fill(const QString &connection)
{
    const auto known = connectionWords(connection);
    if (!known) {
        more_->setText(connection); // whatever is wrong with it is said when it is used
        return;
    }
    ConnectionWords words = *known;
    service_->setText(words.take(QStringLiteral("service")));
    host_->setText(words.take(QStringLiteral("host")));
    port_->setText(words.take(QStringLiteral("port")));
    database_->setText(words.take(QStringLiteral("dbname")));
    user_->setText(words.take(QStringLiteral("user")));
    more_->setText(connectionOf(words));
}

QString ServerDialog::connection() const
{
    const auto text = [](const QLineEdit *field) { return field->text().trimmed(); };
    const ConnectionWords words = {{QStringLiteral("service"), text(service_)},
                                   {QStringLiteral("host"), text(host_)},
                                   {QStringLiteral("port"), text(port_)},
                                   {QStringLiteral("dbname"), text(database_)},
                                   {QStringLiteral("user"), text(user_)}};
    return (connectionOf(words) + u' ' + text(more_)).trimmed();
}

void ServerDialog::check()
{
    buttons_->button(QDialogButtonBox::Ok)->setEnabled(!connection().isEmpty());
}

void ServerDialog::say(const QString &text)
{
    QString shown = text;
    if (!shown.isEmpty()) {
        shown[0] = shown[0].toUpper(); // an error is the end of a sentence
    }
    message_->setText(shown);
    message_->setVisible(!shown.isEmpty());
    layout()->activate();
    resize(width(), qMax(height(), sizeHint().height()));
}

void ServerDialog::accept()
{
    const QString wanted = connection();
    if (wanted.isEmpty()) {
        return;
    }
    const auto read = std::make_shared<Expected<std::vector<PostgresTable>>>();
    // The connection may have a password in it, which is then refused: it is not shown.
    const bool isDone =
        doAside(Xlate("Listing the tables of the server"), UserInput::Kept, [read, wanted](AsideState &state) {
            state.setPercent(-1); // nobody knows how long it takes
            try {
                *read = postgresTables(wanted, [&state] { return state.isStopped(); });
            } catch (const std::bad_alloc &) {
                *read = InputError{QString(), std::nullopt, noMemoryText()};
            }
        });
    if (!isDone) {
        say(Xlate("The server was not waited for."));
        return;
    }
    if (const InputError *wrong = errorOf(*read)) {
        say(wrong->text);
        return;
    }
    tables_ = {wanted, std::get<std::vector<PostgresTable>>(*read)};
    if (tables_.tables.empty()) {
        say(Xlate("The database has no table that this user may read."));
        return;
    }
    QDialog::accept();
}

} // namespace kareport
