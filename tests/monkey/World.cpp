#include "World.h"

#include "Actions.h"
#include "COneViewPane.h"
#include "DeskActions.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "JobLauncher.h"
#include "ReportEdit.h"
#include "ReportEntry.h"
#include "ReportPages.h"
#include "ReportTextDecoder.h"
#include "UReportDoc.h"
#include "UReportView.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTabBar>
#include <QTest>
#include <QTimer>

#include <algorithm>

namespace monkey
{

namespace
{

const QString expectedName = QStringLiteral("expected.json");

void putFile(const QString &path, const QByteArray &content)
{
    QFile file(path);
    if (file.open(QIODevice::WriteOnly)) {
        file.write(content);
    }
}

/// Lets all follow that follows at once. One thing brings another, and each may wait for a turn of its own.
void settle()
{
    constexpr int turns = 3;
    for (int turn = 0; turn < turns; ++turn) {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QCoreApplication::processEvents();
    }
}

} // namespace

/// The desk's application, which also tells what a report held when it was closed.
class World::Application : public DeskApplication
{
public:
    explicit Application(World &world) : world_(world) {}

    void OnDocumentEvent(UDocument &document, UDocument::DocumentEvent event) override
    {
        const auto *report = dynamic_cast<UReportDoc *>(&document);
        if (report != nullptr && event == UDocument::DocumentEvent::AfterCloseDocument) {
            world_.closed_.push_back({report, world_.idOf(*report), textOf(*report), report->IsModified(),
                                      report->GetPathName(), report->GetTitle()});
            world_.ids_.remove(report);
        }
        DeskApplication::OnDocumentEvent(document, event);
    }

private:
    World &world_;
};

World::World(const QString &folder) : folder_(folder)
{
    folder_.mkpath(QStringLiteral("files"));
    folder_.mkpath(QStringLiteral("editors"));
    folder_.mkpath(QStringLiteral("bin"));
    makeFiles();
    makePoints(*this);
    answers_.file = [this](Chance &chance, bool saves) {
        return saves ? newPath(chance) : files().filePath([&] {
            const QStringList names = files().entryList(QDir::Files);
            return names.isEmpty() ? QStringLiteral("none.rep") : names.at(chance.below(names.size()));
        }());
    };
    restart();
}

World::~World()
{
    frame_.reset();
    application_.reset();
}

void World::makeFiles() const
{
    if (!files().isEmpty()) {
        return; // it goes on after a crash
    }
    const QByteArray page = R"("page": {"linesPerPage": 20, "charsPerRow": 60})";
    QByteArray lines;
    for (int line = 1; line <= 50; ++line) {
        lines += (line > 1 ? ", " : "") + QByteArray(R"({"line": "Point )") + QByteArray::number(line) + R"("})";
    }
    const QDir dir = files();
    putFile(dir.filePath(QStringLiteral("long.json")),
            R"({"title": "Long", )" + page + R"(, "report": [{"heading": "Number\nof a point", "after": 1}, )" + lines +
                "]}");
    putFile(dir.filePath(QStringLiteral("short.json")),
            R"({"title": "Short", "header": false, )" + page + R"(, "report": [{"line": "Only line"}]})");
    putFile(dir.filePath(QStringLiteral("same.json")),
            R"({"title": "Short", "report": [{"line": "Another of this name"}, {"lineFeed": 100}, {"line": "far"}]})");
    putFile(dir.filePath(QStringLiteral("empty.json")), R"({"title": "Nothing", "header": false, "report": []})");
    putFile(dir.filePath(QStringLiteral("wrong.json")), R"({"title": "Wrong", "report": [{"lines": 1}]})");
    putFile(dir.filePath(QStringLiteral("points.json")),
            R"({"title": "Points", )" + page + R"(, "template": {"file": "../data/points.xml", "name": "P"},
                "data": {"p": {"csv": "../data/points.csv"}}, "report": [{"table": "All", "data": "p"}]})");
    putFile(dir.filePath(QStringLiteral("dropped.csv")), "Number,Northing,Easting\n1,2.5,3\n");
    putFile(dir.filePath(QStringLiteral("saved.rep")),
            "\xEF\xBB\xBFTALVEN Survey - Saved          Mar 05, 2024  02:07PM    Page:  1\r\r\n\r\r\nA line\r\r\n");
    putFile(dir.filePath(QStringLiteral("plain.txt")), "a text\nof two lines, and \xC3\xA9 \xE6\xB8\xAC\n");
    putFile(dir.filePath(QStringLiteral("rich.rtf")), R"({\rtf1\ansi Rich {\b bold} text\par of two lines\par})");
    for (const char *name : {"editor", "winword"}) {
        const QString path = folder_.filePath(QStringLiteral("bin/") + QLatin1String(name));
        putFile(path,
                "#!/bin/sh\n: > '" + folder_.filePath(QStringLiteral("editors")).toUtf8() + "'/$$\nexec sleep 300\n");
        QFile::setPermissions(path, QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner);
    }
}

void World::restart()
{
    frame_.reset();
    application_.reset();
    settle();
    ids_.clear();
    saved_.clear();
    before_.clear();
    application_ = std::make_unique<Application>(*this);
    frame_ = std::make_unique<DeskFrame>();
    kareport::installDialogs(frame_.get());
    frame_->resize(900, 700);
    frame_->show();
    frame_->activateWindow();
    settle();
}

std::vector<UReportDoc *> World::reports()
{
    std::vector<UReportDoc *> found;
    for (UDocument *document : GetReportTemplate()->GetDocuments()) {
        if (auto *report = dynamic_cast<UReportDoc *>(document)) {
            found.push_back(report);
        }
    }
    return found;
}

QString World::textOf(const UReportDoc &report)
{
    return report.CopyText();
}

qsizetype World::pagesOf(const UReportDoc &report)
{
    return static_cast<qsizetype>(report.GetPages().size());
}

std::vector<UReportView *> World::viewsOnScreen()
{
    std::vector<UReportView *> views;
    for (const UReportDoc *report : reports()) {
        for (UView *view : report->GetViews()) {
            auto *shown = dynamic_cast<UReportView *>(view);
            if (shown != nullptr && shown->IsVisible() && shown->GetWidget() != nullptr &&
                !shown->GetWidget()->visibleRegion().isEmpty())
            {
                views.push_back(shown);
            }
        }
    }
    return views;
}

UReportView *World::viewWithKeyboard()
{
    const QWidget *focus = QApplication::focusWidget();
    for (UReportView *view : viewsOnScreen()) {
        if (focus != nullptr && (view->GetWidget() == focus || view->GetWidget()->isAncestorOf(focus))) {
            return view;
        }
    }
    return nullptr;
}

quint64 World::idOf(const UReportDoc &report)
{
    quint64 &id = ids_[&report];
    if (id == 0) {
        id = ++lastId_;
    }
    return id;
}

std::vector<Seen> World::look()
{
    std::vector<Seen> all;
    for (const UReportDoc *report : reports()) {
        all.push_back(
            {report, idOf(*report), textOf(*report), report->IsModified(), report->GetPathName(), report->GetTitle()});
    }
    return all;
}

QHash<QString, Stamp> World::lookAtFiles() const
{
    QHash<QString, Stamp> stamps;
    for (const QFileInfo &info : files().entryInfoList(QDir::Files)) {
        stamps.insert(info.filePath(), {info.lastModified(), info.size()});
    }
    return stamps;
}

void World::note()
{
    before_ = look();
    closed_.clear();
    filesBefore_ = lookAtFiles();
    answers_.take();
    mayChange.clear();
    did.clear();
    wrong_.clear();
}

void World::run(const Step &step)
{
    Chance chance(step.seed);
    answers_.begin(Chance(step.seed ^ 0x5EED));
    const Action *action = actionOf(step.action.toLatin1().constData());
    mayBeInTabs_ = step.action == u"key" || qobject_cast<QTabBar *>(QApplication::focusWidget()) != nullptr;
    if (action != nullptr) {
        action->run(*this, chance);
    }
    settle();
    if (QApplication::activeWindow() == nullptr && frame_->isVisible()) {
        frame_->activateWindow(); // as a window manager does when the active window goes
    }
    settle();
    given_ = answers_.take();
    // A file that is saved in the same millisecond as the one before would look as it did.
    if (++steps_ % 50 == 0) {
        wait(20);
    }
}

void World::fail(const QString &what)
{
    wrong_ = wrong_.isEmpty() ? what : wrong_;
}

void World::wait(int milliseconds)
{
    QElapsedTimer time;
    time.start();
    while (time.elapsed() < milliseconds) {
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents | QEventLoop::AllEvents);
    }
    settle();
}

QString World::newPath(Chance &chance) const
{
    static const QStringList names = {QStringLiteral("a.rep"),     QStringLiteral("b.rep"),
                                      QStringLiteral("c"),         QStringLiteral("d.rtf"),
                                      QStringLiteral("e.pdf"),     QStringLiteral("f.txt"),
                                      QStringLiteral("saved.rep"), QStringLiteral("no folder/x.rep")};
    return files().filePath(names.at(chance.below(names.size())));
}

void World::keep()
{
    for (QTimer *timer : frame_->findChildren<QTimer *>()) {
        constexpr int keepInterval = 5000;
        if (timer->interval() == keepInterval) {
            QTimerEvent due(timer->timerId());
            QCoreApplication::sendEvent(timer, &due);
        }
    }
}

void World::crash()
{
    limitFiles(-1); // what cannot be kept cannot come back
    keep();
    QJsonArray expected;
    for (const UReportDoc *report : reports()) {
        const bool hasFormats = std::any_of(report->GetViews().begin(), report->GetViews().end(), [](UView *view) {
            const auto *shown = dynamic_cast<UReportView *>(view);
            return shown != nullptr && shown->ShowsFormats();
        });
        if (report->IsModified() && !hasFormats && !report->GetText().startsWith(u"{\\rtf")) {
            expected.append(QJsonObject{{QStringLiteral("title"), report->GetTitle()},
                                        {QStringLiteral("path"), report->GetPathName()},
                                        {QStringLiteral("pages"), static_cast<int>(pagesOf(*report))},
                                        {QStringLiteral("text"), textOf(*report)}});
        }
    }
    putFile(folder_.filePath(expectedName), QJsonDocument(expected).toJson());
    dieAtOnce();
}

QString World::checkRecovered()
{
    QFile file(folder_.filePath(expectedName));
    if (!file.open(QIODevice::ReadOnly)) {
        return {};
    }
    const QJsonArray expected = QJsonDocument::fromJson(file.readAll()).array();
    file.remove();
    answers_.agrees = true;
    frame_->OfferLeftReports();
    settle();
    answers_.agrees = false;
    QStringList texts;
    for (const UReportDoc *report : reports()) {
        texts.append(textOf(*report) + u'\0' + QString::number(pagesOf(*report)));
    }
    for (const QJsonValue &entry : expected) {
        const QString text =
            entry[QStringLiteral("text")].toString() + u'\0' + QString::number(entry[QStringLiteral("pages")].toInt());
        if (!texts.removeOne(text)) {
            return QStringLiteral("after a crash the report \"%1\" did not come back as it was (%2 pages)")
                .arg(entry[QStringLiteral("title")].toString())
                .arg(entry[QStringLiteral("pages")].toInt());
        }
    }
    return {};
}

} // namespace monkey
