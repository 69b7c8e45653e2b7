#include "DeskActions.h"

#include "DeskFrame.h"
#include "ImportPanel.h"
#include "TemplateDialog.h"
#include "World.h"

#include <QAbstractButton>
#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFile>
#include <QJsonDocument>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTest>

#include <sqlite3.h>

namespace monkey
{

namespace
{

const QStringList &dataNames()
{
    static const QStringList names = {QStringLiteral("points.csv"), QStringLiteral("points.txt"),
                                      QStringLiteral("bare.txt"), QStringLiteral("wrong.csv"),
                                      QStringLiteral("points.sqlite")};
    return names;
}

void writeData(const QString &path, const QByteArray &content)
{
    QFile file(path);
    if (file.open(QIODevice::WriteOnly)) {
        file.write(content);
    }
}

QByteArray pointsTemplate()
{
    QByteArray fields;
    QByteArray variables;
    int id = 0;
    for (const char *name : {"Number", "Northing", "Easting", "Description"}) {
        const bool isText = qstrcmp(name, "Number") == 0 || qstrcmp(name, "Description") == 0;
        fields += QByteArray("\t\t\t\t<Field><VariableName>") + name + "</VariableName><Label>" + name +
                  "</Label><Format>" + (isText ? "10" : "12.3") + "</Format></Field>\n";
        variables += "\t\t\t\t<Variable><ID>" + QByteArray::number(++id) + "</ID><VariableName>" + name +
                     "</VariableName><Type>" + (isText ? "TEXT" : "COORDINATE") + "</Type></Variable>\n";
    }
    return "<ReportTemplate>\n\t<Name>P</Name>\n\t<Title>Points</Title>\n\t<Options><Separator>124</Separator></Options>\n\t<Tables>\n\t\t<Table>\n\t\t\t<Name>All</Name>"
           "<Use>D</Use>\n\t\t\t<OutputList>\n" +
           fields +
           "\t\t\t</OutputList>\n\t\t</Table>\n\t</Tables>\n\t<Blocks>\n\t\t<Block>\n\t\t\t<Name>First</Name>"
           "<Use>D</Use>\n\t\t\t<OutputList>\n" +
           fields +
           "\t\t\t</OutputList>\n\t\t</Block>\n\t</Blocks>\n\t<Dictionaries>\n\t\t<Dictionary>\n\t\t\t"
           "<DictionaryName>D</DictionaryName>\n\t\t\t<VariableList>\n" +
           variables + "\t\t\t</VariableList>\n\t\t</Dictionary>\n\t</Dictionaries>\n</ReportTemplate>\n";
}

void makeDatabase(const QString &path)
{
    sqlite3 *database = nullptr;
    if (sqlite3_open(path.toUtf8().constData(), &database) == SQLITE_OK) {
        sqlite3_exec(database,
                     "CREATE TABLE points (Number TEXT, Northing REAL, Easting REAL, Photo BLOB);"
                     "INSERT INTO points VALUES ('1', 2.5, 3, x'01'), ('2', NULL, 4, NULL);"
                     "CREATE TABLE others (Pt TEXT, North TEXT, Northing TEXT);"
                     "INSERT INTO others VALUES ('A', '7.5', 'n/a');"
                     "CREATE VIEW empty AS SELECT * FROM points WHERE 0;",
                     nullptr, nullptr, nullptr);
    }
    sqlite3_close(database);
}

QDir dataOf(const World &world)
{
    return QDir(world.folder().filePath(QStringLiteral("data")));
}

/// Uses one of the controls of an import as the keyboard does.
void useControl(const kareport::ImportPanel &panel, Chance &chance)
{
    QList<QWidget *> controls;
    for (QWidget *widget : panel.findChildren<QWidget *>()) {
        const bool isControl = qobject_cast<QComboBox *>(widget) != nullptr ||
                               qobject_cast<QCheckBox *>(widget) != nullptr ||
                               (qobject_cast<QLineEdit *>(widget) != nullptr &&
                                qobject_cast<QComboBox *>(widget->parentWidget()) == nullptr);
        if (isControl && widget->isVisible() && widget->isEnabled()) {
            controls.append(widget);
        }
    }
    if (controls.isEmpty()) {
        return;
    }
    QWidget *control = chance.of(controls);
    if (qobject_cast<QComboBox *>(control) != nullptr) {
        const Qt::Key key = chance.oneIn(2) ? Qt::Key_Down : Qt::Key_Up;
        for (int times = 1 + chance.below(4); times > 0; --times) {
            QTest::keyClick(control, key);
        }
    } else if (auto *box = qobject_cast<QCheckBox *>(control)) {
        box->click();
    } else if (chance.oneIn(3)) {
        QTest::keyClick(control, Qt::Key_Backspace);
    } else {
        QTest::keyClicks(control, QStringLiteral("PNEZD-").mid(chance.below(6), 1));
    }
}

} // namespace

void makePoints(const World &world)
{
    const QDir data = dataOf(world);
    if (data.exists()) {
        return;
    }
    world.folder().mkpath(QStringLiteral("data"));
    writeData(data.filePath(QStringLiteral("points.xml")), pointsTemplate());
    writeData(data.filePath(QStringLiteral("points.csv")), "Number,Northing,Easting,Height\n1,2.5,3,4\n2,3.5,4,5\n");
    writeData(data.filePath(QStringLiteral("points.txt")), "Pt;N;E\nA1;1000,5;3\nA2;2000,25;4\n");
    writeData(data.filePath(QStringLiteral("bare.txt")), "7|0.5|1\n8|2|3\n");
    writeData(data.filePath(QStringLiteral("wrong.csv")), "Number,Northing,Easting\n1,abc,3\n2,4\n");
    makeDatabase(data.filePath(QStringLiteral("points.sqlite")));
}

void importData(World &world, Chance &chance)
{
    const QDir data = dataOf(world);
    kareport::TemplateDialog dialog(&world.frame());
    dialog.setTemplateFile(data.filePath(QStringLiteral("points.xml")));
    QString name = dataNames().at(chance.below(dataNames().size()));
    dialog.setData(data.filePath(name));
    dialog.show();
    auto *panel = dialog.findChild<kareport::ImportPanel *>();
    for (int step = 1 + chance.below(8); step > 0; --step) {
        if (chance.oneIn(9)) {
            name = dataNames().at(chance.below(dataNames().size()));
            dialog.setData(data.filePath(name));
        } else {
            useControl(*panel, chance);
        }
        QCoreApplication::processEvents();
    }
    const auto *ok = dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
    const bool fits = dialog.findChild<QLabel *>(QStringLiteral("message"))->text().isEmpty();
    if (!ok->isEnabled()) {
        return;
    }
    const kareport::TemplateJob job = dialog.job();
    const QString choices = QString::fromUtf8(QJsonDocument(job.dataOptions).toJson(QJsonDocument::Compact));
    world.did = name + u' ' + choices;
    dialog.accept();
    const std::size_t asked = world.answers().count();
    const bool isMade = world.frame().OpenTemplateJob(job);
    if (fits && !isMade && world.answers().count() > asked && fileLimit() < 0) {
        world.fail(QStringLiteral("data that fits, %1 with %2, gives no report: ").arg(name, choices) +
                   world.answers().last());
    }
}

void changeData(World &world, Chance &chance)
{
    QByteArray rows = "Number,Northing,Easting,Height\n";
    for (int row = chance.below(60); row > 0; --row) {
        rows += QByteArray::number(row) + (chance.oneIn(40) ? ",abc" : ",2.5") + ",123456789012345.25,1\n";
    }
    world.did = QString::number(rows.count('\n')) + QStringLiteral(" lines");
    const qint64 limit = fileLimit();
    limitFiles(-1);
    writeData(dataOf(world).filePath(QStringLiteral("points.csv")), rows);
    limitFiles(limit);
    constexpr int seenAfter = 1300; // milliseconds
    world.wait(seenAfter);
}

} // namespace monkey
