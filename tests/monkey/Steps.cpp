#include "Steps.h"

#include "Actions.h"

#include <QFile>
#include <QTextStream>

#include <algorithm>

namespace monkey
{

Steps makeSteps(quint64 seed, int count, bool faults)
{
    std::vector<const Action *> bag;
    for (const Action &action : allActions()) {
        if (faults || !action.isFault) {
            bag.insert(bag.end(), static_cast<std::size_t>(action.weight), &action);
        }
    }
    std::mt19937_64 engine(seed);
    Steps steps;
    std::generate_n(std::back_inserter(steps), count, [&bag, &engine] {
        const Action *action = bag[engine() % bag.size()];
        return Step{QLatin1String(action->name), engine()};
    });
    return steps;
}

bool writeSteps(const QString &file, const Steps &steps)
{
    QFile out(file);
    if (!out.open(QIODevice::WriteOnly | QIODevice::Text)) {
        return false;
    }
    for (const Step &step : steps) {
        out.write(QStringLiteral("%1 %2\n").arg(step.action).arg(step.seed).toUtf8());
    }
    return out.flush();
}

Steps readSteps(const QString &file)
{
    Steps steps;
    QFile in(file);
    if (in.open(QIODevice::ReadOnly | QIODevice::Text)) {
        QTextStream lines(&in);
        for (QString line = lines.readLine(); !line.isNull(); line = lines.readLine()) {
            if (const QStringList words = line.split(u' ', Qt::SkipEmptyParts); words.size() >= 2) {
                steps.push_back({words[0], words[1].toULongLong()});
            }
        }
    }
    return steps;
}

} // namespace monkey
