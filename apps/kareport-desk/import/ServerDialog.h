#pragma once

#include "PostgresPreview.h"

#include <QDialog>
#include <QString>

#include <vector>

class QDialogButtonBox;
class QLabel;
class QLineEdit;

namespace kareport
{

/// A connection to a database server, with the tables that it gives.
struct ServerTables
{
    QString connection; ///< as a job has it; never with a password
    std::vector<PostgresTable> tables;
};

/// Asks for the connection to a PostgreSQL server and lists its tables. The dialog stays open, and says why, until the server has
/// answered. A password is not asked for: it comes from the user's password file or environment.
class ServerDialog : public QDialog
{
public:
    /// @param connection  that is proposed; empty for none
    explicit ServerDialog(const QString &connection, QWidget *parent = nullptr);

    /// The connection that the fields say.
    QString connection() const;
    /// What the server has answered, once the dialog is accepted.
    const ServerTables &tables() const { return tables_; }
    /// Lists the tables. While the server is asked, the user can stop it.
    void accept() override;

private:
    void fill(const QString &connection);
    void check();
    void say(const QString &text);

    QLineEdit *service_;
    QLineEdit *host_;
    QLineEdit *port_;
    QLineEdit *database_;
    QLineEdit *user_;
    QLineEdit *more_;
    QLabel *message_;
    QDialogButtonBox *buttons_;
    ServerTables tables_;
};

} // namespace kareport
