#include "ServerDialog.h"

#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "ImportPanel.h"
#include "PrivatePostgres.h"
#include "Profile.h"
#include "SaveDialog.h"
#include "TemplateDialog.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QJsonDocument>
#include <QLabel>
#include <QLineEdit>
#include <QProgressDialog>
#include <QPushButton>
#include <QTableWidget>
#include <QTimer>

#include <gtest/gtest.h>

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <cstring>

// Tables of a PostgreSQL server are chosen from a list.

namespace
{

using kareport::ImportPanel;
using kareport::ServerDialog;
using kareport::TemplateDialog;

QByteArray pointsTemplate()
{
    const auto variable = [](int id, const char *name, const char *type) {
        return "<Variable><ID>" + QByteArray::number(id) + "</ID><VariableName>" + name + "</VariableName><Type>" +
               type + "</Type></Variable>";
    };
    const auto field = [](const char *name) {
        return QByteArray("<Field><VariableName>") + name + "</VariableName><Label>" + name +
               "</Label><Format>12.3</Format></Field>";
    };
    return "<ReportTemplate><Name>T</Name><Title>Points</Title><Tables><Table><Name>Points</Name>"
           "<Use>D</Use><OutputList>" +
           field("Number") + field("Northing") +
           "</OutputList></Table></Tables><Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>" +
           variable(1, "Number", "NUMBER") + variable(2, "Northing", "COORDINATE") +
           "</VariableList></Dictionary></Dictionaries></ReportTemplate>";
}

template <typename Widget>
Widget *named(const QWidget &window, const char *name)
{
    for (auto *widget : window.findChildren<Widget *>()) {
        if (widget->accessibleName() == QString::fromUtf8(name)) {
            return widget;
        }
    }
    ADD_FAILURE() << name;
    return nullptr;
}

QString messageOf(const QDialog &dialog)
{
    return dialog.findChild<QLabel *>(QStringLiteral("message"))->text();
}

QPushButton *okOf(const QDialog &dialog)
{
    return dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
}

/// A server that takes connections and never answers.
class DeafServer
{
public:
    DeafServer() : socket_(::socket(AF_UNIX, SOCK_STREAM, 0))
    {
        sockaddr_un address = {};
        address.sun_family = AF_UNIX;
        const QByteArray path = folder_.filePath(QStringLiteral(".s.PGSQL.5432")).toUtf8();
        std::memcpy(address.sun_path, path.constData(), static_cast<std::size_t>(path.size()));
        EXPECT_EQ(::bind(socket_, reinterpret_cast<const sockaddr *>(&address), sizeof address), 0);
        EXPECT_EQ(::listen(socket_, 5), 0);
    }
    ~DeafServer() { ::close(socket_); }
    DeafServer(const DeafServer &) = delete;
    DeafServer &operator=(const DeafServer &) = delete;

    QString connection() const { return QStringLiteral("host=%1 port=5432 dbname=d user=u").arg(folder_.path()); }

private:
    QTemporaryDir folder_{QStringLiteral("/tmp/ka-deaf-XXXXXX")};
    int socket_;
};

TEST(ServerDialog, HasAFieldForEachPartOfTheConnection)
{
    kareport::setProfileStore(kareport::makeMemoryProfile());
    const ServerDialog dialog(QStringLiteral("user=anna host=data.example dbname='lot 7' sslmode=require port=5433"));
    EXPECT_EQ(named<QLineEdit>(dialog, "Host")->text(), QStringLiteral("data.example"));
    EXPECT_EQ(named<QLineEdit>(dialog, "Port")->text(), QStringLiteral("5433"));
    EXPECT_EQ(named<QLineEdit>(dialog, "Database")->text(), QStringLiteral("lot 7"));
    EXPECT_EQ(named<QLineEdit>(dialog, "User")->text(), QStringLiteral("anna"));
    EXPECT_EQ(named<QLineEdit>(dialog, "More of the connection")->text(), QStringLiteral("sslmode=require"));
    EXPECT_EQ(dialog.connection(),
              QStringLiteral("host=data.example port=5433 dbname='lot 7' user=anna sslmode=require"));
    EXPECT_TRUE(okOf(dialog)->isEnabled());
    const ServerDialog empty{QString()};
    EXPECT_EQ(empty.connection(), QString());
    EXPECT_FALSE(okOf(empty)->isEnabled()) << "there is nothing to connect to";
}

TEST(ServerDialog, SaysWhyThereAreNoTables)
{
    ServerDialog dialog(QStringLiteral("host=/nowhere dbname=d"));
    dialog.show();
    dialog.accept();
    EXPECT_TRUE(dialog.isVisible());
    EXPECT_TRUE(messageOf(dialog).startsWith(QStringLiteral("The server cannot be connected to: ")))
        << messageOf(dialog).toStdString();
    named<QLineEdit>(dialog, "More of the connection")->setText(QStringLiteral("password=secret"));
    dialog.accept();
    EXPECT_TRUE(messageOf(dialog).contains(QStringLiteral("~/.pgpass"))) << messageOf(dialog).toStdString();
    EXPECT_FALSE(messageOf(dialog).contains(QStringLiteral("secret")));
    EXPECT_EQ(dialog.result(), 0);
}

TEST(ServerDialog, AServerThatDoesNotAnswerIsSaidSoonAndNeedNotBeWaitedFor)
{
    const DeafServer server;
    ServerDialog dialog(server.connection());
    dialog.show();
    QElapsedTimer time;
    time.start();
    dialog.accept();
    EXPECT_EQ(messageOf(dialog), QStringLiteral("The server does not answer"));
    EXPECT_LT(time.elapsed(), 12'000);
    EXPECT_TRUE(dialog.isVisible());

    QTimer cancelling;
    QObject::connect(&cancelling, &QTimer::timeout, &cancelling, [] {
        if (auto *progress = qobject_cast<QProgressDialog *>(QApplication::activeModalWidget())) {
            progress->findChild<QPushButton *>()->click();
        }
    });
    cancelling.start(50);
    time.restart();
    dialog.accept();
    EXPECT_EQ(messageOf(dialog), QStringLiteral("The server was not waited for."));
    EXPECT_LT(time.elapsed(), 4'500) << "before it is given up";
    EXPECT_TRUE(dialog.isVisible());
}

/// One server for all tests, as it takes a while to make.
class ServerImports : public testing::Test
{
protected:
    static void SetUpTestSuite() { server_ = std::make_unique<PrivatePostgres>(); }
    static void TearDownTestSuite() { server_.reset(); }
    void SetUp() override
    {
        kareport::setProfileStore(kareport::makeMemoryProfile());
        if (!server_->isRunning()) {
            GTEST_SKIP() << "no server: " << server_->reason();
        }
        server_->runSql("DROP SCHEMA public CASCADE; CREATE SCHEMA public;"
                        "CREATE TABLE control (number text, northing float8);"
                        "INSERT INTO control VALUES ('BM-1', 5000123.25), ('2', 400);"
                        "CREATE VIEW remarks AS SELECT number, 'n/a'::text AS northing, 7.5::float8 AS h FROM control");
        folder.put("t.xml", pointsTemplate());
    }
    void TearDown() override { kareport::setProfileStore(kareport::makeMemoryProfile()); }

    static PrivatePostgres &server() { return *server_; }
    /// Presses the button for a server, and answers its dialog as a user does. @return what the dialog has to say against it
    static QString chooseServer(const TemplateDialog &dialog, const QString &connection)
    {
        bool isAnswered = false;
        QString wrong;
        QTimer answering;
        QObject::connect(&answering, &QTimer::timeout, &answering, [&] {
            auto *asked = dynamic_cast<ServerDialog *>(QApplication::activeModalWidget());
            if (asked == nullptr || isAnswered) {
                return;
            }
            isAnswered = true;
            for (const char *name : {"Service", "Host", "Port", "Database", "User"}) {
                named<QLineEdit>(*asked, name)->clear();
            }
            named<QLineEdit>(*asked, "More of the connection")->setText(connection);
            okOf(*asked)->click();
            if (asked->isVisible()) {
                wrong = messageOf(*asked);
                asked->reject();
            }
        });
        answering.start(20);
        named<QPushButton>(dialog, "Choose a table of a database server")->click();
        EXPECT_TRUE(isAnswered);
        return wrong;
    }
    static ImportPanel &panel(const TemplateDialog &dialog) { return *dialog.findChild<ImportPanel *>(); }
    static void press(const TemplateDialog &dialog, const char *name, const char *item)
    {
        auto *box = named<QComboBox>(dialog, name);
        const int index = box->findText(QString::fromUtf8(item));
        ASSERT_GE(index, 0) << name << " has no " << item;
        for (int step = 0; box->currentIndex() != index && step < 20; ++step) {
            QTest::keyClick(box, box->currentIndex() < index ? Qt::Key_Down : Qt::Key_Up);
        }
    }

    JobFolder folder;

private:
    static inline std::unique_ptr<PrivatePostgres> server_;
};

TEST_F(ServerImports, ATableIsChosenFromTheListAndItsRowsAreShown)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    TemplateDialog dialog;
    dialog.setTemplateFile(folder.path("t.xml"));
    dialog.show();
    EXPECT_FALSE(okOf(dialog)->isEnabled());
    chooseServer(dialog, server().connection());
    EXPECT_EQ(named<QLineEdit>(dialog, "Data file")->text(), server().connection());
    const auto *tables = named<QComboBox>(dialog, "Table of the database");
    ASSERT_EQ(tables->count(), 2);
    EXPECT_EQ(tables->currentText(), QStringLiteral("public.control"));
    EXPECT_TRUE(tables->itemData(1, Qt::ToolTipRole).toString().contains(QStringLiteral("number, northing, h")));
    const QTableWidget &rows = panel(dialog).table();
    ASSERT_EQ(rows.columnCount(), 2);
    EXPECT_EQ(rows.item(1, 1)->text(), QStringLiteral("5000123.25"));
    EXPECT_EQ(messageOf(dialog), QString());
    EXPECT_TRUE(okOf(dialog)->isEnabled());
    const QJsonObject data = dialog.job().toJson().value(u"data").toObject().value(u"data").toObject();
    EXPECT_EQ(QJsonDocument(data).toJson(QJsonDocument::Compact).toStdString(),
              "{\"postgresql\":\"" + server().connection().toStdString() +
                  "\",\"query\":\"SELECT * FROM public.control\"}");
    ASSERT_TRUE(desk.frame->OpenTemplateJob(dialog.job()));
    EXPECT_TRUE(Desk::textOf(*Desk::reports().front()).contains(QStringLiteral("5000123.250")));

    press(dialog, "Table of the database", "public.remarks");
    ASSERT_EQ(rows.columnCount(), 3);
    EXPECT_NE(rows.item(1, 1)->background().style(), Qt::NoBrush) << "it does not fit";
    EXPECT_TRUE(messageOf(dialog).contains(QStringLiteral("n/a"))) << messageOf(dialog).toStdString();
    press(dialog, "Variable of the column h", "Northing");
    EXPECT_EQ(messageOf(dialog), QString());
    EXPECT_EQ(dialog.job().dataOptions.value(u"columns"), QJsonValue(QJsonObject{{"Northing", "h"}}));
    ASSERT_TRUE(desk.frame->OpenTemplateJob(dialog.job()));
    EXPECT_TRUE(Desk::textOf(*Desk::reports().back()).contains(QStringLiteral("7.500")));
}

TEST_F(ServerImports, TheNextTimeTheConnectionAndTheChoicesAreThere)
{
    {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path("t.xml"));
        EXPECT_EQ(chooseServer(dialog, server().connection()), QString());
        press(dialog, "Table of the database", "public.remarks");
        press(dialog, "Variable of the column h", "Northing");
        dialog.accept();
    }
    TemplateDialog dialog;
    EXPECT_EQ(named<QLineEdit>(dialog, "Data file")->text(), server().connection());
    EXPECT_FALSE(okOf(dialog)->isEnabled()) << "no server is asked before the user wants it";
    EXPECT_EQ(messageOf(dialog), QStringLiteral("Press Server to list the tables of this connection."));
    QString proposed;
    const auto ask = dialog.askServer;
    dialog.askServer = [&](const QString &connection) {
        proposed = connection;
        return ask(connection);
    };
    chooseServer(dialog, server().connection());
    EXPECT_EQ(proposed, server().connection());
    press(dialog, "Table of the database", "public.remarks");
    EXPECT_EQ(named<QComboBox>(dialog, "Variable of the column h")->currentText(), QStringLiteral("Northing"));

    // A file takes the place of the server, and the server that of the file.
    folder.put("p.csv", "Number,Northing\n1,2\n");
    dialog.setData(folder.path("p.csv"));
    EXPECT_EQ(dialog.job().dataKind, QStringLiteral("csv"));
    EXPECT_EQ(dialog.job().data, folder.path("p.csv"));
    dialog.setData(server().connection());
    EXPECT_EQ(dialog.job().dataKind, QStringLiteral("postgresql"));
    EXPECT_TRUE(okOf(dialog)->isEnabled());
}

TEST_F(ServerImports, ThePasswordIsNeitherInTheJobNorInTheProfile)
{
    TemplateDialog dialog;
    dialog.setTemplateFile(folder.path("t.xml"));
    const QString refused = chooseServer(dialog, server().connection() + QStringLiteral(" password=sesame"));
    EXPECT_TRUE(refused.contains(QStringLiteral("~/.pgpass"))) << refused.toStdString();
    EXPECT_EQ(named<QLineEdit>(dialog, "Data file")->text(), QString());
    // The user guarded has its password from the environment, as libpq reads it.
    server().runSql("GRANT USAGE ON SCHEMA public TO guarded; GRANT SELECT ON control TO guarded");
    qputenv("PGPASSWORD", "open sesame");
    EXPECT_EQ(chooseServer(dialog, server().guardedConnection()), QString());
    EXPECT_EQ(named<QComboBox>(dialog, "Table of the database")->count(), 1) << "what the user may read";
    dialog.accept();
    qunsetenv("PGPASSWORD");
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Last Template Data")), server().guardedConnection());
    EXPECT_FALSE(QJsonDocument(dialog.job().toJson()).toJson().contains("sesame"));
}

TEST_F(ServerImports, AJobOfATableIsSavedWithItsQuery)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    TemplateDialog dialog;
    dialog.setTemplateFile(folder.path("t.xml"));
    chooseServer(dialog, server().connection());
    ASSERT_TRUE(desk.frame->OpenTemplateJob(dialog.job()));
    EXPECT_EQ(desk.frame->OriginFile(Desk::reports().front()), folder.path("t.xml")) << "what proposals are made of";
    desk.frame->runs().askJobFile = [this](const kareport::SaveRequest &request) {
        EXPECT_EQ(request.fileName, QStringLiteral("t.json"));
        EXPECT_EQ(request.initialFolder, folder.path());
        return std::optional(folder.path("t.json"));
    };
    ASSERT_TRUE(desk.frame->OnCommand(kareport::saveAsJobCommand));
    const QJsonObject set =
        QJsonDocument::fromJson(folder.bytesOf("t.json")).object().value(u"data").toObject().value(u"data").toObject();
    EXPECT_EQ(set.value(u"postgresql").toString(), server().connection());
    EXPECT_EQ(set.value(u"query").toString(), QStringLiteral("SELECT * FROM public.control"));
}

} // namespace
