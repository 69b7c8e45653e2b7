#include "HelpWindow.h"

#include "GuidePages.h"
#include "LineIcon.h"
#include "PaneWindows.h"
#include "PathDrawing.h"
#include "PlainWidgets.h"
#include "Readable.h"
#include "ScreenFit.h"
#include "Xlate.h"

#include <QApplication>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPainter>
#include <QShortcut>
#include <QSplitter>
#include <QToolButton>
#include <QVBoxLayout>

namespace kareport
{

namespace
{

constexpr int pageRole = Qt::UserRole;

QIcon arrowIcon(bool back)
{
    const QPainterPath path = pathOf(back ? u"M13.5 8H2.5 M7 3.5L2.5 8L7 12.5" : u"M2.5 8H13.5 M9 3.5L13.5 8L9 12.5");
    return lineIcon([path](QPainter &painter, const QColor & /*accent*/) { painter.drawPath(path); });
}

QToolButton *newButton(const QIcon &icon, const QString &name, const QKeySequence &key)
{
    auto *button = new QToolButton;
    button->setIcon(icon);
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::TabFocus);
    button->setAccessibleName(name);
    button->setShortcut(key);
    button->setToolTip(name + QStringLiteral(" (") + key.toString(QKeySequence::NativeText) + u')');
    return button;
}

} // namespace

HelpWindow::HelpWindow(QWidget *parent)
    : QDialog(parent),
      browser_(new GuideBrowser),
      pages_(new QListWidget),
      field_(new QLineEdit),
      found_(plainLabel()),
      back_(newButton(arrowIcon(true), Xlate("Back"), QKeySequence(Qt::ALT | Qt::Key_Left))),
      forward_(newButton(arrowIcon(false), Xlate("Forward"), QKeySequence(Qt::ALT | Qt::Key_Right)))
{
    setWindowTitle(Xlate("Guide"));
    setWindowFlags(Qt::Window);
    setModal(false);
    field_->setPlaceholderText(Xlate("Find on this page"));
    field_->setAccessibleName(Xlate("Text to find"));
    field_->setClearButtonEnabled(true);
    field_->setMaximumWidth(fontMetrics().averageCharWidth() * 40);
    field_->installEventFilter(this);
    makeQuiet(*found_);
    found_->setAccessibleName(Xlate("Matches"));
    makePages();

    auto *bar = new QHBoxLayout;
    bar->addWidget(back_);
    bar->addWidget(forward_);
    bar->addStretch(1);
    bar->addWidget(found_);
    bar->addWidget(field_, 2);
    auto *parts = new QSplitter;
    parts->addWidget(pages_);
    parts->addWidget(browser_);
    parts->setStretchFactor(1, 1);
    parts->setChildrenCollapsible(false);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(6, 6, 6, 6);
    layout->addLayout(bar);
    layout->addWidget(parts, 1);

    connect(back_, &QToolButton::clicked, browser_, &QTextBrowser::backward);
    connect(forward_, &QToolButton::clicked, browser_, &QTextBrowser::forward);
    connect(browser_, &QTextBrowser::backwardAvailable, back_, &QWidget::setEnabled);
    connect(browser_, &QTextBrowser::forwardAvailable, forward_, &QWidget::setEnabled);
    connect(browser_, &QTextBrowser::sourceChanged, this, &HelpWindow::noteSource);
    connect(field_, &QLineEdit::textChanged, this, [this] {
        browser_->moveCursor(QTextCursor::Start);
        findNext();
    });
    const auto onKey = [this](const QKeySequence &key, auto act) {
        connect(new QShortcut(key, this), &QShortcut::activated, this, act);
    };
    onKey(QKeySequence(QKeySequence::Find), [this] {
        field_->setFocus(Qt::ShortcutFocusReason);
        field_->selectAll();
    });
    onKey(QKeySequence(Qt::Key_F3), [this] { findNext(); });
    onKey(QKeySequence(Qt::SHIFT | Qt::Key_F3), [this] { findNext(true); });
    back_->setEnabled(false);
    forward_->setEnabled(false);
    const QSize usual(fontMetrics().averageCharWidth() * 130, fontMetrics().lineSpacing() * 44);
    resize(fittingSize(*this, usual));
    browser_->setFocus();
}

void HelpWindow::makePages()
{
    pages_->setAccessibleName(Xlate("Pages of the guide"));
    int widest = 0;
    for (const GuidePage &page : guidePages()) {
        auto *item = new QListWidgetItem(page.title, pages_);
        item->setData(pageRole, page.name);
        widest = std::max(widest, pages_->fontMetrics().horizontalAdvance(page.title));
    }
    constexpr int room = 32;
    pages_->setMaximumWidth(widest * 2);
    pages_->setMinimumWidth(std::min(widest + room, fontMetrics().averageCharWidth() * 30));
    connect(pages_, &QListWidget::currentItemChanged, this, [this](const QListWidgetItem *item) {
        if (item != nullptr && browser_->source().fileName() != item->data(pageRole).toString()) {
            showPlace(item->data(pageRole).toString());
        }
    });
}

void HelpWindow::showPlace(const QString &place)
{
    const QString file = guideFile(place.section(u'#', 0, 0), guideLanguage());
    if (!file.isEmpty()) {
        QUrl url(QStringLiteral("qrc") + file);
        if (place.contains(u'#')) {
            url.setFragment(place.section(u'#', 1));
        }
        browser_->setSource(url, QTextDocument::MarkdownResource);
    }
}

void HelpWindow::noteSource(const QUrl &shown)
{
    for (int row = 0; row < pages_->count(); ++row) {
        if (pages_->item(row)->data(pageRole).toString() == shown.fileName()) {
            const QSignalBlocker quiet(pages_); // it shows what is shown already
            pages_->setCurrentRow(row);
            setWindowTitle(pages_->item(row)->text() + QStringLiteral(" — ") + Xlate("Guide"));
        }
    }
}

bool HelpWindow::findNext(bool backward)
{
    const QString text = field_->text();
    found_->clear();
    if (text.isEmpty()) {
        return false;
    }
    const auto flags = backward ? QTextDocument::FindBackward : QTextDocument::FindFlags();
    if (browser_->find(text, flags)) {
        return true;
    }
    browser_->moveCursor(backward ? QTextCursor::End : QTextCursor::Start); // on from the other end
    const bool isFound = browser_->find(text, flags);
    if (!isFound) {
        found_->setText(Xlate("Not on this page"));
    }
    return isFound;
}

bool HelpWindow::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == field_ && event->type() == QEvent::KeyPress) {
        const auto *key = static_cast<const QKeyEvent *>(event);
        if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
            findNext(key->modifiers().testFlag(Qt::ShiftModifier));
            return true;
        }
    }
    return QDialog::eventFilter(watched, event);
}

void showGuide(QWidget &window, const QString &place)
{
    HelpWindow *help = nullptr;
    for (QObject *child : window.children()) {
        if (auto *made = dynamic_cast<HelpWindow *>(child)) {
            help = made;
        }
    }
    if (help == nullptr) {
        help = new HelpWindow(&window);
    }
    help->showPlace(place);
    help->show();
    help->raise();
    help->activateWindow();
}

HelpKey::HelpKey(QWidget &frame) : QObject(&frame), frame_(frame)
{
    qApp->installEventFilter(this);
}

bool HelpKey::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() != QEvent::KeyPress || static_cast<QKeyEvent *>(event)->key() != Qt::Key_F1) {
        return false;
    }
    auto *widget = qobject_cast<QWidget *>(watched);
    if (widget == nullptr || holdsPanes(widget->window(), &frame_) ||
        dynamic_cast<HelpWindow *>(widget->window()) != nullptr)
    {
        return false; // the main window has a command for the key
    }
    showGuide(*widget->window(), guidePlaceFor(widget));
    return true;
}

} // namespace kareport
