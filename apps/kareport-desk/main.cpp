#include "DeskApplication.h"
#include "DeskDialogs.h"
#include "DeskFrame.h"
#include "Xlate.h"

#include <QApplication>
#include <QCommandLineParser>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QApplication::setApplicationName(QStringLiteral("KaReport"));
    QApplication::setApplicationVersion(QStringLiteral(KAREPORT_VERSION));
    QCommandLineParser parser;
    parser.setApplicationDescription(Xlate("Runs report jobs, and shows, edits and prints reports."));
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addPositionalArgument(QStringLiteral("FILE"), Xlate("Jobs (.json) and saved reports (.rep, .rtf) to open"),
                                 QStringLiteral("[FILE...]"));
    parser.process(application);

    DeskApplication desk;
    DeskFrame frame;
    kareport::installDialogs(&frame);
    frame.show();
    frame.OfferLeftReports();
    for (const QString &file : parser.positionalArguments()) {
        frame.OpenFile(file);
    }
    return QApplication::exec();
}
