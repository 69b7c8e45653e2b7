#include "StartPage.h"

#include "PlainWidgets.h"
#include "ProgramIcon.h"
#include "Readable.h"
#include "ShippedExamples.h"
#include "UApplication.h"
#include "Xlate.h"

#include <QAction>
#include <QDateTime>
#include <QDir>
#include <QEvent>
#include <QFileInfo>
#include <QGridLayout>
#include <QLabel>
#include <QLocale>
#include <QPainter>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

constexpr int margin = 24;
constexpr int gap = 24;

/// The program's icon, drawn at the resolution of the screen.
class Picture : public QWidget
{
public:
    explicit Picture(QWidget *parent) : QWidget(parent)
    {
        constexpr int side = 48;
        setFixedSize(side, side);
    }

protected:
    void paintEvent(QPaintEvent * /*event*/) override
    {
        QPainter painter(this);
        drawProgramIcon(painter, rect());
    }
};

/// Where a file is, with the user's own folder as a tilde.
QString placeOf(const QFileInfo &file)
{
    const QString folder = file.absolutePath();
    const QString home = QDir::homePath();
    const bool isBelow = folder == home || folder.startsWith(home + u'/');
    return QDir::toNativeSeparators(isBelow ? u'~' + folder.mid(home.size()) : folder);
}

Entry entryOf(const QString &path)
{
    const QFileInfo file(path);
    if (!file.exists()) {
        return {path, file.fileName(), Xlate("%1 — not there").arg(placeOf(file)), QIcon(), true};
    }
    const QString time = QLocale::system().toString(file.lastModified(), QLocale::ShortFormat);
    return {path, file.fileName(), placeOf(file) + QStringLiteral(" — ") + time};
}

QLabel *caption(const QString &text, QWidget *parent)
{
    QLabel *label = plainLabel(text, parent);
    makeCaption(*label);
    return label;
}

} // namespace

StartPage::StartPage(QWidget *parent)
    : QWidget(parent),
      picture_(new Picture(this)),
      commands_(new EntryList(Xlate("Start"), this)),
      recent_(new EntryList(Xlate("Recent files"), this)),
      examples_(new EntryList(Xlate("Examples"), this)),
      noRecent_(plainLabel(Xlate("Files that you open are listed here."), this))
{
    setAccessibleName(Xlate("Start page"));
    // One paper for the page and its lists.
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::Base);
    setForegroundRole(QPalette::Text);
    makeQuiet(*noRecent_, QPalette::Base);
    static_cast<QLabel *>(noRecent_)->setWordWrap(true);
    noRecent_->setContentsMargins(6, 3, 6, 3); // as the entries of a list

    auto *grid = new QGridLayout(this);
    grid->setContentsMargins(margin, margin, margin, margin);
    grid->setHorizontalSpacing(gap);
    grid->setVerticalSpacing(6);
    grid->addLayout(makeHead(), 0, 0, 1, 3);
    grid->setRowMinimumHeight(1, 12);
    addLists(*grid);
    grid->setRowStretch(4, 1);
    connectLists();
}

/// The program's name and what to do, next to its icon.
QLayout *StartPage::makeHead()
{
    QLabel *name = caption(QStringLiteral("KaReport"), this);
    constexpr qreal larger = 1.5;
    QFont large = name->font();
    large.setPointSizeF(large.pointSizeF() * larger);
    name->setFont(large);
    QLabel *what = plainLabel(Xlate("Open a job or a saved report, or drop a file here."), this);
    what->setWordWrap(true);
    makeQuiet(*what, QPalette::Base);
    auto *titles = new QVBoxLayout;
    titles->setSpacing(2);
    titles->addWidget(name);
    titles->addWidget(what);
    auto *head = new QHBoxLayout;
    head->setSpacing(12);
    head->addWidget(picture_);
    head->addLayout(titles, 1);
    return head;
}

void StartPage::addLists(QGridLayout &grid)
{
    const struct
    {
        QString caption;
        EntryList *list;
    } columns[] = {{Xlate("Start"), commands_}, {Xlate("Recent Files"), recent_}, {Xlate("Examples"), examples_}};
    int column = 0;
    for (const auto &[text, list] : columns) {
        QLabel *label = caption(text, this);
        label->setIndent(6); // as the entries of a list
        grid.addWidget(label, 2, column);
        grid.addWidget(list, 3, column, 2, 1);
        grid.setColumnStretch(column, column == 0 ? 2 : 3);
        ++column;
    }
    grid.addWidget(noRecent_, 3, 1);
}

void StartPage::connectLists()
{
    commands_->setNeighbours(nullptr, recent_);
    recent_->setNeighbours(commands_, examples_);
    examples_->setNeighbours(recent_, nullptr);
    commands_->chosen = [this](const QString &id) {
        const int number = id.toInt();
        if (number < actions_.size()) {
            actions_.at(number)->trigger();
        }
    };
    const auto open = [this](const QString &path) {
        if (openFile) {
            openFile(path);
        }
    };
    recent_->chosen = open;
    examples_->chosen = open;
}

void StartPage::setCommands(const QList<QAction *> &commands)
{
    actions_ = commands;
    std::vector<Entry> entries;
    for (qsizetype i = 0; i < commands.size(); ++i) {
        const QAction *action = commands.at(i);
        entries.push_back({QString::number(i), QString(action->text()).remove(u'&'),
                           action->shortcut().toString(QKeySequence::NativeText), action->icon()});
    }
    commands_->setEntries(entries);
}

void StartPage::refresh()
{
    std::vector<Entry> entries;
    const QStringList files = UApplication::Get() != nullptr ? UApplication::Get()->GetRecentFileList() : QStringList();
    for (const QString &path : files) {
        entries.push_back(entryOf(path));
    }
    recent_->setEntries(entries);
    noRecent_->setVisible(entries.empty());
    recent_->setVisible(!entries.empty());
    recent_->setNeighbours(commands_, examples_);
    commands_->setNeighbours(nullptr, entries.empty() ? examples_ : recent_);
    examples_->setNeighbours(entries.empty() ? commands_ : recent_, nullptr);
    if (examples_->count() == 0) {
        std::vector<Entry> examples;
        for (const ShippedExample &example : shippedExamples(examplesFolder())) {
            examples.push_back({example.path, example.title, QFileInfo(example.path).fileName()});
        }
        examples_->setEntries(examples);
    }
}

void StartPage::takeKeyboard()
{
    (recent_->count() > 0 ? recent_ : commands_)->takeKeyboard();
}

void StartPage::showEvent(QShowEvent *event)
{
    refresh();
    QWidget::showEvent(event);
}

void StartPage::changeEvent(QEvent *event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) {
        update();
    }
}

} // namespace kareport
