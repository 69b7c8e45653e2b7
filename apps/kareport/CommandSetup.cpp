#include "CommandSetup.h"

#include "Display.h"
#include "NearestName.h"
#include "OutputKind.h"
#include "ProcessSetup.h"
#include "Signals.h"
#include "Xlate.h"

#include <QGuiApplication>

namespace kareport
{

std::optional<QString> wrongKindName(const QString &as)
{
    if (!as.isEmpty() && !outputKindFromName(as)) {
        return QStringLiteral("--as: ") + oneOfExpected(as, outputKindNames().split(QStringLiteral(", ")));
    }
    return std::nullopt;
}

std::optional<QString> wrongOutput(const QString &file, const QString &as)
{
    if (!outputKindOf(file, outputKindFromName(as))) {
        return Xlate("the ending of \"%1\" does not say the kind: --as with one of %2 was expected")
            .arg(file, outputKindNames());
    }
    return std::nullopt;
}

std::optional<QString> applySets(JsonSource &source, const QStringList &sets)
{
    for (const QString &set : sets) {
        const qsizetype equals = set.indexOf(u'=');
        if (equals < 1) {
            return Xlate("--set \"%1\": KEY=VALUE was expected").arg(set);
        }
        if (const auto wrong = source.set(set.left(equals), set.mid(equals + 1))) {
            return *wrong;
        }
    }
    return std::nullopt;
}

ExitStatus usageExit(const QString &text)
{
    printError(QStringLiteral("kareport: ") + text);
    return exitUsage;
}

std::unique_ptr<QCoreApplication> startQt(int &argc, char **argv, bool withFonts)
{
    if (QCoreApplication::instance() != nullptr) {
        return nullptr;
    }
    // What Qt reports about its surroundings (no session, no screen) does not matter to a person who renders a report.
    qInstallMessageHandler([](QtMsgType type, const QMessageLogContext &, const QString &text) {
        if (type == QtCriticalMsg || type == QtFatalMsg) {
            printError(QStringLiteral("kareport: ") + text);
        }
    });
    catchInterrupts();
    if (!withFonts) {
        return std::make_unique<QCoreApplication>(argc, argv);
    }
    // Fonts need an application with a platform, but no screen.
    qputenv("QT_QPA_PLATFORM", platformWithoutWindows());
    auto application = std::make_unique<QGuiApplication>(argc, argv);
    addShippedFaces();
    return application;
}

} // namespace kareport
