#include "benchmeter.h"

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QTextStream>

#include <valgrind/callgrind.h>

namespace Bench {

Meter::Meter()
    : m_instructions(RUNNING_ON_VALGRIND)
{ }

QString Meter::unit() const
{
    return m_instructions ? QStringLiteral("Ir") : QStringLiteral("ns");
}

double Meter::measure(const QString &label, int repetitions, const std::function<void()> &work)
{
    repetitions = qMax(1, repetitions);
    if (m_instructions) {
        const QByteArray name = label.toUtf8();
        CALLGRIND_ZERO_STATS;
        for (int i = 0; i < repetitions; ++i)
            work();
        CALLGRIND_DUMP_STATS_AT(name.constData());
        return readDump(label) / repetitions;
    }
    QElapsedTimer timer;
    timer.start();
    for (int i = 0; i < repetitions; ++i)
        work();
    return double(timer.nsecsElapsed()) / repetitions;
}

// Callgrind writes each dump to the working directory as callgrind.out.<pid>.<n> (or to the
// name given with --callgrind-out-file, followed by .<n>): the newest dump of this process that
// carries the label holds the count.
double Meter::readDump(const QString &label) const
{
    const QString pid = QString::number(QCoreApplication::applicationPid());
    const QString trigger = QStringLiteral("desc: Trigger: Client Request: ") + label;
    QDir dir(QDir::currentPath());
    const QFileInfoList dumps = dir.entryInfoList(QDir::Files, QDir::Time);
    for (const QFileInfo &info : dumps) {
        if (!info.fileName().contains(pid))
            continue;
        QFile file(info.filePath());
        if (!file.open(QIODevice::ReadOnly | QIODevice::Text))
            continue;
        QTextStream in(&file);
        bool ours = false;
        QString line;
        while (in.readLineInto(&line)) {
            if (line == trigger)
                ours = true;
            else if (line.startsWith(QLatin1String("fn=")))
                break;
            else if (ours && (line.startsWith(QLatin1String("summary:"))))
                return line.section(QLatin1Char(' '), 1, 1).toDouble();
        }
        if (ours) {
            // The summary may follow the cost lines.
            while (in.readLineInto(&line)) {
                if (line.startsWith(QLatin1String("summary:"))
                    || line.startsWith(QLatin1String("totals:")))
                    return line.section(QLatin1Char(' '), 1, 1).toDouble();
            }
        }
    }
    return -1;
}

} // namespace Bench
