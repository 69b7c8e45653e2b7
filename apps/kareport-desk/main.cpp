#include "DeskApplication.h"
#include "DeskFrame.h"
#include "DeskPreferences.h"
#include "Language.h"
#include "ProcessSetup.h"
#include "ProgramIcon.h"
#include "Readable.h"
#include "Xlate.h"

#include <QApplication>
#include <QCommandLineParser>

int main(int argc, char **argv)
{
    kareport::prepareProcess();
    QApplication application(argc, argv);
    kareport::addShippedFaces();
    QApplication::setApplicationName(QStringLiteral("KaReport"));
    QApplication::setApplicationVersion(QStringLiteral(KAREPORT_VERSION));
    QApplication::setDesktopFileName(QStringLiteral("kareport-desk"));
    QApplication::setWindowIcon(kareport::programIcon());
    QApplication::setPalette(kareport::readablePalette(QApplication::palette()));
    kareport::setLanguage(kareport::loadPreferences().language);
    QCommandLineParser parser;
    parser.setApplicationDescription(Xlate("Runs report jobs, and shows, edits and prints reports."));
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addPositionalArgument(QStringLiteral("FILE"),
                                 Xlate("Jobs (.json), saved reports (.rep, .rtf) and templates (.xml) to open"),
                                 QStringLiteral("[FILE...]"));
    parser.process(application);

    DeskApplication desk;
    DeskFrame frame;
    kareport::installDialogs(&frame);
    frame.show();
    frame.OfferLeftReports();
    if (parser.positionalArguments().isEmpty() && kareport::loadPreferences().restoresSession) {
        frame.RestoreSession();
    }
    for (const QString &file : parser.positionalArguments()) {
        frame.OpenFile(file);
    }
    return QApplication::exec();
}
