#include "NotesPane.h"

#include "PlainWidgets.h"
#include "Xlate.h"

#include <QApplication>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QPushButton>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

enum Column
{
    KindColumn,
    TextColumn,
    LineColumn,
    PlaceColumn,
    ColumnCount
};

constexpr int numberRole = Qt::UserRole;   ///< of the note; −1 for the problem
constexpr int lineRole = Qt::UserRole + 1; ///< whether it has a line of the report
constexpr int fileRole = Qt::UserRole + 2; ///< whether it has a place in a file

/// The place of a note as a short text: in the data where the value is there, else that of what the note is about.
QString placeText(const JobNote &note)
{
    const bool isInData = note.dataPlace.has_value();
    const auto place = isInData ? note.dataPlace : note.about.place;
    QString text = QFileInfo(isInData ? note.dataFile : note.about.file).fileName();
    if (place && !text.isEmpty()) {
        text += QStringLiteral(":%1:%2").arg(place->line).arg(place->column);
    }
    return text;
}

} // namespace

QString noteKindText(JobNote::Kind kind)
{
    switch (kind) {
    case JobNote::Kind::UnknownColumn: return Xlate("Unknown column");
    case JobNote::Kind::UnfilledField: return Xlate("Field without data");
    case JobNote::Kind::WideValue: return Xlate("Value too wide");
    case JobNote::Kind::MissingValue:
    case JobNote::Kind::BlankValue: return Xlate("Missing value");
    case JobNote::Kind::NotFinite: return Xlate("No finite number");
    case JobNote::Kind::UnknownSortKey: return Xlate("Unknown sort key");
    case JobNote::Kind::NotInTotal: return Xlate("Not in a total");
    case JobNote::Kind::UnshownCharacter: return Xlate("Character not shown");
    case JobNote::Kind::Difference: return Xlate("Difference in the data");
    case JobNote::Kind::PassedOver: return Xlate("Not read");
    case JobNote::Kind::AssumedUnit: return Xlate("Assumed unit");
    }
    return QString();
}

NotesPane::NotesPane(QWidget *parent)
    : QDockWidget(Xlate("Notes"), parent),
      list_(new QTreeWidget),
      line_(new QPushButton(Xlate("Show &Line"))),
      file_(new QPushButton(Xlate("Show Pla&ce in File")))
{
    setObjectName(QStringLiteral("notes"));
    list_->setAccessibleName(Xlate("Notes"));
    list_->setColumnCount(ColumnCount);
    QStringList titles;
    titles.append(Xlate("Kind"));
    titles.append(Xlate("Text"));
    titles.append(Xlate("Line@@of a report"));
    titles.append(Xlate("Place"));
    list_->setHeaderLabels(titles);
    list_->setRootIsDecorated(false);
    list_->setUniformRowHeights(true);
    list_->setAllColumnsShowFocus(true);
    list_->setTextElideMode(Qt::ElideMiddle);
    list_->header()->setStretchLastSection(false);
    list_->header()->setSectionResizeMode(TextColumn, QHeaderView::Stretch);

    auto *body = new QWidget;
    auto *layout = new QVBoxLayout(body);
    layout->setContentsMargins(6, 6, 6, 6);
    layout->addWidget(list_, 1);
    auto *buttons = new QHBoxLayout;
    buttons->addStretch();
    buttons->addWidget(line_);
    buttons->addWidget(file_);
    layout->addLayout(buttons);
    setWidget(body);

    connect(list_, &QTreeWidget::itemActivated, this,
            [this](const QTreeWidgetItem *item) { goTo(!item->data(KindColumn, lineRole).toBool()); });
    connect(list_, &QTreeWidget::itemClicked, this,
            [this](const QTreeWidgetItem *item) { goTo(!item->data(KindColumn, lineRole).toBool()); });
    connect(list_, &QTreeWidget::currentItemChanged, this, [this] { enableButtons(); });
    connect(line_, &QPushButton::clicked, this, [this] { goTo(false); });
    connect(file_, &QPushButton::clicked, this, [this] { goTo(true); });
    enableButtons();
}

void NotesPane::showNotes(const std::vector<JobNote> &notes, const QString &problem)
{
    list_->clear();
    const auto add = [this](int number, const QString &kind, const QString &text) {
        auto *item = new QTreeWidgetItem(list_);
        item->setText(KindColumn, kind);
        item->setText(TextColumn, text);
        item->setToolTip(TextColumn, plainToolTip(text));
        item->setData(KindColumn, numberRole, number);
        return item;
    };
    if (!problem.isEmpty()) {
        add(-1, Xlate("Not made again"), problem);
    }
    int number = 0;
    for (const JobNote &note : notes) {
        QTreeWidgetItem *item = add(number++, noteKindText(note.kind), note.about.text);
        if (note.line > 0) {
            item->setText(LineColumn, QString::number(note.line));
            item->setTextAlignment(LineColumn, Qt::AlignRight | Qt::AlignVCenter);
        }
        item->setText(PlaceColumn, placeText(note));
        item->setToolTip(PlaceColumn, plainToolTip(note.dataPlace ? note.dataFile : note.about.file));
        item->setData(KindColumn, lineRole, note.line > 0);
        item->setData(KindColumn, fileRole, !item->text(PlaceColumn).isEmpty());
    }
    for (const int column : {int(KindColumn), int(LineColumn), int(PlaceColumn)}) {
        list_->resizeColumnToContents(column);
    }
    enableButtons();
}

int NotesPane::count() const
{
    return list_->topLevelItemCount();
}

void NotesPane::open()
{
    show();
    raise();
    if (list_->currentItem() == nullptr && list_->topLevelItemCount() > 0) {
        list_->setCurrentItem(list_->topLevelItem(0));
    }
    list_->setFocus(Qt::OtherFocusReason);
}

void NotesPane::setVisible(bool visible)
{
    // Qt would give the keyboard to whatever comes next, as a row of tabs.
    const QWidget *focus = QApplication::focusWidget();
    const bool hadKeyboard = !visible && focus != nullptr && isAncestorOf(focus);
    QDockWidget::setVisible(visible);
    if (hadKeyboard && leave_) {
        leave_();
    }
}

void NotesPane::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Escape && leave_) {
        leave_();
        return;
    }
    QDockWidget::keyPressEvent(event);
}

void NotesPane::goTo(bool isInFile)
{
    const QTreeWidgetItem *item = list_->currentItem();
    if (item != nullptr && go_) {
        go_(item->data(KindColumn, numberRole).toInt(), isInFile);
    }
}

void NotesPane::enableButtons()
{
    const QTreeWidgetItem *item = list_->currentItem();
    line_->setEnabled(item != nullptr && item->data(KindColumn, lineRole).toBool());
    file_->setEnabled(item != nullptr && item->data(KindColumn, fileRole).toBool());
}

} // namespace kareport
