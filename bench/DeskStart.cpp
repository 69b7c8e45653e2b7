// The desktop program up to its first painted window: timed as a whole process.
#include "BenchProfile.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "DeskPreferences.h"
#include "Language.h"

#include <QApplication>
#include <QPaintEvent>

namespace
{

/// Ends the program once a window has been painted.
class FirstPaint : public QObject
{
public:
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        if (event->type() == QEvent::Paint && watched->isWidgetType()) {
            QMetaObject::invokeMethod(qApp, &QCoreApplication::quit, Qt::QueuedConnection);
        }
        return false;
    }
};

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QApplication::setApplicationName(QStringLiteral("KaReport"));
    kareport::useBenchProfile();
    kareport::setLanguage(kareport::loadPreferences().language);
    FirstPaint firstPaint;
    application.installEventFilter(&firstPaint);
    DeskApplication desk;
    DeskFrame frame;
    kareport::installDialogs(&frame);
    frame.show();
    return QApplication::exec();
}
